#include "toolkit/ProgressDialog.h"

#include <string>

#include "render/TextId.h"
#include "toolkit/TextArea.h"

namespace Tulk {

ProgressDialog::ProgressDialog(Frame* owner, int width, int height, int headerHeight)
    : Dialog(owner, width, height, headerHeight) {
  if (Content() != nullptr) {
    area_ = new TextArea(Content(), 0, 0, Content()->Width(), Content()->Height());
  }
}

void ProgressDialog::PlaceText(int column, int row, int width, int height) {
  if (Content() == nullptr) {
    return;
  }
  std::string text = Report();
  delete area_;
  area_ = new TextArea(Content(), column, row, width, height);
  area_->SetText(text);
}

void ProgressDialog::Show(std::string_view text) {
  if (area_ != nullptr) {
    area_->SetText(text);
  }
}

void ProgressDialog::Append(std::string_view text) {
  if (area_ != nullptr) {
    area_->Append(text);
  }
}

void ProgressDialog::AppendOutcome(bool ok) {
  Append(Text(ok ? TextId::kDone : TextId::kFailed));
}

const std::string& ProgressDialog::Report() const {
  static const std::string kNone;
  return area_ != nullptr ? area_->Text() : kNone;
}

int ProgressDialog::Finish(std::string_view footer) {
  SetFooter(footer);
  return WaitForEnter();
}

}  // namespace Tulk
