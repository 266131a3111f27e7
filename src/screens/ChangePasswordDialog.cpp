#include "screens/ChangePasswordDialog.h"

#include <curses.h>
#include <security/pam_appl.h>
#include <syslog.h>

#include "host/AuditLog.h"
#include "host/CommandRunner.h"
#include "host/EventReporter.h"
#include "host/HostTools.h"
#include "host/SystemSettings.h"
#include "include/Keys.h"
#include "include/ProcessFlags.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "screens/PamAuthenticator.h"
#include "screens/SamePasswordConfirmDialog.h"
#include "toolkit/InputItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr int kFieldWidth = 30;

}  // namespace

ChangePasswordDialog::ChangePasswordDialog(Frame* owner, std::string user)
    : FormDialog(owner, 60, 13, 6), user_(std::move(user)) {
  oldPassword_ = &AddInput(Text(TextId::kOldPasswordLabel), "", kFieldWidth);
  newPassword_ = &AddInput(Text(TextId::kNewPasswordLabel), "", kFieldWidth);
  confirmPassword_ = &AddInput(Text(TextId::kConfirmPasswordLabel), "", kFieldWidth);
  for (InputItem* field : {oldPassword_, newPassword_, confirmPassword_}) {
    field->SetMasked(true);
  }
  PlaceList(0, 0, Content()->Width(), 3);
  SetTabMoves(true);
  SetEnterAdvances(true);
  SetTitle(Text(TextId::kPasswordTitle));
  SetText(Text(TextId::kPasswordText));
  SetFooter(Footer::kOkCancel);
}

void ChangePasswordDialog::ResetNewFields() {
  newPassword_->SetValue("");
  confirmPassword_->SetValue("");
  Focus(*newPassword_);
}

bool ChangePasswordDialog::OnKey(int key) {
  const bool forward = key == KEY_DOWN || key == kKeyTab || key == kKeyEnter;
  if (forward && Current() == oldPassword_) {
    if (CheckOldPassword()) {
      Focus(*newPassword_);
    }
    return true;
  }
  return false;
}

bool ChangePasswordDialog::CheckOldPassword() {
  const int status = PamAuthenticator().Authenticate(user_, oldPassword_->Value());
  if (status == PAM_SUCCESS || status == PAM_NEW_AUTHTOK_REQD) {
    return true;
  }
  WriteAuditRecord(kAuditChangePassword, user_, false, {{"reason", "Invalid login"}});
  MessageDialog message(this, TextId::kPasswordErrorTitle, Text(TextId::kOldPasswordIncorrect));
  RunFrame(&message);
  oldPassword_->SetValue("");
  Redisplay();
  return false;
}

bool ChangePasswordDialog::Accept() {
  const std::string oldPassword = oldPassword_->Value();
  const std::string newPassword = newPassword_->Value();
  std::uint32_t refusal = 0;
  if (newPassword != confirmPassword_->Value()) {
    refusal = TextId::kPasswordMismatch;
  } else if (newPassword.empty()) {
    refusal = TextId::kPasswordEmpty;
  }
  if (refusal != 0) {
    MessageDialog message(this, TextId::kPasswordErrorTitle, Text(refusal));
    RunFrame(&message);
    ResetNewFields();
    return false;
  }
  if (newPassword == oldPassword) {
    SamePasswordConfirmDialog confirm(this);
    if (RunFrame(&confirm) == 0) {
      return false;
    }
  }
  if (PamAuthenticator().ChangePassword(user_, oldPassword, newPassword) != PAM_SUCCESS) {
    WriteAuditRecord(kAuditChangePassword, user_, false, {{"reason", "PAM error"}});
    MessageDialog message(this, TextId::kPasswordErrorTitle, Text(TextId::kPasswordChangeFailed));
    RunFrame(&message);
    ResetNewFields();
    return false;
  }
  std::string storeError;
  const bool stored = StoreUserAccounts(storeError);
  if (!stored) {
    Log(LOG_ERR, "Error persisting changes to config store");
    Log(LOG_ERR,
        "Error while storing user account information to persistent storage. The new "
        "information may not be available after reboot. Error: %s",
        storeError.c_str());
  }
  ReportSuccess();
  if (!stored) {
    MessageDialog message(this, TextId::kPasswordWarningTitle, Text(TextId::kPasswordStoreFailed));
    RunFrame(&message);
  }
  passwordWasEmpty = newPassword.empty();
  return true;
}

void ChangePasswordDialog::ReportSuccess() {
  WriteAuditRecord(kAuditChangePassword, user_, true);
  RunLoggedCommand("/sbin/backup.sh", {"backup.sh", "0"});
  RunOskCmd({"osk-cmd", "-U", user_, "internalsvc/refresh"});
  Log(LOG_INFO, "Login password for user %s has changed", user_.c_str());
  PostEvent(TulkEvent::PasswordChanged, {user_});
}

}  // namespace Tulk
