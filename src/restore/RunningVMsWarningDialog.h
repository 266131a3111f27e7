#pragma once
/// "Warning: VMs running on the host": asks whether running virtual
/// machines may be stopped before the host is shut down, restarted, or its
/// network restored.
///
/// 60 x 10, header 6 rows (title and the two-line question), no client
/// area, footer "<Enter> Confirm ... <Esc> Cancel". Enter returns 1, Esc
/// returns 0, every other key is ignored.

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class RunningVMsWarningDialog : public ConfirmDialog {
 public:
  static constexpr int kWidth = 60;
  static constexpr int kHeight = 10;
  static constexpr int kHeaderHeight = 6;

  /// The warning above `owner`.
  explicit RunningVMsWarningDialog(Frame* owner);
};

}  // namespace Tulk
