#include "toolkit/RootWindow.h"

#include <curses.h>
#include <syslog.h>

#include <cstring>

#include "include/ColorNumbers.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "toolkit/Footer.h"
#include "toolkit/ItemList.h"
#include "toolkit/TextArea.h"

namespace Tulk {

// The panes' own cells are blank (margins, empty rows): they take the
// colour of the text beside them, the menu's labels and the descriptions,
// so that the terminal is not told to change colour where none shows.
RootWindow::RootWindow(Frame* owner)
    : Frame(owner, 0, 0, COLS, LINES, kBlack, kWhite),
      statusLine_(new Window(this, 0, LINES - 1, COLS, 1, kBlack, kLightGrey)),
      mainArea_(new Window(this, 0, 0, COLS, LINES - 1, kLightGrey, kWhite)),
      rightPane_(new Window(mainArea_, COLS / 2, 0, COLS / 2, LINES - 1, kDarkGrey, kLightGrey)),
      leftPane_(new Window(mainArea_, 0, 0, COLS / 2, LINES - 1, kYellow, kBlack)),
      rightTitle_(new TextArea(rightPane_, 2, 1, COLS / 2 - 6, 1, -1, kWhite)),
      leftTitle_(new TextArea(leftPane_, 3, 1, COLS / 2 - 6, 1, -1, kBlack)),
      leftFooter_(new TextArea(leftPane_, 2, LINES - 3, COLS / 2 - 3, 1, -1, kBlack)),
      rightFooter_(new TextArea(rightPane_, 1, LINES - 3, COLS / 2 - 3, 1, -1, kWhite)),
      menu_(new ItemList(leftPane_, 2, 4, COLS / 2 - 2, LINES - 7)),
      description_(new TextArea(rightPane_, 2, 4, COLS / 2 - 4, LINES - 7, -1, kLightGrey)) {
  mainArea_->Box();
  mainArea_->HorizontalLine(1, 2, mainArea_->Width() - 2);
  leftFooter_->SetText(Footer::kMenuSelect);
  Log(LOG_INFO, "COLS=%d, LINES=%d", COLS, LINES);
}

void RootWindow::Show() {
  DrawBatch batch;
  Redraw(true);
  const char* version = Text(TextId::kVersionLine);
  int length = static_cast<int>(std::strlen(version));
  statusLine_->Erase();
  statusLine_->PutText(statusLine_->Width() / 2 - length / 2, 0, version);
  Populate();
  Update();
}

void RootWindow::SetLeftTitle(std::string_view text) {
  leftTitle_->SetText(text);
}

void RootWindow::SetRightTitle(std::string_view text) {
  rightTitle_->SetText(text);
}

void RootWindow::SetLeftFooter(std::string_view text) {
  leftFooter_->SetText(text);
}

void RootWindow::SetRightFooter(std::string_view text) {
  rightFooter_->SetText(text);
}

}  // namespace Tulk
