#pragma once
/// "Configure Password: Warning": asks whether the new password may be the
/// same as the old one.
///
/// A dialog 60 x 9 with a header of 6 rows: "New password is same as old
/// password. Are you sure?", footer "<Enter> Confirm" and "<Esc> Cancel".
/// Enter returns 1, Esc 0; other keys are ignored.

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class SamePasswordConfirmDialog : public ConfirmDialog {
 public:
  /// Lays the question out above `owner`; Enter confirms (1), Esc cancels
  /// (0), every other key is ignored.
  explicit SamePasswordConfirmDialog(Frame* owner);
};

}  // namespace Tulk
