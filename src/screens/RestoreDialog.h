#pragma once
/// "Reset System Configuration": reverts every host setting to its
/// software default and restarts the host.
///
/// A dialog 60 x 12 (header of 7 rows) with one text area at the top left
/// of the client area, 6 columns narrower than it.
///
/// Run:
/// 1. Title 179, heading 180, text 181, footer "<F11> OK  <Esc> Cancel".
/// 2. Esc returns 0; F11 goes on; every other key (Enter too) is ignored.
/// 3. Logs "Restoring factory defaults" and posts the event
///    "qob.user.tulk.restore.factory.defaults" (before the reset runs, so
///    both are there also when it fails).
/// 4. Title 182, heading 183; runs "/sbin/firmwareConfig.py --reset-only >
///    /dev/null 2>&1" through "/bin/sh -c" (the script's path under the
///    host root), within kResetTimeoutSeconds. A non-zero result (also a
///    script killed by that limit) returns 0 at once.
/// 5. Empties the text, footer "<Enter> Restart Host", heading 184; waits
///    for Enter (every other key, Esc too, is ignored: the configuration is
///    gone, only a restart is left).
/// 6. Runs "reboot -f" through "/bin/sh -c" within
///    kPowerCommandTimeoutSeconds; -1 (not run, or killed by that limit)
///    returns 0.
///    Otherwise the dialog never returns: it waits for the host to go
///    down.
///
/// The wait for the host to go down blocks in the key poll without a time
/// limit, so it costs no CPU time. Keys are read and dropped, nothing is
/// redrawn (not even the one-minute dimming), and SIGINT, SIGQUIT,
/// SIGTERM, SIGHUP, SIGPIPE and a hang-up of the terminal still end the
/// process with status 0, so the host's own shutdown does not have to wait
/// for a kill; every other signal is ignored.

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class RestoreDialog : public ConfirmDialog {
 public:
  /// Lays the dialog out above `owner`.
  explicit RestoreDialog(Frame* owner);

  /// 0 when cancelled, when the reset failed or when "reboot -f" could not
  /// be run; otherwise it does not return.
  int Run() override;
};

}  // namespace Tulk
