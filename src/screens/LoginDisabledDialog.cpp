#include "screens/LoginDisabledDialog.h"

#include "include/Keys.h"
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
  for (;;) {
    const int key = WaitKey();
    if (key == kKeyEnter || key == kKeyEsc) {
      return 0;
    }
  }
}

}  // namespace Tulk
