#pragma once
/// "Authentication Required": the console login, by name and password or
/// by smart-card login id and PIN, through PAM.
///
/// A dialog 60 x 13 with a header of 6 rows. Items: when the console is a
/// local keyboard console (`localConsole`), first a label "Configured
/// Keyboard (<layout>)"; then two input fields of 30 columns, the second
/// masked. Modes:
/// - name and password: "Login Name:" filled with "root", "Password:";
/// - smart card (`pinMode`, chosen when the smart-card check found a card):
///   "Login Id:" filled with the card's user id, "PIN:".
///
/// Keys (a FormDialog): Up/Down move; Tab or Enter on any item but the
/// password moves to the next one, Tab on the password back to the first;
/// Enter on the keyboard label runs the keyboard dialog and relabels the
/// item; F3 switches the mode (the fields get the mode's values again); Esc
/// leaves without any log line or record; printable keys and Left, Right,
/// Home, End and Backspace edit the current field (kLoginText); all other
/// keys are ignored. The cursor stays shown, on the keyboard label too.
///
/// Enter on the password authenticates through PAM (PamAuthenticator):
/// - success: `currentUser`, `passwordWasEmpty`, "Authentication of user %s
///   succeeded" (authentication facility), "User %s logged in", audit
///   "tulk.login" succeeded; the dialog returns 1;
/// - expired password (12): "Password has expired for user %s", audit
///   failure "Password expired", the event "Access denied for user %s", a
///   message, then the password-change dialog for the user; the dialog
///   stays open for a login with the new password;
/// - permission denied (6): "Access denied for user %s", audit "No
///   permission", the same event, "User does not have permission to login
///   to TULK.";
/// - anything else: "Authentication of user %s failed", audit "Invalid
///   login", the event "Authentication of user %s failed", "Invalid login
///   or password.".
/// Failure lines use the authentication facility at error level. After a
/// failure the name is kept and the password field emptied.
///
/// A keyboard layout that cannot be read is shown as "N/A" (and logged as
/// "Getting keyboard layout failed: %s").

#include <cstdint>
#include <string>

#include "host/EventReporter.h"
#include "toolkit/FormDialog.h"

namespace Tulk {

class InputItem;
class LabelItem;

class LoginDialog : public FormDialog {
 public:
  /// Lays the dialog out above `owner`, runs the smart-card check and
  /// chooses the mode. Run() (FormDialog) returns 1 after a successful
  /// login, 0 when left with Esc.
  explicit LoginDialog(Frame* owner);

  /// The user name entered for the last attempt (kept after the dialog
  /// closed).
  const std::string& UserName() const { return userName_; }
  /// The dialog is in smart-card mode.
  bool PinMode() const { return pinMode_; }

 protected:
  void Prepare() override;
  bool OnKey(int key) override;
  bool Accept() override;
  void Cancelled() override;

 private:
  void ShowMode();
  void RelabelKeyboard();
  void ReportFailure(const char* reason, TulkEvent event, std::uint32_t messageId);

  LabelItem* keyboard_ = nullptr;
  InputItem* name_ = nullptr;
  InputItem* password_ = nullptr;
  bool pinMode_ = false;
  std::string userName_;
};

}  // namespace Tulk
