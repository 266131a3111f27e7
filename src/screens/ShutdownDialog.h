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

#include "toolkit/FormDialog.h"

namespace Tulk {

class CheckItem;

class ShutdownDialog : public FormDialog {
 public:
  /// Lays the dialog out above `owner`, the check box unticked. Run()
  /// (FormDialog) returns 0 (nothing changed) when left with Esc; Enter
  /// does nothing.
  explicit ShutdownDialog(Frame* owner);

 protected:
  bool OnKey(int key) override;
  bool Accept() override;

 private:
  void PowerAction(bool reboot);

  CheckItem* terminate_;
};

}  // namespace Tulk
