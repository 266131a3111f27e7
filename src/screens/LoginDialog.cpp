#include "screens/LoginDialog.h"

#include <curses.h>
#include <security/pam_appl.h>
#include <syslog.h>

#include <vector>

#include "host/AuditLog.h"
#include "host/EventReporter.h"
#include "include/Keys.h"
#include "include/ProcessFlags.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/SystemInfoImpl.h"
#include "runtime/SystemLog.h"
#include "screens/ChangePasswordDialog.h"
#include "screens/ConsoleLogin.h"
#include "screens/KeyboardDialog.h"
#include "screens/PamAuthenticator.h"
#include "screens/SmartCardCheck.h"
#include "toolkit/ItemList.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr int kWidth = 60;
constexpr int kHeight = 13;
constexpr int kHeaderHeight = 6;
constexpr int kFieldWidth = 30;

constexpr std::uint32_t kTitle = 144;
constexpr std::uint32_t kPasswordLead = 145;
constexpr std::uint32_t kPinLead = 146;
constexpr std::uint32_t kNameLabel = 149;
constexpr std::uint32_t kIdLabel = 150;
constexpr std::uint32_t kPasswordLabel = 151;
constexpr std::uint32_t kPinLabel = 152;
constexpr std::uint32_t kFailedTitle = 153;
constexpr std::uint32_t kInvalidLogin = 154;
constexpr std::uint32_t kNoPermission = 155;
constexpr std::uint32_t kExpired = 156;

constexpr char kDefaultUser[] = "root";
// The first colour tag's stray ">" is part of the product's footer.
constexpr char kPinFooter[] =
    "{align:left}{color:black>}<F3>{/color} {color:dark-grey}Switch PIN/Password "
    "Login{/color}{/align}{align:right}{color:black}<Enter>{/color} "
    "{color:dark-grey}OK{/color}  {color:black}<Esc>{/color} "
    "{color:dark-grey}Cancel{/color}{/align}";

constexpr int kAuthError = LOG_AUTH | LOG_ERR;

bool IsEditingKey(int key) {
  return (key >= 0x20 && key <= 0x7e) || (key >= KEY_LEFT && key <= KEY_BACKSPACE) ||
         key == KEY_END;
}

std::string ConfiguredKeyboard() {
  try {
    return HykCtl::System::SystemInfoImpl().GetKeyboardLayout();
  } catch (const HostMgr::Lib::HostMgrException& error) {
    Log(LOG_ERR, "Getting keyboard layout failed: %s", error.what());
    return "N/A";
  }
}

}  // namespace

LoginDialog::LoginDialog(Frame* owner)
    : Dialog(owner, kWidth, kHeight, kHeaderHeight),
      name_(Text(kNameLabel), kDefaultUser, kFieldWidth),
      password_(Text(kPasswordLabel), "", kFieldWidth) {
  password_.SetMasked(true);
  std::vector<Item*> items;
  if (localConsole) {
    RelabelKeyboard();
    items.push_back(&keyboard_);
  }
  items.push_back(&name_);
  items.push_back(&password_);
  list_ = new ItemList(Content(), 0, 0, Content()->Width(), static_cast<int>(items.size()));
  list_->SetItems(items);

  RunSmartCardCheck();
  pinMode_ = !smartCardUser.empty();
  SetTitle(Text(kTitle));
  ShowMode();
}

void LoginDialog::ShowMode() {
  if (pinMode_) {
    SetText(LoginHostText(Text(kPinLead)));
    SetFooter(kPinFooter);
    name_.SetLabel(Text(kIdLabel));
    name_.SetValue(smartCardUser);
    password_.SetLabel(Text(kPinLabel));
  } else {
    SetText(LoginHostText(Text(kPasswordLead)));
    SetFooter(Footer::kOkCancel);
    name_.SetLabel(Text(kNameLabel));
    name_.SetValue(kDefaultUser);
    password_.SetLabel(Text(kPasswordLabel));
  }
  password_.SetValue("");
}

void LoginDialog::RelabelKeyboard() {
  keyboard_.SetText("Configured Keyboard (" + ConfiguredKeyboard() + ")");
}

int LoginDialog::Run() {
  ShowCursor(true);
  list_->SelectByOrdinal(0);
  list_->Draw();
  for (;;) {
    const int key = WaitKey();
    Item* current = list_->Current();
    const bool onPassword = current == &password_;
    if (key == KEY_DOWN) {
      list_->MoveDown();
    } else if (key == KEY_UP) {
      list_->MoveUp();
    } else if (key == KEY_F(3)) {
      pinMode_ = !pinMode_;
      DrawBatch batch;
      ShowMode();
      list_->Draw();
    } else if (key == kKeyEsc) {
      ShowCursor(false);
      Redraw(false);
      return 0;
    } else if (key == kKeyEnter && current == &keyboard_) {
      KeyboardDialog keyboard(this);
      RunFrame(&keyboard);
      RelabelKeyboard();
      list_->Draw();
    } else if ((key == kKeyTab || key == kKeyEnter) && !onPassword) {
      list_->MoveDown();
    } else if (key == kKeyTab) {
      list_->SelectByOrdinal(0);
      list_->Draw();
    } else if (key == kKeyEnter) {
      if (TryLogin()) {
        return 1;
      }
    } else if (IsEditingKey(key) && (current == &name_ || onPassword)) {
      static_cast<InputItem*>(current)->HandleKey(key);
      list_->Draw();
    }
  }
}

bool LoginDialog::TryLogin() {
  userName_ = name_.Value();
  const std::string password = password_.Value();
  const char* user = userName_.c_str();
  const int status = PamAuthenticator().Authenticate(userName_, password);
  if (status == PAM_SUCCESS) {
    currentUser = userName_;
    passwordWasEmpty = password.empty();
    SetSmartCardSession(pinMode_);
    Log(LOG_AUTH, "Authentication of user %s succeeded", user);
    Log(LOG_INFO, "User %s logged in", user);
    WriteAuditRecord(kAuditLogin, userName_, true);
    ShowCursor(false);
    return true;
  }
  if (status == PAM_NEW_AUTHTOK_REQD) {
    Log(kAuthError, "Password has expired for user %s", user);
    ReportFailure("Password expired", TulkEvent::LoginAccessDenied, kExpired);
    ChangePasswordDialog change(this, userName_);
    RunFrame(&change);
  } else if (status == PAM_PERM_DENIED) {
    Log(kAuthError, "Access denied for user %s", user);
    ReportFailure("No permission", TulkEvent::LoginAccessDenied, kNoPermission);
  } else {
    Log(kAuthError, "Authentication of user %s failed", user);
    ReportFailure("Invalid login", TulkEvent::LoginAuthenticationFailed, kInvalidLogin);
  }
  password_.SetValue("");
  list_->Draw();
  return false;
}

void LoginDialog::ReportFailure(const char* reason, TulkEvent event, std::uint32_t messageId) {
  WriteAuditRecord(kAuditLogin, userName_, false, {{"reason", reason}});
  PostEvent(event, {userName_});
  MessageDialog message(this, kFailedTitle, Text(messageId));
  RunFrame(&message);
}

}  // namespace Tulk
