#pragma once
/// "Configure Management Network": the management network's settings in
/// six entries, edited in dialogs that change only a pending copy, and
/// applied in one go when the operator leaves.
///
/// A full-screen menu (MenuWindow). Entries, in order: "Network Adapters"
/// (AdaptersDialog), "VLAN (optional)" (VlanDialog), "IPv4 Configuration"
/// (IPConfigurationDialog), "IPv6 Configuration" (IPv6ConfigurationDialog),
/// "DNS Configuration" (DNSConfigurationDialog), "Custom DNS Suffixes"
/// (SuffixesDialog). The right half describes the selected entry from the
/// pending settings (NetworkDescriptions.h). Footers: "<Up/Down> Select" on
/// the left, "<Enter> Change ... <Esc> Exit" on the right. Up and Down move
/// (over greyed entries), Enter opens the entry's dialog, Esc leaves; other
/// keys are ignored.
///
/// Entry (Run()): the settings are read once (ReadManagementSettings(),
/// host/ManagementSettings.h) into the entry copy and the pending copy.
/// Without a management interface: "Could not get a suitable management
/// interface" at error level, the message "Enable Management Network:
/// Error" / "Management network interface cannot be found.", result 0,
/// nothing else read or written. On a distributed switch the adapter and
/// VLAN entries are greyed.
///
/// Leaving (Esc): when nothing changed and the IPv6 flag is as read, the
/// window closes at once. Otherwise ApplyChangesDialog asks: Esc returns
/// to the menu with every edit kept; N closes and drops the edits; Y runs
/// ApplyNetworkChanges, logs "Network settings changed." and closes, after
/// the restart question when the IPv6 flag changed. The result is 1.
///
/// The restart question belongs to the shutdown screens, which sit above
/// this folder: the System Customization menu hands the window a callable
/// (RequiredRestart) that runs it.
///
/// Decisions of this implementation:
/// - A failed read of the settings (beyond a missing interface) ends the
///   entry like a missing interface: the failure is logged by the read, the
///   message "Enable Management Network: Error" says "Operation on the
///   management network interface failed." and to check the system log,
///   and the result is 0. The window never applies values it could not
///   read.
/// - The window counts as changed when the pending settings differ in
///   effect from those read on entry (SettingsDiffer(), NetworkChanges.h):
///   a dialog confirmed without an edit, or an edit undone by hand, asks
///   nothing on Esc.
/// - The restart question comes after "Network settings changed." is
///   logged and after the agent refresh, so that everything the apply did
///   is done and logged before a restart can start.
/// - After a dialog, the window redraws only its right half, and only when
///   the dialog was confirmed.

#include <functional>
#include <vector>

#include "host/ManagementSettings.h"
#include "host/PnicRow.h"
#include "toolkit/MenuWindow.h"

namespace Tulk {

/// Runs the host's restart confirmation in its mode for a required restart
/// above `owner`: it says that the host must restart before IPv6 is
/// enabled (`ipv6Enabled` true) or disabled, and lets the operator restart
/// now or later. Returns when the operator chose later (or the restart
/// could not be started).
using RequiredRestart = std::function<void(Frame* owner, bool ipv6Enabled)>;

class NetworkWindow : public MenuWindow {
 public:
  /// The window above `owner`; `requiredRestart` runs the restart question
  /// when the IPv6 flag changed (may be empty: then nothing is asked).
  NetworkWindow(Frame* owner, RequiredRestart requiredRestart);
  ~NetworkWindow() override;

  /// Entry, then the menu's key loop: 1 when left normally, 0 when it could
  /// not start.
  int Run() override;

 protected:
  bool Leave() override;

 private:
  bool Enter();
  void BuildEntries();
  MenuEntry Entry(std::uint32_t id, std::function<std::string()> describe,
                  std::function<bool()> open) const;
  void Confirmed();
  bool OpenAdapters();
  bool OpenVlan();
  bool OpenIpv4();
  bool OpenIpv6();
  bool OpenDns();
  bool OpenSuffixes();

  RequiredRestart requiredRestart_;
  ManagementSettings entry_;
  ManagementSettings pending_;
  std::vector<PnicRow> pnics_;
  bool changed_ = false;
};

}  // namespace Tulk
