#pragma once
/// "Configure Password": the old password, the new one and its
/// confirmation, checked and changed through PAM.
///
/// Opened by the System Customization menu for the logged-in user and by
/// the login dialog when PAM reports an expired password. Layout: a dialog
/// 60 x 13 with a header of 6 rows (title 157, text 158) and three masked
/// fields of 30 columns, "Old Password:", "New Password:" and "Confirm
/// Password:".
///
/// Keys:
/// - Down, Tab or Enter on the old password checks it through PAM
///   (PAM_SUCCESS and PAM_NEW_AUTHTOK_REQD count as correct) before the
///   new-password field is reached. A wrong one writes the audit record
///   "account.changePassword" (failed, reason "Invalid login"), shows
///   "The old password you entered is incorrect", empties the field and
///   stays on it.
/// - Down, Tab or Enter on the new password moves to the confirmation; Up
///   moves back (without a check); Tab on the confirmation goes back to the
///   old password.
/// - Enter on the confirmation: differing values ("do not match") or an
///   empty new password ("Empty passwords are not allowed.") empty both new
///   fields and return to the new password before PAM is asked; the same
///   password as the old one asks for confirmation first
///   (SamePasswordConfirmDialog; Esc there stays in this dialog). Then the
///   change through PAM: a failure is audited (reason "PAM error"),
///   reported, and both new fields are emptied.
/// - After a successful change: the accounts are stored in the host's
///   configuration store, the audit record (succeeded), "/sbin/backup.sh 0",
///   "osk-cmd -U <user> internalsvc/refresh", the log line "Login password
///   for user %s has changed" and the event. When the configuration store
///   cannot be written, "Error persisting changes to config store" and
///   "Error while storing user account information to persistent storage.
///   The new information may not be available after reboot. Error: %s" are
///   logged, the success reports still follow (the password itself has
///   changed), and then a message with title "Configure Password: Warning"
///   and catalogue text 169 tells the operator.
/// - Esc leaves without a change.
/// - Printable and editing keys go to the current field.

#include <string>

#include "toolkit/FormDialog.h"

namespace Tulk {

class InputItem;

class ChangePasswordDialog : public FormDialog {
 public:
  /// The dialog for `user` above `owner`. Run() (FormDialog) returns 1
  /// after a successful change (and sets `passwordWasEmpty` from the new
  /// password), 0 when left with Esc.
  ChangePasswordDialog(Frame* owner, std::string user);

  /// The user whose password is changed.
  const std::string& User() const { return user_; }

 protected:
  bool OnKey(int key) override;
  bool Accept() override;

 private:
  bool CheckOldPassword();
  void ReportSuccess();
  void ResetNewFields();

  std::string user_;
  InputItem* oldPassword_;
  InputItem* newPassword_;
  InputItem* confirmPassword_;
};

}  // namespace Tulk
