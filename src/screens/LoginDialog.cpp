#include "screens/LoginDialog.h"

#include <curses.h>
#include <security/pam_appl.h>
#include <syslog.h>

#include "host/AuditLog.h"
#include "host/EventReporter.h"
#include "host/SystemSettings.h"
#include "include/Keys.h"
#include "include/ProcessFlags.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "screens/ChangePasswordDialog.h"
#include "screens/ConsoleLogin.h"
#include "screens/KeyboardDialog.h"
#include "screens/PamAuthenticator.h"
#include "screens/SmartCardCheck.h"
#include "toolkit/InputItem.h"
#include "toolkit/ItemList.h"
#include "toolkit/LabelItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr int kWidth = 60;
constexpr int kHeight = 13;
constexpr int kHeaderHeight = 6;
constexpr int kFieldWidth = 30;

constexpr char kDefaultUser[] = "root";
constexpr int kAuthError = LOG_AUTH | LOG_ERR;

}  // namespace

LoginDialog::LoginDialog(Frame* owner) : FormDialog(owner, kWidth, kHeight, kHeaderHeight) {
  if (localConsole) {
    keyboard_ = &AddLabel("", true);
    RelabelKeyboard();
  }
  name_ = &AddInput(Text(TextId::kLoginNameLabel), kDefaultUser, kFieldWidth, kLoginText);
  password_ = &AddInput(Text(TextId::kPasswordLabel), "", kFieldWidth, kLoginText);
  password_->SetMasked(true);
  PlaceList(0, 0, Content()->Width(), localConsole ? 3 : 2);
  SetTabMoves(true);
  SetEnterAdvances(true);
  SetCursorAlways(true);

  RunSmartCardCheck();
  pinMode_ = !smartCardUser.empty();
  SetTitle(Text(TextId::kAuthenticationRequired));
  ShowMode();
}

void LoginDialog::ShowMode() {
  if (pinMode_) {
    SetText(LoginHostText(Text(TextId::kPinLoginLead)));
    SetFooter(Footer::kPinLogin);
    name_->SetLabel(Text(TextId::kLoginIdLabel));
    name_->SetValue(smartCardUser);
    password_->SetLabel(Text(TextId::kPinLabel));
  } else {
    SetText(LoginHostText(Text(TextId::kPasswordLoginLead)));
    SetFooter(Footer::kOkCancel);
    name_->SetLabel(Text(TextId::kLoginNameLabel));
    name_->SetValue(kDefaultUser);
    password_->SetLabel(Text(TextId::kPasswordLabel));
  }
  password_->SetValue("");
}

void LoginDialog::RelabelKeyboard() {
  keyboard_->SetText("Configured Keyboard (" + ReadKeyboardLayout() + ")");
}

void LoginDialog::Prepare() {
  List().SelectByOrdinal(0);
}

bool LoginDialog::OnKey(int key) {
  if (key == KEY_F(3)) {
    pinMode_ = !pinMode_;
    DrawBatch batch;
    ShowMode();
    Redisplay();
    return true;
  }
  if (key == kKeyEnter && keyboard_ != nullptr && Current() == keyboard_) {
    KeyboardDialog keyboard(this);
    RunFrame(&keyboard);
    RelabelKeyboard();
    Redisplay();
    return true;
  }
  return false;
}

void LoginDialog::Cancelled() {
  ShowCursor(false);
  Redraw(false);
}

bool LoginDialog::Accept() {
  userName_ = name_->Value();
  const std::string password = password_->Value();
  const char* user = userName_.c_str();
  const int status = PamAuthenticator().Authenticate(userName_, password);
  if (status == PAM_SUCCESS) {
    currentUser = userName_;
    passwordWasEmpty = password.empty();
    SetSmartCardSession(pinMode_);
    Log(LOG_AUTH, "Authentication of user %s succeeded", user);
    Log(LOG_INFO, "User %s logged in", user);
    WriteAuditRecord(kAuditLogin, userName_, true);
    return true;
  }
  if (status == PAM_NEW_AUTHTOK_REQD) {
    Log(kAuthError, "Password has expired for user %s", user);
    ReportFailure("Password expired", TulkEvent::LoginAccessDenied, TextId::kPasswordExpired);
    ChangePasswordDialog change(this, userName_);
    RunFrame(&change);
  } else if (status == PAM_PERM_DENIED) {
    Log(kAuthError, "Access denied for user %s", user);
    ReportFailure("No permission", TulkEvent::LoginAccessDenied, TextId::kNoLoginPermission);
  } else {
    Log(kAuthError, "Authentication of user %s failed", user);
    ReportFailure("Invalid login", TulkEvent::LoginAuthenticationFailed, TextId::kInvalidLogin);
  }
  password_->SetValue("");
  Redisplay();
  return false;
}

void LoginDialog::ReportFailure(const char* reason, TulkEvent event, std::uint32_t messageId) {
  WriteAuditRecord(kAuditLogin, userName_, false, {{"reason", reason}});
  PostEvent(event, {userName_});
  MessageDialog message(this, TextId::kAuthenticationFailed, Text(messageId));
  RunFrame(&message);
}

}  // namespace Tulk
