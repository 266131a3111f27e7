#pragma once
/// The System Customization menu: what a logged-in operator works in.
///
/// A full-screen menu (MenuWindow) whose left half lists the entries and
/// whose right half describes the selected entry. The welcome screen builds
/// it after a successful login, runs it with RunFrame and logs the user out
/// when it returns:
///
///   GeneralWindow menu(this);
///   RunFrame(&menu);  // 1: the operator left with Esc
///
/// Entries (label = catalogue text of the id; separator rows are never
/// enabled):
///
/// | Id | Label                          | Enabled when                           |
/// |----|--------------------------------|----------------------------------------|
/// | 5  | Configure Password             | always                                 |
/// | 6  | Configure Lockdown Mode        | lockdown enabled, or else possible     |
/// | 7  | Configure Management Network   | the management NIC exists and is up    |
/// | 8  | Restart Management Network     | the management NIC exists and is up    |
/// | 9  | Test Management Network        | the management NIC exists and is up    |
/// | 10 | Network Restore Options        | always                                 |
/// | 15 | Configure Keyboard             | always; only with `localConsole`       |
/// | 13 | Troubleshooting Options        | always                                 |
/// | 12 | View System Logs               | always                                 |
/// | 11 | View Support Information       | always                                 |
/// | 14 | Reset System Configuration     | the "PXEBootEnabled" option is absent  |
///
/// with separators after 6, 10, 13, 12 and 11 (MenuEntries.h).
///
/// The host state behind the enabling rules (lockdown through osk-cmd,
/// the management NIC, the network-boot option) and the support pages
/// ("/etc/brimlo/support", SupportPages.h) are read once, at construction.
/// While the menu is open only the lockdown state is read again, after the
/// lockdown dialog was confirmed; SIGUSR1 (ReloadHostInfo) reads all of
/// the host state again and rebuilds the entries.
///
/// Keys: Up/Down select; Page Up/Page Down turn the support pages while
/// "View Support Information" is selected (moving away starts them again
/// at the first page); the digits open a log in the pager while "View
/// System Logs" is selected (LogTable.h, LogPager.h); Enter opens the
/// entry's screen; Esc returns 1. Every other key is ignored.
///
/// Decisions of this implementation:
/// - The status word of entries 5 and 6 stands on its own line in white,
///   followed by an empty line and the description.
/// - Entry 7 shows each setting as a light-grey label line with its value
///   on the next line, indented by two blanks, in white: "Hostname",
///   "IPv4 Address" ("Not set" for 0.0.0.0), the DHCP line when the
///   address came from DHCP (unindented, in the label colour), "IPv6
///   Addresses" with one "address/prefix" line each (only when the
///   management NIC has any), then an empty line and the description. A
///   value too long for the indent starts at the left edge. Without a
///   management NIC only the description is shown.
/// - Entry 8's footer offers "<Enter> Restart", entry 10's "<Enter> More"
///   (it opens a window, like entries 7 and 13); entry 11's footer shows
///   the page hints "<Page Up> <Page Down>" in light grey on the left.
/// - Entry 7 opens the management network window (network/NetworkWindow.h)
///   and hands it the restart question an IPv6 change needs: the shutdown
///   dialog in its required-restart mode (ShutdownDialog.h).
/// - After a screen opened with Enter returns, the window is shown again
///   from the first entry, as when it was opened. Enter on entries 11 and
///   12 does nothing and redraws nothing.
/// - SIGUSR1 rebuilds the entries but keeps the selected one (when it can
///   still be chosen, else the first): a reload the operator did not ask
///   for should not move the selection under their hands.
/// - Entry 8 opens RestartNetworkDialog (after the missing-interface
///   message when there is no management NIC), entry 9 TestDialog, entry 10
///   NetworkRestoreWindow; after the restore window the host state is read
///   again and the entries rebuilt, since a restore may have replaced the
///   management NIC.

#include <cstdint>
#include <string>
#include <vector>

#include "screens/LogTable.h"
#include "screens/MenuEntries.h"
#include "toolkit/MenuWindow.h"

namespace Tulk {

class GeneralWindow : public MenuWindow {
 public:
  /// Reads the host state and the support file and builds the entries,
  /// above `owner` (the welcome screen).
  explicit GeneralWindow(Frame* owner);
  ~GeneralWindow() override;

  /// SIGUSR1: reads the host state again, rebuilds the entries and shows
  /// the window again.
  void ReloadHostInfo() override;

 protected:
  bool OnKey(int key) override;
  void BeforeMove() override;

 private:
  void ReadHostState();
  void BuildEntries();
  std::string Describe(std::uint32_t id);
  bool Open(std::uint32_t id);
  void TurnSupportPage(bool forward);
  void OpenLog(int digit);

  std::vector<std::string> supportPages_;
  std::uint32_t supportPage_ = 0;
  bool lockdownEnabled_ = false;
  MenuHostState hostState_;
  LogTable logs_;
};

}  // namespace Tulk
