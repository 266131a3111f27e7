#pragma once
/// "Shut Down Host": the progress of a shutdown (PowerConfirmDialog with
/// "Shutdown in progress..." and "poweroff").

#include "screens/PowerConfirmDialog.h"

namespace Tulk {

class ShutdownConfirmDialog : public PowerConfirmDialog {
 public:
  /// The progress dialog above `owner`; `graceful` is true when running
  /// machines are not to be terminated.
  ShutdownConfirmDialog(Frame* owner, bool graceful);
};

}  // namespace Tulk
