#pragma once
/// "Restart Management Agents: Confirm": stops and starts the host's
/// management agents, optionally after starting a background capture of
/// the management agent's live core.
///
/// A dialog 71 x 20 confirmed with F11 (ConfirmDialog, ConfirmKeys::kF11):
/// the red warning as its heading, "Restart management agents now?" in a
/// text area inset one column and two rows into the client area and three
/// rows high, and below it the check box "Collect extra troubleshooting
/// information" (unchecked; Space flips it). Esc returns 0 and logs
/// nothing; Enter and every other key are ignored.
///
/// F11:
/// 1. The footer is cleared; "Restarting host agents" is logged and the
///    event qob.user.tulk.restarting.hostagents posted.
/// 2. With the box checked, the capture thread starts (ManagementAgents.h);
///    once started, "Collecting host agent live core information. Done."
///    shows at once: the dialog does not wait for the capture, which may go
///    on after the dialog has closed.
/// 3. "Stopping management agents." shows in black below the finished
///    steps (dark grey) while "/bin/sh /sbin/services.sh stop" runs, then
///    reads "... Done." in dark grey; the same for "Starting management
///    agents." and "start". "Done." is shown whatever the outcome.
/// 4. The footer becomes "<Enter> OK"; only Enter closes the dialog, and
///    Run() returns 1.

#include <string>

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class RestartAgentsDialog : public ConfirmDialog {
 public:
  /// Lays the dialog out above `owner`.
  explicit RestartAgentsDialog(Frame* owner);
  ~RestartAgentsDialog() override;

  /// The confirmation, then the restart: 0 on Esc, 1 after the restart.
  int Run() override;

 private:
  void ShowProgress(const std::string& done, const char* running = nullptr);
};

}  // namespace Tulk
