#pragma once
/// "Restore Network Factory Settings": the confirmation of the factory
/// network restore.
///
/// 60 x 12, header 6 rows, the question "Are you sure you want to reset the
/// host network configuration?" inset by 3 columns on each side, footer
/// "<F11> Yes, Reset ... <Esc> Cancel". Esc returns 0 and changes nothing;
/// only F11 goes on (Enter is ignored like every other key): it runs
/// DoRestoreNetworkDialog, then logs "Restoring factory network settings"
/// and posts qob.user.tulk.factory.network.restored, whatever became of the
/// restore (also when the operator stopped it at the running-VMs warning),
/// and returns 1.

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class RestoreNetworkDialog : public ConfirmDialog {
 public:
  static constexpr int kWidth = 60;
  static constexpr int kHeight = 12;
  static constexpr int kHeaderHeight = 6;
  static constexpr int kInset = 3;

  /// The confirmation above `owner` (the restore menu).
  explicit RestoreNetworkDialog(Frame* owner);

  /// 0 on Esc; 1 after F11.
  int Run() override;
};

}  // namespace Tulk
