#include "screens/LoginDisabledDialog.h"

#include "render/TextId.h"
#include "screens/ConsoleLogin.h"

namespace Tulk {
namespace {

constexpr std::uint32_t kTitle = TextId::kAuthenticationDenied;
constexpr std::uint32_t kLead = TextId::kConsoleAccessDisabled;

}  // namespace

LoginDisabledDialog::LoginDisabledDialog(Frame* owner) : Dialog(owner, 60, 9, 6) {
  ShowTexts();
}

void LoginDisabledDialog::ShowTexts() {
  SetTitle(Text(kTitle));
  SetText(LoginHostText(Text(kLead)));
  SetFooter(Footer::kOk);
}

int LoginDisabledDialog::Run() {
  WaitForEnter();
  return 0;
}

}  // namespace Tulk
