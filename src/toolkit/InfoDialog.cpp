#include "toolkit/InfoDialog.h"

#include "include/Keys.h"
#include "toolkit/TextArea.h"

namespace Tulk {

InfoDialog::InfoDialog(Frame* owner, const std::string& details, const std::string& title,
                       const std::string& message, const std::string& footer)
    : Dialog(owner, kWidth, kHeight, kHeaderHeight) {
  SetTitle(title);
  SetText(message);
  SetFooter(footer);
  if (Window* content = Content(); content != nullptr) {
    details_ = new TextArea(content, 0, 0, content->Width(), content->Height());
    details_->SetText(details);
  }
}

int InfoDialog::Run() {
  while (WaitKey() != kKeyEnter) {
  }
  return 1;
}

}  // namespace Tulk
