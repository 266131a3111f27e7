#pragma once
/// The System Customization menu: what a logged-in operator works in.
///
/// A full-screen RootWindow whose left half lists the entries and whose
/// right half describes the selected entry. The welcome screen builds it
/// after a successful login, runs it with RunFrame and logs the user out
/// when it returns:
///
///   auto* menu = new GeneralWindow(this);
///   RunFrame(menu);  // 1: the operator left with Esc
///   delete menu;
///
/// Entries (label = catalogue text of the id; id 3 rows are separators,
/// never enabled):
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
/// with separators after 6, 10, 13, 12 and 11 (MenuEntries.h). A disabled
/// entry shows its label in "{color:dark-grey}" and cannot be chosen.
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
/// Screens of other folders (entries 7, 8, 9, 10, 13) are opened through
/// ScreenRegistry.h; without a registered opener Enter on them does
/// nothing (for entry 8 the missing-interface message still comes first).
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
/// - After a screen opened with Enter returns, the window is shown again
///   with the same entry selected (Populate keeps the selection when that
///   entry is still enabled, else selects the first entry). Enter on
///   entries 11 and 12 does nothing and redraws nothing.

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "screens/LogTable.h"
#include "screens/MenuEntries.h"
#include "screens/ScreenRegistry.h"
#include "toolkit/RootWindow.h"

namespace Tulk {

class LabelItem;

class GeneralWindow : public RootWindow {
 public:
  /// Reads the host state and the support file and builds the entries,
  /// above `owner` (the welcome screen).
  explicit GeneralWindow(Frame* owner);
  ~GeneralWindow() override;

  /// Left title "System Customization", footers, the entries (keeping the
  /// selected one), and the description of the selected entry.
  void Populate() override;

  /// The key loop; returns 1 when the operator leaves with Esc.
  int Run() override;

  /// SIGUSR1: reads the host state again, rebuilds the entries and shows
  /// the window again.
  void ReloadHostInfo() override;

  /// Rebuilds the right half for the selected entry.
  void ShowDescription();

  /// The catalogue id of the selected entry (3 when none).
  std::uint32_t SelectedId() const;
  /// The support pages and the index of the one shown.
  const std::vector<std::string>& SupportPages() const { return supportPages_; }
  std::uint32_t SupportPage() const { return supportPage_; }
  bool LockdownEnabled() const { return lockdownEnabled_; }

 private:
  void ReadHostState();
  void BuildEntries();
  void SelectId(std::uint32_t id);
  void Move(bool down);
  void TurnSupportPage(bool forward);
  bool OpenSelected();
  bool OpenRegistered(ScreenId screen);
  void OpenLog(int digit);
  std::string LogsDescription();

  std::vector<std::string> supportPages_;
  std::uint32_t supportPage_ = 0;
  std::uint32_t selected_ = 0;
  std::vector<std::uint32_t> entryIds_;
  bool lockdownEnabled_ = false;
  MenuHostState hostState_;
  std::vector<std::unique_ptr<LabelItem>> items_;
  LogTable logs_;
};

}  // namespace Tulk
