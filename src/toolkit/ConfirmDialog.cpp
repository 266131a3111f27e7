#include "toolkit/ConfirmDialog.h"

#include <curses.h>

#include "include/Keys.h"
#include "toolkit/CheckItem.h"
#include "toolkit/ItemList.h"
#include "toolkit/TextArea.h"

namespace Tulk {

ConfirmDialog::ConfirmDialog(Frame* owner, int width, int height, int headerHeight,
                             ConfirmKeys keys)
    : Dialog(owner, width, height, headerHeight), keys_(keys) {
  if (Content() != nullptr) {
    question_ = new TextArea(Content(), 0, 0, Content()->Width(), Content()->Height());
  }
}

ConfirmDialog::~ConfirmDialog() = default;

void ConfirmDialog::PlaceQuestion(int column, int row, int width, int height) {
  if (Content() == nullptr) {
    return;
  }
  std::string text = question_ != nullptr ? question_->Text() : std::string();
  delete question_;
  question_ = new TextArea(Content(), column, row, width, height);
  question_->SetText(text);
}

void ConfirmDialog::SetQuestion(std::string_view text) {
  if (question_ != nullptr) {
    question_->SetText(text);
  }
}

CheckItem& ConfirmDialog::AddCheck(std::string caption, int column, int row, int width) {
  check_ = std::make_unique<CheckItem>(std::move(caption));
  if (Content() != nullptr) {
    delete checkList_;
    checkList_ = new ItemList(Content(), column, row, width, 1);
    checkList_->SetItems({check_.get()});
  }
  return *check_;
}

int ConfirmDialog::Run() {
  return static_cast<int>(Ask());
}

Answer ConfirmDialog::Ask() {
  if (checkList_ != nullptr) {
    checkList_->Draw();
  }
  for (;;) {
    const int key = WaitKey();
    if (key == kKeyEsc) {
      return Answer::kCancel;
    }
    if (key == kKeySpace && checkList_ != nullptr) {
      check_->Toggle();
      checkList_->Draw();
      continue;
    }
    switch (keys_) {
      case ConfirmKeys::kF11:
        if (key == KEY_F(11)) {
          return Answer::kYes;
        }
        break;
      case ConfirmKeys::kYesNo:
        if (key == 'y' || key == 'Y') {
          return Answer::kYes;
        }
        if (key == 'n' || key == 'N') {
          return Answer::kNo;
        }
        break;
      case ConfirmKeys::kEnter:
        if (key == kKeyEnter) {
          return Answer::kYes;
        }
        break;
    }
  }
}

}  // namespace Tulk
