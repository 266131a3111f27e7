#include "toolkit/NotificationDialog.h"

#include "include/Keys.h"

namespace Tulk {

NotificationDialog::NotificationDialog(Frame* owner, std::string title, std::string message,
                                       int width, int height, int headerHeight)
    : Dialog(owner, width, height, headerHeight),
      title_(std::move(title)),
      message_(std::move(message)) {
  SetTitle(title_);
  SetText(message_);
  SetFooter(Footer::kOk);
}

int NotificationDialog::Run() {
  SetTitle(title_);
  SetText(message_);
  SetFooter(Footer::kOk);
  while (WaitKey() != kKeyEnter) {
  }
  return 1;
}

}  // namespace Tulk
