#pragma once
/// "Restart Host": the progress of a restart (PowerConfirmDialog with
/// "Restart in progress..." and "reboot").

#include "screens/PowerConfirmDialog.h"

namespace Tulk {

class RebootConfirmDialog : public PowerConfirmDialog {
 public:
  /// The progress dialog above `owner`; `graceful` is true when running
  /// machines are not to be terminated.
  RebootConfirmDialog(Frame* owner, bool graceful);
};

}  // namespace Tulk
