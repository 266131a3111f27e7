#include "network/NetworkWindow.h"

#include <syslog.h>

#include "host/NetworkInventory.h"
#include "network/AdaptersDialog.h"
#include "network/ApplyChangesDialog.h"
#include "network/ApplyNetworkChanges.h"
#include "network/DNSConfigurationDialog.h"
#include "network/IPConfigurationDialog.h"
#include "network/IPv6ConfigurationDialog.h"
#include "network/NetworkChanges.h"
#include "network/NetworkDescriptions.h"
#include "network/SuffixesDialog.h"
#include "network/VlanDialog.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "toolkit/Footer.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

void ShowError(Frame* owner, const std::string& message) {
  MessageDialog error(owner, TextId::kEnableNetworkErrorTitle, message);
  RunFrame(&error);
}

}  // namespace

NetworkWindow::NetworkWindow(Frame* owner, RequiredRestart requiredRestart)
    : MenuWindow(owner), requiredRestart_(std::move(requiredRestart)) {
  SetMenuTitle(Text(TextId::kNetworkWindowTitle));
  SetMenuFooter(Footer::kMenuSelectSpaced);
  SetKeepSelection(true);
}

NetworkWindow::~NetworkWindow() = default;

int NetworkWindow::Run() {
  if (!Enter()) {
    return 0;
  }
  return MenuWindow::Run();
}

bool NetworkWindow::Enter() {
  changed_ = false;
  switch (ReadManagementSettings(entry_)) {
    case SettingsRead::kRead:
      break;
    case SettingsRead::kNoInterface:
      Log(LOG_ERR, "Could not get a suitable management interface");
      ShowError(this, Text(TextId::kNoManagementInterface));
      return false;
    case SettingsRead::kFailed:
      ShowError(this, std::string(Text(TextId::kManagementInterfaceFailed)) + "\n" +
                          Text(TextId::kCheckSyslog));
      return false;
  }
  pending_ = entry_;
  GetPhysicalNicList(pnics_, {});
  BuildEntries();
  return true;
}

MenuEntry NetworkWindow::Entry(std::uint32_t id, std::function<std::string()> describe,
                               std::function<bool()> open) const {
  MenuEntry entry;
  entry.id = id;
  entry.label = Text(id);
  entry.describe = std::move(describe);
  entry.footer = Footer::kMenuChangeExit;
  entry.action = std::move(open);
  return entry;
}

void NetworkWindow::BuildEntries() {
  std::vector<MenuEntry> entries;
  entries.push_back(Entry(
      TextId::kNetworkAdapters,
      [this] { return DescribeAdapters(pending_.adapters, pnics_, *Strings()); },
      [this] { return OpenAdapters(); }));
  entries.push_back(Entry(
      TextId::kVlanOptional, [this] { return DescribeVlan(pending_.vlanId, *Strings()); },
      [this] { return OpenVlan(); }));
  entries.push_back(Entry(
      TextId::kIpv4Configuration, [this] { return DescribeIpv4(pending_.ip, *Strings()); },
      [this] { return OpenIpv4(); }));
  entries.push_back(Entry(
      TextId::kIpv6Configuration,
      [this] {
        return DescribeIpv6(pending_.ipv6Enabled, entry_.ipv6Enabled, pending_.ip, *Strings());
      },
      [this] { return OpenIpv6(); }));
  entries.push_back(Entry(
      TextId::kDnsConfiguration, [this] { return DescribeDns(pending_, *Strings()); },
      [this] { return OpenDns(); }));
  entries.push_back(Entry(
      TextId::kCustomDnsSuffixes,
      [this] { return DescribeSuffixes(pending_.suffixes, *Strings()); },
      [this] { return OpenSuffixes(); }));
  const bool standard = !entry_.distributedSwitch;
  entries[0].enabled = standard;
  entries[1].enabled = standard;
  SetEntries(std::move(entries));
}

void NetworkWindow::Confirmed() {
  changed_ = SettingsDiffer(entry_, pending_);
  ShowDescription();
}

bool NetworkWindow::OpenAdapters() {
  AdaptersDialog dialog(this, pending_.adapters, pending_.switchName);
  if (RunFrame(&dialog) == 1) {
    pending_.adapters = dialog.Selected();
    Confirmed();
  }
  return false;
}

bool NetworkWindow::OpenVlan() {
  VlanDialog dialog(this, pending_.vlanId);
  if (RunFrame(&dialog) == 1) {
    pending_.vlanId = dialog.VlanId();
    Confirmed();
  }
  return false;
}

bool NetworkWindow::OpenIpv4() {
  IPConfigurationDialog dialog(this, pending_.ip);
  if (RunFrame(&dialog) == 1) {
    pending_.ip = dialog.Config();
    Confirmed();
  }
  return false;
}

bool NetworkWindow::OpenIpv6() {
  IPv6ConfigurationDialog dialog(this, pending_.ipv6Enabled, pending_.ip);
  if (RunFrame(&dialog) == 1) {
    pending_.ipv6Enabled = dialog.Ipv6Enabled();
    pending_.ip = dialog.Config();
    Confirmed();
  }
  return false;
}

bool NetworkWindow::OpenDns() {
  DNSConfigurationDialog dialog(this, pending_.ip.GetDnsFromDhcp(), pending_.primaryDns,
                                pending_.alternateDns, pending_.hostname);
  if (RunFrame(&dialog) == 1) {
    pending_.ip.SetDnsFromDhcp(dialog.Automatic());
    pending_.primaryDns = dialog.Primary();
    pending_.alternateDns = dialog.Alternate();
    pending_.hostname = dialog.Hostname();
    Confirmed();
  }
  return false;
}

bool NetworkWindow::OpenSuffixes() {
  SuffixesDialog dialog(this, pending_.suffixes);
  if (RunFrame(&dialog) == 1) {
    pending_.suffixes = dialog.Suffixes();
    Confirmed();
  }
  return false;
}

bool NetworkWindow::Leave() {
  const bool ipv6Changed = pending_.ipv6Enabled != entry_.ipv6Enabled;
  if (!changed_ && !ipv6Changed) {
    return true;
  }
  Answer answer;
  {
    ApplyChangesDialog question(this, ipv6Changed);
    answer = static_cast<Answer>(RunFrame(&question));
  }
  if (answer == Answer::kCancel) {
    return false;
  }
  if (answer == Answer::kNo) {
    return true;
  }
  ApplyNetworkChanges apply(entry_, pending_,
                            [this](const std::string& message) { ShowError(this, message); });
  apply.Run();
  Log(LOG_INFO, "Network settings changed.");
  if (apply.RestartRequired() && requiredRestart_) {
    requiredRestart_(this, pending_.ipv6Enabled);
  }
  return true;
}

}  // namespace Tulk
