#pragma once
/// "Shut Down/Restart": shuts the host down (F2) or restarts it (F11),
/// optionally terminating running virtual machines.
///
/// A dialog 60 x 19 with a header of 13 rows (title 170, text 171) and one
/// check box, "Forcefully terminate running VMs, if any ..." (unticked),
/// toggled with Space. F2 logs "Shutting down host", posts the event
/// "qob.user.tulk.shutdown.host" and runs ShutdownConfirmDialog; F11 logs
/// "Rebooting host", posts "qob.user.tulk.reboot.host" and runs
/// RebootConfirmDialog. A confirmation dialog returns only when the host's
/// command could not be run, and the operator is back here. Esc leaves.
///
/// Opened from the welcome screen (F12 after the login) and from the System
/// Customization menu.
///
/// A required restart: after the management network's IPv6 flag was
/// changed, the same dialog asks for the restart that the change needs. It
/// is 70 x 11 with a header of 5 rows: title "Enable IPv6: Restart
/// Required" with "This host must be restarted before IPv6 will be
/// enabled." (or the "Disable IPv6" pair), the same check box, and the
/// footer "<F11> Restart Now ... <Esc> Restart Later". F11 restarts exactly
/// as above; Esc leaves, and the new IPv6 state then takes effect at the
/// next boot. F2 does nothing there.

#include "toolkit/FormDialog.h"

namespace Tulk {

class CheckItem;

/// Why the dialog is shown.
enum class ShutdownReason {
  /// The operator asked to shut down or restart.
  kOperator,
  /// IPv6 was switched on, or off, and needs a restart.
  kIpv6Enabled,
  kIpv6Disabled,
};

class ShutdownDialog : public FormDialog {
 public:
  /// Lays the dialog out above `owner` for `reason`, the check box
  /// unticked. Run() (FormDialog) returns 0 (nothing changed) when left
  /// with Esc; Enter does nothing.
  explicit ShutdownDialog(Frame* owner, ShutdownReason reason = ShutdownReason::kOperator);

 protected:
  bool OnKey(int key) override;
  bool Accept() override;

 private:
  void PowerAction(bool reboot);

  ShutdownReason reason_;
  CheckItem* terminate_;
};

}  // namespace Tulk
