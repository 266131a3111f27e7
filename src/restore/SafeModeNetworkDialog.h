#pragma once
/// "Restore Standard Switch": confirms and performs the move of the
/// management network from its distributed switch onto a new standard
/// switch (MoveManagementToNewStandardSwitch()).
///
/// 60 x 12, header 7 rows, the question "Move the management network onto
/// a standard switch?", footer "<F11> OK  <Esc> Cancel". Esc returns 0 and
/// changes nothing; only F11 goes on: the move, then "Enabling safe mode
/// networking by moving all uplinks to a new management vSwitch" is logged
/// and 1 returned, also when the move failed (its failures are in the
/// log).

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class SafeModeNetworkDialog : public ConfirmDialog {
 public:
  static constexpr int kWidth = 60;
  static constexpr int kHeight = 12;
  static constexpr int kHeaderHeight = 7;

  /// The question above `owner` (the restore menu).
  explicit SafeModeNetworkDialog(Frame* owner);

  /// 0 on Esc; 1 after F11.
  int Run() override;
};

}  // namespace Tulk
