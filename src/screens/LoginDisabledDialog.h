#pragma once
/// "Authentication Denied": shown instead of the login dialog when console
/// login is disabled (the marker "/var/run/brimlo/show-tulk-login" is
/// absent).
///
/// A dialog 60 x 9 with a header of 6 rows: "Direct console access has
/// been disabled by the administrator for <host>.<domain>." and the
/// Enter/OK footer, the only key it offers. It never logs anybody in:
/// Enter closes it; every other key, Esc too, is ignored. The result is
/// always 0.

#include "toolkit/Dialog.h"

namespace Tulk {

class LoginDisabledDialog : public Dialog {
 public:
  /// Lays the dialog out above `owner` with its texts.
  explicit LoginDisabledDialog(Frame* owner);

  /// Waits for Enter; returns 0.
  int Run() override;

 private:
  void ShowTexts();
};

}  // namespace Tulk
