#pragma once
/// "Network Restore Options": the full-screen menu of the operations that
/// give an operator back a working management network.
///
/// | Id | Entry                          | Opens                 | Footer  | Enabled when |
/// |----|--------------------------------|-----------------------|---------|--------------|
/// | 65 | Create Standard Switch         | CreateVssDialog       | Create  | always       |
/// | 66 | Create Port Group              | CreatePortGroupDialog | Create  | always       |
/// | 67 | Migrate Hykernel NIC to ...    | MigrateHyknicDialog   | Migrate | agent >= 3   |
/// | 68 | Restore Network Settings       | RestoreNetworkDialog  | Restart | always       |
/// | 69 | Restore Standard Switch        | SafeModeNetworkDialog | Restore | on a DVS     |
/// | 70 | Restore DVS                    | RunRestoreDvs()       | Restore | on a DVS     |
///
/// "agent >= 3": the network-overlay operations agent is present at major
/// version 3 or later; "on a DVS": the management NIC sits on a
/// distributed switch.
///
/// The identifier of an entry is the catalogue id of its label; it selects
/// the entry's description (71 to 76), its right footer and its dialog. The
/// conditions are evaluated once, when the window is built (their log lines
/// come from HasOpsAgentVersion3OrLater() and
/// IsManagementOnDistributedSwitch()); a disabled entry is greyed and
/// cannot be chosen.
///
/// Footers: entries 65 to 68 show "<Enter> <action>" with the action's
/// colour left open up to the alignment (Footer::MenuRestoreAction), 69 and
/// 70 Footer::kMenuRestoreExit. Entry 68 advertises "Restart", not
/// "Restore". After each refresh of the window (when it is shown, and
/// after a dialog closed) the generic footers "<Up/Down> Select" and
/// "<Enter> Change ... <Esc> Exit" show until the cursor first moves.
///
/// Keys: Up/Down move, Enter opens the entry's dialog and then shows the
/// window again with the same entry selected, Esc returns 1. After a
/// "Restore Standard Switch" that returned 1, entry 69 turns grey for the
/// rest of the window's life and the cursor moves down to "Restore DVS",
/// without a full redraw.
///
/// Decision of this implementation: after a dialog the window keeps the
/// entry the operator chose selected.

#include <cstdint>

#include "toolkit/MenuWindow.h"

namespace Tulk {

class NetworkRestoreWindow : public MenuWindow {
 public:
  /// Evaluates the two conditions and builds the entries, above `owner`
  /// (the System Customization menu).
  explicit NetworkRestoreWindow(Frame* owner);

 private:
  bool Open(std::uint32_t id);
};

}  // namespace Tulk
