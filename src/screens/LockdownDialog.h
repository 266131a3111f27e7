#pragma once
/// "Configure Lockdown Mode": shows whether the host is in lockdown mode
/// and switches it on or off.
///
/// A dialog 60 x 11 with a header of 6 rows: title 254 ("Configure
/// Lockdown Mode"), header text 255, and in the body one check box with
/// the caption 256 ("Enable lockdown mode"), ticked when the host reports
/// lockdown enabled ("osksvc/auth/lockdown_is_enabled" through osk-cmd).
///
/// Keys: Space toggles the box; Enter applies it and returns 1; Esc
/// returns 0 and changes nothing. Applying runs the management-API tool
/// as the console user, "osksvc/auth/lockdown_enter" to switch lockdown
/// on or "osksvc/auth/lockdown_exit" to switch it off, only when the box
/// differs from the host's state (the runner logs the command's outcome).
/// When the tool fails, a message dialog "Operation Failed" (276) with
/// "Please check the syslog for more information." (280) is shown before
/// the dialog returns 1 (the caller reads the state again either way).

#include "toolkit/FormDialog.h"

namespace Tulk {

class CheckItem;

class LockdownDialog : public FormDialog {
 public:
  /// Reads the host's lockdown state and lays the dialog out above
  /// `owner`. Run() (FormDialog) returns 1 after Enter, 0 after Esc.
  explicit LockdownDialog(Frame* owner);

 protected:
  bool Accept() override;

 private:
  bool wasEnabled_;
  CheckItem* box_;
};

}  // namespace Tulk
