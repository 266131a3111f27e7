#pragma once
/// "Restore Network Settings": the factory network restore and its
/// progress.
///
/// 60 x 12, header 6 rows ("Please wait while the factory network settings
/// are restored."), the progress in the client area. In order:
/// 1. When a virtual machine runs, RunningVMsWarningDialog asks first; Esc
///    there abandons the restore with nothing changed (result 0). Enter
///    shows "Powering Off VMs. " and runs "/sbin/powerOffVms"; "Done."
///    follows when it succeeded.
/// 2. The network dump target is disabled (in both paths).
/// 3. A failed power-off shows "Failed.", logs "Powering off VMs failed"
///    and leaves the network alone.
/// 4. "Auto-configuring network. ", the configuration is cleared ("Clearing
///    Network Config") and rebuilt ("Auto-Configuring Network"), "Done.".
/// A host failure in steps 2 to 4 shows "Failed." and logs
/// "auto-configuring network failed", whichever step failed. The report
/// then waits for Enter alone (footer "<Enter> OK") and returns 1.
///
/// Decision of this implementation: each step's line ends where the next
/// one starts ("\n" before it), so the two lines fit the 2-row report.

#include "toolkit/ProgressDialog.h"

namespace Tulk {

class DoRestoreNetworkDialog : public ProgressDialog {
 public:
  static constexpr int kWidth = 60;
  static constexpr int kHeight = 12;
  static constexpr int kHeaderHeight = 6;

  /// The restore above `owner`.
  explicit DoRestoreNetworkDialog(Frame* owner);

  /// 0 when the operator stopped at the running-VMs warning; 1 once Enter
  /// closed the report.
  int Run() override;
};

}  // namespace Tulk
