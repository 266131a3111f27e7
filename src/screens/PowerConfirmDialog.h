#pragma once
/// The progress dialog of a shutdown or restart: shows the progress text,
/// powers the virtual machines off and starts the host's own command.
///
/// A dialog 70 x 10 with a header of 6 rows and no footer (no key does
/// anything). Run:
/// 1. title and progress text;
/// 2. "osk-cmd -U <user> hostsvc/autostartmanager/autostop", then
///    "/bin/powerOffVms", with "--terminate" unless the running machines
///    are to stop gracefully (both logged by the runner, each within
///    kPowerOffVmsTimeoutSeconds; a failure does not stop the shutdown);
/// 3. the host's command through "/bin/sh -c", within
///    kPowerCommandTimeoutSeconds;
/// 4. when that could not be run at all or was killed by its limit (-1)
///    the dialog returns 0 and the
///    operator is back in the shutdown dialog. Otherwise it waits for keys
///    and ignores them while the host goes down; the wait blocks in the key
///    loop, so the console uses no CPU meanwhile (an idle timeout still
///    ends the session as everywhere else).
///
/// ShutdownConfirmDialog and RebootConfirmDialog (their own headers) fix the
/// texts and the command.

#include <cstdint>
#include <string>

#include "toolkit/Dialog.h"

namespace Tulk {

class PowerConfirmDialog : public Dialog {
 public:
  /// Returns 0 when the command could not be run; otherwise never.
  int Run() override;

  /// True when the check box was not ticked: running machines are shut
  /// down by their own policy rather than terminated.
  bool Graceful() const { return graceful_; }

 protected:
  /// A 70 x 10 dialog with the catalogue texts `titleId` and `messageId`
  /// that runs `command` through "/bin/sh -c".
  PowerConfirmDialog(Frame* owner, bool graceful, std::uint32_t titleId, std::uint32_t messageId,
                     std::string command);

 private:
  bool graceful_;
  std::uint32_t titleId_;
  std::uint32_t messageId_;
  std::string command_;
};

/// "Shut Down Host", "Shutdown in progress...", then "poweroff".
}  // namespace Tulk
