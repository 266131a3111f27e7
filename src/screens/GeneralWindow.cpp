#include "screens/GeneralWindow.h"

#include <curses.h>

#include <utility>

#include "host/HostTools.h"
#include "host/ManagementNetwork.h"
#include "include/ProcessFlags.h"
#include "network/NetworkWindow.h"
#include "network/RestartNetworkDialog.h"
#include "network/TestDialog.h"
#include "render/TextId.h"
#include "restore/NetworkRestoreWindow.h"
#include "screens/ChangePasswordDialog.h"
#include "screens/KeyboardDialog.h"
#include "screens/LockdownDialog.h"
#include "screens/LogPager.h"
#include "screens/ManagementNetworkPane.h"
#include "screens/RestoreDialog.h"
#include "screens/ShutdownDialog.h"
#include "screens/SupportPages.h"
#include "toolkit/Footer.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"
#include "toolkit/TextArea.h"
#include "troubleshooting/TroubleShootingWindow.h"

namespace Tulk {
namespace {

constexpr char kLockdownQuery[] = "osksvc/auth/lockdown_is_enabled";
constexpr char kLogOut[] = "Log Out";

std::string EntryFooter(std::uint32_t id) {
  switch (id) {
    case kEntryPassword:
      return Footer::MenuAction("Change", kLogOut);
    case kEntryLockdown:
      return Footer::kMenuLockdown;
    case kEntryManagementNetwork:
    case kEntryNetworkRestore:
    case kEntryTroubleshooting:
    case kEntryKeyboard:
      return Footer::MenuAction("More", kLogOut);
    case kEntryRestartNetwork:
      return Footer::MenuAction("Restart", kLogOut);
    case kEntryTestNetwork:
      return Footer::MenuAction("Run Test", kLogOut);
    case kEntrySupportInformation:
      return Footer::kMenuSupportPages;
    case kEntryResetConfiguration:
      return Footer::MenuAction("Reset", kLogOut);
    default:
      return Footer::kMenuLogOut;
  }
}

// Frames opened from the menu live on the stack, so that the idle timeout
// unwinding through them deletes them too.
void ShowMessage(Frame* owner, std::uint32_t titleId, std::uint32_t textId) {
  MessageDialog message(owner, titleId, owner->Text(textId));
  RunFrame(&message);
}

template <typename DialogType, typename... Args>
int RunDialog(Frame* owner, Args&&... args) {
  DialogType dialog(owner, std::forward<Args>(args)...);
  return RunFrame(&dialog);
}

}  // namespace

GeneralWindow::GeneralWindow(Frame* owner) : MenuWindow(owner) {
  SetMenuTitle(Text(TextId::kSystemCustomization));
  ReadHostState();
  BuildEntries();
  supportPages_ = ReadSupportPages();
  supportPage_ = 0;
}

GeneralWindow::~GeneralWindow() = default;

void GeneralWindow::ReadHostState() {
  hostState_ = ReadMenuHostState();
  lockdownEnabled_ = OskCmdGetFlag(kLockdownQuery);
}

void GeneralWindow::BuildEntries() {
  std::vector<MenuEntry> entries;
  for (const MenuRow& row : BuildMenuRows(hostState_, localConsole)) {
    const std::uint32_t id = row.id;
    MenuEntry entry;
    entry.id = id;
    entry.label = Text(id);
    entry.enabled = row.enabled;
    entry.describe = [this, id] { return Describe(id); };
    entry.footer = EntryFooter(id);
    entry.action = [this, id] { return Open(id); };
    entries.push_back(std::move(entry));
  }
  SetEntries(std::move(entries));
}

std::string GeneralWindow::Describe(std::uint32_t id) {
  switch (id) {
    case kEntryPassword:
      return std::string("{color:white}") +
             Text(passwordWasEmpty ? TextId::kNotSet : TextId::kSet) + "{/color}\n\n" +
             Text(TextId::kPasswordDescription);
    case kEntryLockdown:
      return std::string("{color:white}") +
             Text(lockdownEnabled_ ? TextId::kEnabled : TextId::kDisabled) + "{/color}\n\n" +
             Text(TextId::kLockdownDescription);
    case kEntryManagementNetwork:
      return FormatManagementNetworkView(ReadManagementNetworkView(), *Strings(),
                                         Description().Width());
    case kEntryRestartNetwork:
      return Text(TextId::kRestartNetworkDescription);
    case kEntryTestNetwork:
      return Text(TextId::kTestNetworkDescription);
    case kEntryNetworkRestore:
      return Text(TextId::kNetworkRestoreDescription);
    case kEntrySupportInformation:
      return supportPage_ < supportPages_.size() ? supportPages_[supportPage_] : std::string();
    case kEntrySystemLogs: {
      const std::string list = logs_.Describe();
      return list.empty() ? std::string(Text(TextId::kLogsDescription))
                          : list + "\n" + Text(TextId::kLogsDescription);
    }
    case kEntryTroubleshooting:
      return Text(TextId::kTroubleshootingDescription);
    case kEntryResetConfiguration:
      return Text(TextId::kResetDescription);
    case kEntryKeyboard:
      return Text(TextId::kKeyboardDescription);
    default:
      return {};
  }
}

bool GeneralWindow::OnKey(int key) {
  const std::uint32_t id = SelectedId(kEntrySeparator);
  if (key == KEY_NPAGE || key == KEY_PPAGE) {
    if (id == kEntrySupportInformation) {
      TurnSupportPage(key == KEY_NPAGE);
    }
    return true;
  }
  if (key >= '0' && key <= '9') {
    if (id == kEntrySystemLogs) {
      OpenLog(key - '0');
    }
    return true;
  }
  return false;
}

void GeneralWindow::BeforeMove() {
  if (SelectedId(kEntrySeparator) == kEntrySupportInformation) {
    supportPage_ = 0;
  }
}

void GeneralWindow::TurnSupportPage(bool forward) {
  if (forward && supportPage_ + 1 < supportPages_.size()) {
    ++supportPage_;
  } else if (!forward && supportPage_ > 0) {
    --supportPage_;
  } else {
    return;
  }
  ShowDescription();
}

void GeneralWindow::OpenLog(int digit) {
  if (std::optional<std::size_t> row = logs_.RowForDigit(digit); row) {
    ShowLogInPager(this, logs_.Rows()[*row].path);
  }
}

bool GeneralWindow::Open(std::uint32_t id) {
  switch (id) {
    case kEntryPassword:
      RunDialog<ChangePasswordDialog>(this, currentUser);
      return true;
    case kEntryLockdown:
      if (RunDialog<LockdownDialog>(this) != 0) {
        lockdownEnabled_ = OskCmdGetFlag(kLockdownQuery);
      }
      return true;
    case kEntryManagementNetwork: {
      NetworkWindow network(this, [](Frame* owner, bool ipv6Enabled) {
        ShutdownDialog restart(
            owner, ipv6Enabled ? ShutdownReason::kIpv6Enabled : ShutdownReason::kIpv6Disabled);
        RunFrame(&restart);
      });
      RunFrame(&network);
      return true;
    }
    case kEntryRestartNetwork:
      if (!GetManagementInterface()) {
        ShowMessage(this, TextId::kRestartNetworkErrorTitle, TextId::kNoManagementInterface);
        return true;
      }
      RunDialog<RestartNetworkDialog>(this);
      return true;
    case kEntryTestNetwork:
      RunDialog<TestDialog>(this);
      return true;
    case kEntryNetworkRestore: {
      RunDialog<NetworkRestoreWindow>(this);
      // A restore may have replaced the management NIC the entries depend on.
      const std::uint32_t selected = SelectedId(kEntrySeparator);
      ReadHostState();
      BuildEntries();
      SelectId(selected);
      return true;
    }
    case kEntryResetConfiguration:
      if (RunDialog<RestoreDialog>(this) == 0) {
        ShowMessage(this, TextId::kResetErrorTitle, TextId::kResetFailed);
      }
      return true;
    case kEntryKeyboard:
      RunDialog<KeyboardDialog>(this);
      return true;
    case kEntryTroubleshooting:
      RunDialog<TroubleShootingWindow>(this);
      return true;
    default:
      return false;
  }
}

void GeneralWindow::ReloadHostInfo() {
  const std::uint32_t selected = SelectedId(kEntrySeparator);
  ReadHostState();
  BuildEntries();
  SelectId(selected);
  SetKeepSelection(true);
  Show();
  SetKeepSelection(false);
}

}  // namespace Tulk
