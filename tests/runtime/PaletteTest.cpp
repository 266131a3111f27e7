#include "runtime/Palette.h"

#include <curses.h>
#include <gtest/gtest.h>

#include <cstdio>

#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"

namespace {

// A curses screen on a terminal that can change colours, writing nowhere.
class PaletteTest : public ::testing::Test {
 protected:
  void SetUp() override {
    out_ = std::fopen("/dev/null", "w");
    in_ = std::fopen("/dev/null", "r");
    screen_ = newterm("xterm-256color", out_, in_);
    ASSERT_NE(screen_, nullptr);
    start_color();
    Tulk::monochrome = false;
  }
  void TearDown() override {
    endwin();
    delscreen(screen_);
    std::fclose(out_);
    std::fclose(in_);
    Tulk::monochrome = false;
  }

  FILE* out_ = nullptr;
  FILE* in_ = nullptr;
  SCREEN* screen_ = nullptr;
};

TEST_F(PaletteTest, InitColorsCreatesThirtySixPairsWithTheRedefinedPalette) {
  Tulk::InitColors();
  ASSERT_FALSE(Tulk::monochrome);
  const int colors[] = {Tulk::kWhite,     Tulk::kBlack,    Tulk::kYellow,
                        Tulk::kLightGrey, Tulk::kDarkGrey, Tulk::kRed};
  for (int background : colors) {
    for (int foreground : colors) {
      int fg = -1;
      int bg = -1;
      extended_pair_content(Tulk::ColorPairNumber(background, foreground), &fg, &bg);
      EXPECT_EQ(fg, foreground);
      EXPECT_EQ(bg, background);
    }
  }
  int r = 0, g = 0, b = 0;
  extended_color_content(Tulk::kYellow, &r, &g, &b);
  EXPECT_EQ(r, 1000);
  EXPECT_EQ(b, 0);
  EXPECT_NEAR(g, 800, 4);
  extended_color_content(Tulk::kDarkGrey, &r, &g, &b);
  EXPECT_NEAR(r, 334, 4);
}

TEST_F(PaletteTest, MonochromeUsesStandoutOnlyOnBlackAndDarkGrey) {
  Tulk::monochrome = true;
  EXPECT_EQ(Tulk::ColorAttr(Tulk::kBlack, Tulk::kWhite), (Tulk::ColorAttribute{A_STANDOUT, 0}));
  EXPECT_EQ(Tulk::ColorAttr(Tulk::kDarkGrey, Tulk::kWhite), (Tulk::ColorAttribute{A_STANDOUT, 0}));
  EXPECT_EQ(Tulk::ColorAttr(Tulk::kYellow, Tulk::kBlack), (Tulk::ColorAttribute{A_NORMAL, 0}));
  EXPECT_EQ(Tulk::ColorAttr(Tulk::kLightGrey, Tulk::kWhite), (Tulk::ColorAttribute{A_NORMAL, 0}));
}

}  // namespace
