#include "screens/ChangePasswordDialog.h"

#include <curses.h>
#include <security/pam_appl.h>
#include <syslog.h>

#include "host/AuditLog.h"
#include "host/CommandRunner.h"
#include "host/EventReporter.h"
#include "host/HostTools.h"
#include "include/Keys.h"
#include "include/ProcessFlags.h"
#include "platform/api/Authentication.h"
#include "platform/api/HostMgrException.h"
#include "runtime/SystemLog.h"
#include "screens/PamAuthenticator.h"
#include "screens/SamePasswordConfirmDialog.h"
#include "toolkit/ItemList.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr int kFieldWidth = 30;

constexpr std::uint32_t kTitle = 157;
constexpr std::uint32_t kMessage = 158;
constexpr std::uint32_t kOldLabel = 159;
constexpr std::uint32_t kNewLabel = 160;
constexpr std::uint32_t kConfirmLabel = 161;
constexpr std::uint32_t kErrorTitle = 162;
constexpr std::uint32_t kWarningTitle = 163;
constexpr std::uint32_t kOldIncorrect = 164;
constexpr std::uint32_t kMismatch = 165;
constexpr std::uint32_t kEmpty = 166;
constexpr std::uint32_t kChangeFailed = 168;
constexpr std::uint32_t kStoreFailed = 169;

bool IsEditingKey(int key) {
  return (key >= 0x20 && key <= 0x7e) || key == KEY_LEFT || key == KEY_RIGHT || key == KEY_HOME ||
         key == KEY_END || key == KEY_BACKSPACE || key == KEY_DC || key == kKeyCtrlH;
}

}  // namespace

ChangePasswordDialog::ChangePasswordDialog(Frame* owner, std::string user)
    : Dialog(owner, 60, 13, 6),
      user_(std::move(user)),
      oldPassword_(Text(kOldLabel), "", kFieldWidth),
      newPassword_(Text(kNewLabel), "", kFieldWidth),
      confirmPassword_(Text(kConfirmLabel), "", kFieldWidth) {
  for (InputItem* field : {&oldPassword_, &newPassword_, &confirmPassword_}) {
    field->SetMasked(true);
  }
  list_ = new ItemList(Content(), 0, 0, Content()->Width(), 3);
  list_->SetItems({&oldPassword_, &newPassword_, &confirmPassword_});
  SetTitle(Text(kTitle));
  SetText(Text(kMessage));
  SetFooter(Footer::kOkCancel);
}

void ChangePasswordDialog::Select(Field field) {
  list_->SelectByOrdinal(field);
  list_->Draw();
}

void ChangePasswordDialog::ResetNewFields() {
  newPassword_.SetValue("");
  confirmPassword_.SetValue("");
  Select(kNewField);
}

int ChangePasswordDialog::Run() {
  ShowCursor(true);
  list_->Draw();
  for (;;) {
    const int key = WaitKey();
    const int field = list_->Ordinal();
    const bool forward = key == KEY_DOWN || key == kKeyTab || key == kKeyEnter;
    if (key == kKeyEsc) {
      ShowCursor(false);
      return 0;
    }
    if (field == kOldField && forward) {
      if (CheckOldPassword()) {
        list_->MoveDown();
      }
    } else if (field == kNewField && forward) {
      list_->MoveDown();
    } else if (field == kConfirmField && key == kKeyEnter) {
      if (Submit()) {
        return 1;
      }
    } else if (field == kConfirmField && key == kKeyTab) {
      Select(kOldField);
    } else if (key == KEY_UP) {
      list_->MoveUp();
    } else if (IsEditingKey(key)) {
      static_cast<InputItem*>(list_->Current())->HandleKey(key);
      list_->Draw();
    }
  }
}

bool ChangePasswordDialog::CheckOldPassword() {
  const int status = PamAuthenticator().Authenticate(user_, oldPassword_.Value());
  if (status == PAM_SUCCESS || status == PAM_NEW_AUTHTOK_REQD) {
    return true;
  }
  WriteAuditRecord(kAuditChangePassword, user_, false, {{"reason", "Invalid login"}});
  MessageDialog message(this, kErrorTitle, Text(kOldIncorrect));
  RunFrame(&message);
  oldPassword_.SetValue("");
  list_->Draw();
  return false;
}

bool ChangePasswordDialog::Submit() {
  const std::string oldPassword = oldPassword_.Value();
  const std::string newPassword = newPassword_.Value();
  std::uint32_t refusal = 0;
  if (newPassword != confirmPassword_.Value()) {
    refusal = kMismatch;
  } else if (newPassword.empty()) {
    refusal = kEmpty;
  }
  if (refusal != 0) {
    MessageDialog message(this, kErrorTitle, Text(refusal));
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
    MessageDialog message(this, kErrorTitle, Text(kChangeFailed));
    RunFrame(&message);
    ResetNewFields();
    return false;
  }
  std::string storeError;
  try {
    HostMgr::Authentication::StoreUserAccountsToCs();
  } catch (const HostMgr::Lib::HostMgrException& error) {
    storeError = error.what();
    Log(LOG_ERR, "Error persisting changes to config store");
    Log(LOG_ERR,
        "Error while storing user account information to persistent storage. The new "
        "information may not be available after reboot. Error: %s",
        storeError.c_str());
  }
  ReportSuccess();
  if (!storeError.empty()) {
    MessageDialog message(this, kWarningTitle, Text(kStoreFailed));
    RunFrame(&message);
  }
  ShowCursor(false);
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
