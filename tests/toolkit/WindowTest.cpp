#include <curses.h>
#include <gtest/gtest.h>

#include <memory>

#include "../render/CursesTestScreen.h"
#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"
#include "runtime/ScreenFlush.h"
#include "toolkit/Dialog.h"
#include "toolkit/ItemList.h"
#include "toolkit/RootWindow.h"
#include "toolkit/TextArea.h"

namespace {

using namespace Tulk;
using TulkTest::CellAt;

// Sends the drawing to the (null) terminal, as the console does before it
// waits, so that the terminal's image (curscr) shows it.
void Send() {
  FlushScreen();
}

std::pair<int, int> ScreenColors(int row, int col) {
  TulkTest::CellInfo cell = CellAt(curscr, row, col);
  return {cell.background, cell.foreground};
}

// The line-drawing character on the screen. A cell of the terminal's
// line-drawing set holds the set's key ("l" for the upper left corner);
// curses' own table gives its Unicode character.
std::string LineAt(int row, int col) {
  cchar_t cell;
  wchar_t text[CCHARW_MAX + 1] = {};
  attr_t attrs = 0;
  short pair = 0;
  if (mvwin_wch(curscr, row, col, &cell) == ERR ||
      getcchar(&cell, text, &attrs, &pair, nullptr) == ERR) {
    return {};
  }
  if ((attrs & A_ALTCHARSET) != 0 && text[0] < 128) {
    getcchar(NCURSES_WACS(text[0]), text, &attrs, &pair, nullptr);
  }
  char bytes[8] = {};
  std::snprintf(bytes, sizeof bytes, "%lc", static_cast<wint_t>(text[0]));
  return bytes;
}

class TestMenu : public RootWindow {
 public:
  TestMenu() : RootWindow(nullptr) {}
  void Populate() override { SetLeftTitle("Menu"); }
  int Run() override { return 0; }
};

class WindowTest : public ::testing::Test {
 protected:
  TulkTest::CursesTestScreen screen_{80, 25};
};

TEST_F(WindowTest, LowDialogIsCentredAndHasNoContentWindow) {
  Dialog dialog(nullptr, 60, 9, 6);
  EXPECT_EQ(dialog.Column(), 10);
  EXPECT_EQ(dialog.Row(), 8);
  EXPECT_EQ(dialog.Body()->Row(), 14);
  EXPECT_EQ(dialog.Body()->Height(), 3);
  EXPECT_EQ(dialog.Content(), nullptr);
  EXPECT_EQ(dialog.TitleArea()->Column(), 13);
  EXPECT_EQ(dialog.TitleArea()->Row(), 9);
  EXPECT_EQ(dialog.HeaderText()->Height(), 2);
  EXPECT_EQ(dialog.FooterArea()->Row(), 15);
  EXPECT_EQ(dialog.FooterArea()->Width(), 56);
}

TEST_F(WindowTest, TallerDialogHasAContentWindowInsideTheBody) {
  Dialog dialog(nullptr, 70, 15, 5);
  ASSERT_NE(dialog.Content(), nullptr);
  EXPECT_EQ(dialog.Content()->Column(), 7);
  EXPECT_EQ(dialog.Content()->Row(), 5 + 5 + 1);
  EXPECT_EQ(dialog.Content()->Width(), 66);
  EXPECT_EQ(dialog.Content()->Height(), 6);
}

TEST_F(WindowTest, OversizedDialogIsCutToTheScreen) {
  Dialog dialog(nullptr, 100, 40, 6);
  EXPECT_EQ(dialog.Column(), 0);
  EXPECT_EQ(dialog.Width(), 80);
  EXPECT_EQ(dialog.Height(), 25);
  dialog.Redraw(true);
}

TEST_F(WindowTest, DialogDrawsItsPartsInTheirColoursAndDimsAsAWhole) {
  Dialog dialog(nullptr, 60, 13, 6);
  dialog.SetTitle("Title");
  dialog.SetFooter(Footer::kOk);
  dialog.Redraw(true);
  Send();
  EXPECT_EQ(ScreenColors(6, 10), std::make_pair(kBlack, kWhite));  // box corner
  EXPECT_EQ(LineAt(6, 10), "\u250c");
  EXPECT_EQ(ScreenColors(7, 13), std::make_pair(kDarkGrey, kWhite));  // title
  EXPECT_EQ(CellAt(curscr, 7, 13).text, "T");
  EXPECT_EQ(ScreenColors(13, 11), std::make_pair(kYellow, kWhite));     // body
  EXPECT_EQ(ScreenColors(13, 13), std::make_pair(kYellow, kDarkGrey));  // content
  // The footer ends at the body's inner edge: "<Enter>" black, "OK" dark grey.
  EXPECT_EQ(CellAt(curscr, 17, 58).text, "<");
  EXPECT_EQ(ScreenColors(17, 58), std::make_pair(kYellow, kBlack));
  EXPECT_EQ(CellAt(curscr, 17, 67).text, "K");
  EXPECT_EQ(ScreenColors(17, 67), std::make_pair(kYellow, kDarkGrey));

  dialog.Redraw(false);
  Send();
  for (auto [row, col] : {std::pair{6, 10}, {7, 13}, {13, 11}, {13, 13}, {17, 58}, {17, 67}}) {
    EXPECT_EQ(ScreenColors(row, col), std::make_pair(kBlack, kDarkGrey)) << row << "," << col;
  }
  dialog.Redraw(true);
  Send();
  EXPECT_EQ(ScreenColors(6, 10), std::make_pair(kBlack, kWhite));
  EXPECT_EQ(ScreenColors(7, 13), std::make_pair(kDarkGrey, kWhite));
  EXPECT_EQ(ScreenColors(13, 13), std::make_pair(kYellow, kDarkGrey));
  EXPECT_EQ(ScreenColors(17, 58), std::make_pair(kYellow, kBlack));
}

TEST_F(WindowTest, MonochromeDimsWithStandoutAndShowsTheBodyPlain) {
  monochrome = true;
  Dialog dialog(nullptr, 60, 13, 6);
  dialog.Redraw(true);
  Send();
  EXPECT_TRUE(CellAt(curscr, 7, 13).standout);    // header on dark grey
  EXPECT_FALSE(CellAt(curscr, 13, 11).standout);  // body on yellow
  dialog.Redraw(false);
  Send();
  EXPECT_TRUE(CellAt(curscr, 13, 11).standout);
  dialog.Redraw(true);
  Send();
  EXPECT_FALSE(CellAt(curscr, 13, 11).standout);
  EXPECT_FALSE(CellAt(curscr, 13, 13).standout);
}

TEST_F(WindowTest, TopLevelWindowKeepsTheCursorWhileDimmed) {
  Dialog dialog(nullptr, 60, 13, 6);
  dialog.Redraw(true);
  EXPECT_FALSE(Window::CursorVisible());
  Window::ShowCursor(true);
  dialog.Body()->MoveCursor(5, 2);
  dialog.Redraw(false);
  EXPECT_FALSE(Window::CursorVisible());
  dialog.Redraw(true);
  Send();
  EXPECT_TRUE(Window::CursorVisible());
  EXPECT_EQ(getcury(curscr), 6 + 6 + 2);
  EXPECT_EQ(getcurx(curscr), 10 + 5);
  // Drawn active once more, it keeps the cursor it shows.
  dialog.Redraw(true);
  EXPECT_TRUE(Window::CursorVisible());
  Window::ShowCursor(false);
}

TEST_F(WindowTest, RootWindowLaysOutItsPanesAndShowsTheVersionLine) {
  TestMenu menu;
  EXPECT_EQ(menu.LeftPane()->Width(), 40);
  EXPECT_EQ(menu.RightPane()->Column(), 40);
  EXPECT_EQ(menu.MainArea()->Height(), 24);
  EXPECT_EQ(menu.StatusLine()->Row(), 24);
  EXPECT_EQ(menu.Menu().Column(), 2);
  EXPECT_EQ(menu.Menu().Row(), 4);
  EXPECT_EQ(menu.Menu().Width(), 38);
  EXPECT_EQ(menu.Menu().Height(), 18);
  EXPECT_EQ(menu.Description().Column(), 42);
  EXPECT_EQ(menu.Description().Width(), 36);
  EXPECT_EQ(menu.Description().Height(), 18);

  menu.Show();
  Send();
  EXPECT_EQ(LineAt(0, 0), "\u250c");
  EXPECT_EQ(ScreenColors(0, 0), std::make_pair(kLightGrey, kWhite));
  EXPECT_EQ(LineAt(2, 1), "\u2500");  // the line on row 2
  EXPECT_EQ(LineAt(2, 78), "\u2500");
  EXPECT_EQ(CellAt(curscr, 1, 3).text, "M");
  EXPECT_EQ(ScreenColors(1, 3), std::make_pair(kYellow, kBlack));
  EXPECT_EQ(ScreenColors(5, 45), std::make_pair(kDarkGrey, kLightGrey));
  EXPECT_EQ(ScreenColors(24, 0), std::make_pair(kBlack, kLightGrey));
  // Left footer: the key in black, its action in dark grey.
  EXPECT_EQ(CellAt(curscr, 22, 2).text, "<");
  EXPECT_EQ(ScreenColors(22, 2), std::make_pair(kYellow, kBlack));
  EXPECT_EQ(ScreenColors(22, 13), std::make_pair(kYellow, kDarkGrey));
}

}  // namespace
