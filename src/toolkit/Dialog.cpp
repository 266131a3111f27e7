#include "toolkit/Dialog.h"

#include <curses.h>

#include "include/ColorNumbers.h"
#include "include/Keys.h"
#include "runtime/KeyInput.h"
#include "toolkit/TextArea.h"

namespace Tulk {

Dialog::Dialog(Frame* owner, int width, int height, int headerHeight)
    : Frame(owner, (COLS - width) / 2, (LINES - height) / 2, width, height, kBlack, kWhite),
      header_(new Window(this, 0, 0, width, headerHeight, kDarkGrey, kWhite)),
      body_(new Window(this, 0, headerHeight, width, height - headerHeight, kYellow, kWhite)) {
  Box();
  const int bodyHeight = height - headerHeight;
  if (bodyHeight - 4 >= 1) {
    content_ = new Window(body_, 2, 1, width - 4, bodyHeight - 4, kYellow, kDarkGrey);
  }
  if (headerHeight >= 2) {
    title_ = new TextArea(header_, 3, 1, width - 6, 1, -1, kWhite);
  }
  if (headerHeight - 4 >= 1) {
    text_ = new TextArea(header_, 3, 3, width - 6, headerHeight - 4, -1, kLightGrey);
  }
  if (bodyHeight >= 2) {
    footer_ = new TextArea(body_, 2, bodyHeight - 2, width - 4, 1, -1, kBlack);
  }
}

void Dialog::Redraw(bool active) {
  DrawBatch batch;
  if (active && Owner() != nullptr) {
    Owner()->Update();
  }
  Frame::Redraw(active);
}

int Dialog::Run() {
  for (;;) {
    int key = WaitKey();
    if (key == kKeyEnter) {
      return 1;
    }
    if (key == kKeyEsc) {
      return 0;
    }
  }
}

void Dialog::SetTitle(std::string_view text) {
  if (title_ != nullptr) {
    title_->SetText(text);
  }
}

void Dialog::SetText(std::string_view text) {
  if (text_ != nullptr) {
    text_->SetText(text);
  }
}

void Dialog::SetFooter(std::string_view text) {
  if (footer_ != nullptr) {
    footer_->SetText(text);
  }
}

int Dialog::WaitKey() {
  return WaitForKey(this, true);
}

int Dialog::WaitKeyOrResult(const WorkerResult& result) {
  return WaitForKeyOrResult(this, true, result);
}

int Dialog::WaitForEnter() {
  while (WaitKey() != kKeyEnter) {
  }
  return 1;
}

}  // namespace Tulk
