#include "screens/ChangePasswordDialog.h"

namespace Tulk {

ChangePasswordDialog::ChangePasswordDialog(Frame* owner, std::string user)
    : Dialog(owner, 60, 13, 6),
      user_(std::move(user)),
      oldPassword_("", "", 30),
      newPassword_("", "", 30),
      confirmPassword_("", "", 30) {
}

int ChangePasswordDialog::Run() {
  return Dialog::Run() != 0 ? 0 : 0;
}

bool ChangePasswordDialog::CheckOldPassword() {
  return false;
}

bool ChangePasswordDialog::Submit() {
  return false;
}

void ChangePasswordDialog::ReportSuccess(const std::string& /*storeError*/) {
}

void ChangePasswordDialog::ResetNewFields() {
}

void ChangePasswordDialog::Select(Field /*field*/) {
}

}  // namespace Tulk
