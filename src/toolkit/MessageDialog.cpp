#include "toolkit/MessageDialog.h"

#include "include/Keys.h"
#include "toolkit/RunFrame.h"

namespace Tulk {

MessageDialog::MessageDialog(Frame* owner, std::uint32_t titleId, std::string message, int width,
                             int height, int headerHeight)
    : Dialog(owner, width, height, headerHeight), titleId_(titleId), message_(std::move(message)) {
  // Filled here as well as in Run, so that the first paint already shows
  // them and the terminal gets the dialog once.
  SetTitle(Text(titleId_));
  SetText(message_);
  SetFooter(Footer::kOk);
}

int MessageDialog::Run() {
  SetTitle(Text(titleId_));
  SetText(message_);
  SetFooter(Footer::kOk);
  while (WaitKey() != kKeyEnter) {
  }
  return 1;
}

void MessageDialog::Show(Frame* owner, std::uint32_t titleId, std::string message) {
  MessageDialog dialog(owner, titleId, std::move(message));
  RunFrame(&dialog);
}

}  // namespace Tulk
