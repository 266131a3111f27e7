#include "render/MarkupPainter.h"

#include <gtest/gtest.h>

#include "CursesTestScreen.h"
#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"
#include "runtime/Palette.h"

namespace {

using Tulk::kBlack;
using Tulk::kDarkGrey;
using Tulk::kRed;
using Tulk::kWhite;
using Tulk::kYellow;
using TulkTest::CellAt;
using TulkTest::RowText;

class PainterTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_TRUE(screen_.Valid());
    window_ = newwin(3, 10, 0, 0);
    Tulk::SetWindowBackground(window_, Tulk::ColorAttr(kYellow, kBlack));
    werase(window_);
  }
  void TearDown() override { delwin(window_); }

  void Paint(const char* text, bool active = true) {
    Tulk::PaintMarkup(window_, text, Tulk::PaintStyle{kYellow, kBlack, active}, colors_);
  }
  // Background and foreground of a cell.
  std::pair<int, int> Colors(int row, int col) {
    TulkTest::CellInfo cell = CellAt(window_, row, col);
    return {cell.background, cell.foreground};
  }

  TulkTest::CursesTestScreen screen_;
  Tulk::ColorTable colors_;
  WINDOW* window_ = nullptr;
};

TEST_F(PainterTest, EmptyTextLeavesTheWindowErased) {
  Paint("");
  for (int row = 0; row < 3; ++row) {
    EXPECT_EQ(RowText(window_, row), "          ");
  }
}

TEST_F(PainterTest, ColourTagsSwitchTheForegroundWhileActive) {
  Paint("a{color:red}b{/color}c");
  EXPECT_EQ(RowText(window_, 0), "abc       ");
  EXPECT_EQ(Colors(0, 0), std::make_pair(kYellow, kBlack));
  EXPECT_EQ(Colors(0, 1), std::make_pair(kYellow, kRed));
  EXPECT_EQ(Colors(0, 2), std::make_pair(kYellow, kBlack));
}

TEST_F(PainterTest, BackgroundAndForegroundCombineAndCloseBackToTheWindow) {
  Paint("{bgcolor:white}{color:black}v{/color}{/bgcolor}w{color:red}x");
  EXPECT_EQ(Colors(0, 0), std::make_pair(kWhite, kBlack));
  EXPECT_EQ(Colors(0, 1), std::make_pair(kYellow, kBlack));
  // A later colour applies on the window's background again.
  EXPECT_EQ(Colors(0, 2), std::make_pair(kYellow, kRed));
}

TEST_F(PainterTest, UnknownColourChangesNothingAndCloseStillRestores) {
  Paint("{color:black>}x{/color}y{color:}z{color}q");
  EXPECT_EQ(RowText(window_, 0), "xyzq      ");
  for (int col = 0; col < 4; ++col) {
    EXPECT_EQ(Colors(0, col), std::make_pair(kYellow, kBlack)) << col;
  }
}

TEST_F(PainterTest, DrawnInactiveEverythingIsDimmed) {
  Paint("a{color:red}b{bgcolor:white}c", false);
  for (int col = 0; col < 3; ++col) {
    EXPECT_EQ(Colors(0, col), std::make_pair(kBlack, kDarkGrey)) << col;
  }
}

TEST_F(PainterTest, OtherTagsShowNothingAndTakeNoColumn) {
  Paint("a{zz}b{}c{hostname}d");
  EXPECT_EQ(RowText(window_, 0), "abcd      ");
}

TEST_F(PainterTest, TextBelowTheLastRowIsNotDrawn) {
  Paint("a\nb\nc\nd");
  EXPECT_EQ(RowText(window_, 0), "a         ");
  EXPECT_EQ(RowText(window_, 1), "b         ");
  EXPECT_EQ(RowText(window_, 2), "c         ");
}

TEST_F(PainterTest, LongRunIsCutAtTheRightEdgeAndControlBytesShowAsBlanks) {
  Paint("abc\tdefghijklmn\nxy");
  EXPECT_EQ(RowText(window_, 0), "abc defghi");
  EXPECT_EQ(RowText(window_, 1), "xy        ");
}

TEST_F(PainterTest, UnclosedBraceHidesTheRest) {
  Paint("ab{color:red cd");
  EXPECT_EQ(RowText(window_, 0), "ab        ");
}

TEST_F(PainterTest, MonochromeShowsColourTagsAsStandoutOnDarkBackgrounds) {
  Tulk::monochrome = true;
  Paint("a{bgcolor:black}b{/bgcolor}c");
  EXPECT_FALSE(CellAt(window_, 0, 0).standout);
  EXPECT_TRUE(CellAt(window_, 0, 1).standout);
  EXPECT_FALSE(CellAt(window_, 0, 2).standout);
}

}  // namespace
