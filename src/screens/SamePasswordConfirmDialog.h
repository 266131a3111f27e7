#pragma once
/// "Configure Password: Warning": asks whether the new password may be the
/// same as the old one.
///
/// A dialog 60 x 9 with a header of 6 rows: "New password is same as old
/// password. Are you sure?", footer "<Enter> Confirm" and "<Esc> Cancel".
/// Enter returns 1, Esc 0; other keys are ignored.

#include "toolkit/Dialog.h"

namespace Tulk {

class SamePasswordConfirmDialog : public Dialog {
 public:
  /// Lays the question out above `owner`; the default Dialog key loop
  /// answers it.
  explicit SamePasswordConfirmDialog(Frame* owner);
};

}  // namespace Tulk
