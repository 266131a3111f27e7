#include "restore/NetworkRestoreWindow.h"

#include <string>
#include <utility>
#include <vector>

#include "host/ManagementNetwork.h"
#include "host/OpsAgent.h"
#include "render/TextId.h"
#include "restore/CreatePortGroupDialog.h"
#include "restore/CreateVssDialog.h"
#include "restore/MigrateHyknicDialog.h"
#include "restore/RestoreDVSDialog.h"
#include "restore/RestoreNetworkDialog.h"
#include "restore/SafeModeNetworkDialog.h"
#include "toolkit/Footer.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

struct RestoreEntry {
  std::uint32_t id;
  std::uint32_t description;
  const char* action;
};

constexpr RestoreEntry kEntries[] = {
    {TextId::kCreateStandardSwitch, TextId::kCreateStandardSwitchDescription, "Create"},
    {TextId::kCreatePortGroup, TextId::kCreatePortGroupDescription, "Create"},
    {TextId::kMigrateHyknic, TextId::kMigrateHyknicDescription, "Migrate"},
    {TextId::kRestoreNetworkSettings, TextId::kRestoreNetworkSettingsDescription, "Restart"},
    {TextId::kRestoreStandardSwitch, TextId::kRestoreStandardSwitchDescription, nullptr},
    {TextId::kRestoreDvs, TextId::kRestoreDvsDescription, nullptr},
};

template <typename DialogType>
int RunDialog(Frame* owner) {
  DialogType dialog(owner);
  return RunFrame(&dialog);
}

}  // namespace

NetworkRestoreWindow::NetworkRestoreWindow(Frame* owner) : MenuWindow(owner) {
  SetMenuTitle(Text(TextId::kNetworkRestoreTitle));
  SetKeepSelection(true);
  SetRefreshFooters(Footer::kMenuSelectSpaced, Footer::kMenuChangeExit);
  const bool overlayAgent = HasOpsAgentVersion3OrLater();
  const bool distributed = IsManagementOnDistributedSwitch();
  std::vector<MenuEntry> entries;
  for (const RestoreEntry& row : kEntries) {
    MenuEntry entry;
    entry.id = row.id;
    entry.label = Text(row.id);
    entry.title = Text(row.id);
    const std::uint32_t description = row.description;
    entry.describe = [this, description] { return std::string(Text(description)); };
    entry.footer = row.action != nullptr ? Footer::MenuRestoreAction(row.action)
                                         : std::string(Footer::kMenuRestoreExit);
    const std::uint32_t id = row.id;
    entry.action = [this, id] { return Open(id); };
    entries.push_back(std::move(entry));
  }
  SetEntries(std::move(entries));
  if (!overlayAgent) {
    SetEnabledById(TextId::kMigrateHyknic, false);
  }
  if (!distributed) {
    SetEnabledById(TextId::kRestoreStandardSwitch, false);
    SetEnabledById(TextId::kRestoreDvs, false);
  }
}

bool NetworkRestoreWindow::Open(std::uint32_t id) {
  switch (id) {
    case TextId::kCreateStandardSwitch:
      RunDialog<CreateVssDialog>(this);
      return true;
    case TextId::kCreatePortGroup:
      RunDialog<CreatePortGroupDialog>(this);
      return true;
    case TextId::kMigrateHyknic:
      RunDialog<MigrateHyknicDialog>(this);
      return true;
    case TextId::kRestoreNetworkSettings:
      RunDialog<RestoreNetworkDialog>(this);
      return true;
    case TextId::kRestoreStandardSwitch:
      if (RunDialog<SafeModeNetworkDialog>(this) == 1) {
        SetEnabledById(TextId::kRestoreStandardSwitch, false);
        SelectId(TextId::kRestoreDvs);
        DrawMenu();
        ShowDescription();
      }
      return false;
    case TextId::kRestoreDvs:
      RunRestoreDvs(this);
      return true;
    default:
      return false;
  }
}

}  // namespace Tulk
