#pragma once
/// "Restart Management Network": restarts the management interface and
/// reports the addresses it had.
///
/// 70 x 16, header 5 rows ("Please wait while the management network
/// restarts."), the report in the client area (66 x 7):
///
///   Stopping management network. Done.
///   Starting management network.
///      IP address is 10.20.30.41
///      IP address is 2001:db8:20:30::41
///   Done.
///
/// Before the work: "Restarting %s" (the interface) is logged and the event
/// qob.user.tulk.network.restart is posted. The interface is stopped and
/// started (RestartManagementInterface(): the host's restart of the kernel
/// NIC, one operation) after "Starting management network. " is shown; the
/// address lines follow (RestartReport.h), then "Done." and the footer
/// "<Enter> OK", and only Enter closes the report (result 1).
///
/// Decisions of this implementation:
/// - When the host refuses the restart, the report ends with "Failed."
///   instead of "Done." (the failure is logged by the host function); the
///   address lines are shown either way.

#include "host/ManagementRestart.h"
#include "toolkit/ProgressDialog.h"

namespace Tulk {

class DoRestartNetworkDialog : public ProgressDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 16;
  static constexpr int kHeaderHeight = 5;

  /// The report above `owner` for the management NIC read as `state`.
  DoRestartNetworkDialog(Frame* owner, ManagementIpState state);

  /// Restarts and reports; returns 1 once Enter closed the report.
  int Run() override;

 private:
  ManagementIpState state_;
};

}  // namespace Tulk
