#include <gtest/gtest.h>

#include <functional>
#include <string>

#include "ScreenCost.h"

namespace TulkBench {
namespace {

using TulkTest::Cell;

// A VT100-class terminal: monochrome, attributes off only by a reset,
// SO/SI around the line-drawing set.
TerminalProfile Vt100() {
  TerminalProfile profile;
  profile.term = "vt-like";
  profile.capabilities = {{"cup", "\x1b[%i%p1%d;%p2%dH"},
                          {"home", "\x1b[H"},
                          {"cuf", "\x1b[%p1%dC"},
                          {"cuf1", "\x1b[C"},
                          {"cub1", "\b"},
                          {"cr", "\r"},
                          {"cud1", "\n"},
                          {"el", "\x1b[K"},
                          {"ed", "\x1b[J"},
                          {"sgr0", "\x1b[m"},
                          {"rev", "\x1b[7m"},
                          {"bold", "\x1b[1m"},
                          {"smacs", "\x0e"},
                          {"rmacs", "\x0f"}};
  profile.lineSetKeys = "jklmqx";
  return profile;
}

// An xterm-class terminal: colours, bce, repeat, erase characters, moves to
// a column or a row.
TerminalProfile Xterm() {
  TerminalProfile profile = Vt100();
  profile.term = "xterm-like";
  profile.colours = true;
  profile.bce = true;
  profile.capabilities.insert({{"hpa", "\x1b[%i%p1%dG"},
                               {"vpa", "\x1b[%i%p1%dd"},
                               {"ech", "\x1b[%p1%dX"},
                               {"rep", "%p1%c\x1b[%p2%{1}%-%db"},
                               {"setaf", "\x1b[3%p1%dm"},
                               {"setab", "\x1b[4%p1%dm"},
                               {"op", "\x1b[39;49m"},
                               {"cnorm", "\x1b[?25h"},
                               {"civis", "\x1b[?25l"}});
  profile.capabilities["smacs"] = "\x1b(0";
  profile.capabilities["rmacs"] = "\x1b(B";
  return profile;
}

// The same with several SGR parameters in one control.
TerminalProfile CombiningXterm() {
  TerminalProfile profile = Xterm();
  profile.combinedSgr = true;
  for (int colour = 0; colour < 8; ++colour) {
    profile.foregroundParameters[colour] = "3" + std::to_string(colour);
    profile.backgroundParameters[colour] = "4" + std::to_string(colour);
  }
  profile.defaultColourParameters = true;
  return profile;
}

Screen Hidden(int rows, int cols) {
  Screen screen = BlankScreen(rows, cols);
  screen.cursor.visible = false;
  return screen;
}

void Write(Screen& screen, int row, int col, const std::string& text, Cell look = Cell{}) {
  for (std::size_t i = 0; i < text.size(); ++i) {
    look.text = std::string(1, text[i]);
    screen.At(row, col + static_cast<int>(i)) = look;
  }
}

struct CostCase {
  const char* name;
  TerminalProfile profile;
  std::function<void(Screen&)> change;
  int bytes;
};

TEST(ScreenCostTest, FewestBytesOfTypicalChanges) {
  const std::string line = "\u2500";
  const CostCase cases[] = {
      {"nothing changes", Vt100(), [](Screen&) {}, 0},
      // ESC [ 2 ; 6 H, then the character.
      {"one character elsewhere", Vt100(), [](Screen& s) { Write(s, 1, 5, "a"); }, 7},
      // SO, ten lines, SI.
      {"a line in the line-drawing set", Vt100(),
       [&](Screen& s) {
         for (int col = 0; col < 10; ++col) {
           s.At(0, col).text = line;
         }
       },
       12},
      // Without the set every line character is three bytes of UTF-8.
      {"a line without a line-drawing set",
       [] {
         TerminalProfile profile = Vt100();
         profile.lineSetKeys.clear();
         return profile;
       }(),
       [&](Screen& s) {
         for (int col = 0; col < 10; ++col) {
           s.At(0, col).text = line;
         }
       },
       30},
      // "x", then ESC [ 9 b.
      {"a repeated character", Xterm(), [](Screen& s) { Write(s, 0, 0, "xxxxxxxxxx"); }, 5},
      // ESC [ 7 m a, then ESC [ m b: a VT100 can only reset.
      {"reverse, then normal", Vt100(),
       [](Screen& s) {
         Write(s, 0, 0, "a", Cell{"", -1, -1, false, true});
         Write(s, 0, 1, "b");
       },
       9},
      // ESC [ 4 3 m, ESC [ J: one erase paints the whole screen; ESC [ m
      // resets the attributes at the end.
      {"a coloured screen", Xterm(),
       [](Screen& s) {
         for (Cell& cell : s.cells) {
           cell.bg = 3;
         }
       },
       11},
      // ESC [ 3 7 m ESC [ 4 2 m a, then ESC [ m at the end ...
      {"two colours, one by one", Xterm(),
       [](Screen& s) {
         Write(s, 0, 0, "a", Cell{"", 7, 2});
       },
       14},
      // ... or ESC [ 3 7 ; 4 2 m a ESC [ m where SGR combines.
      {"two colours in one control", CombiningXterm(),
       [](Screen& s) {
         Write(s, 0, 0, "a", Cell{"", 7, 2});
       },
       12},
      // ESC [ 3 ; 4 H, then the cursor shown.
      {"the cursor shown", Xterm(),
       [](Screen& s) {
         s.cursor = TulkTest::CursorState{2, 3, true};
       },
       12},
  };
  for (const CostCase& test : cases) {
    Screen before = Hidden(3, 10);
    Screen after = before;
    test.change(after);
    EXPECT_EQ(FewestBytes(before, after, test.profile), test.bytes) << test.name;
  }
}

TEST(ScreenCostTest, OnlyChangedCellsArePaid) {
  // A character erased in front of blanks that stay: one blank is written,
  // not the whole run of equal blanks behind it.
  Screen before = Hidden(3, 10);
  Write(before, 0, 0, "a");
  Screen after = Hidden(3, 10);
  EXPECT_EQ(FewestBytes(before, after, Vt100()), 1);

  // Two unchanged characters between changes are cheaper to write again
  // than to skip (ESC [ 2 C).
  Write(before, 0, 0, "abcd");
  Write(after, 0, 0, "xbcy");
  EXPECT_EQ(FewestBytes(before, after, Vt100()), 4);
}

TEST(ScreenCostTest, CellsLookTheSameByWhatTheyShow) {
  struct LookCase {
    const char* name;
    Cell a;
    Cell b;
    bool same;
  };
  const LookCase cases[] = {
      {"reverse video shows swapped colours", Cell{"a", 7, 0, false, true},
       Cell{"a", 0, 7, false, false}, true},
      {"a blank shows only its background", Cell{" ", 7, 3}, Cell{" ", 0, 3}, true},
      {"an erased cell is a blank", Cell{"", -1, 3}, Cell{" ", 2, 3}, true},
      {"another background", Cell{" ", 7, 3}, Cell{" ", 7, 6}, false},
      {"a character shows its colour", Cell{"a", 7, 3}, Cell{"a", 0, 3}, false},
      {"another character", Cell{"a", 7, 3}, Cell{"b", 7, 3}, false},
  };
  for (const LookCase& test : cases) {
    EXPECT_EQ(LooksSame(test.a, test.b), test.same) << test.name;
  }
}

TEST(ScreenCostTest, ProfilesComeFromTheTerminalDescription) {
  const TerminalProfile vt102 = ReadTerminalProfile("vt102");
  EXPECT_FALSE(vt102.colours);
  EXPECT_FALSE(vt102.bce);
  EXPECT_NE(vt102.lineSetKeys.find('q'), std::string::npos);
  EXPECT_EQ(vt102.Cost("smacs"), 1);      // SO, without its padding
  EXPECT_EQ(vt102.Cost("cup", 1, 5), 6);  // ESC [ 2 ; 6 H
  EXPECT_EQ(vt102.Cost("cud1"), 2);       // a line feed goes out as CR LF

  const TerminalProfile xterm = ReadTerminalProfile("xterm-256color");
  EXPECT_TRUE(xterm.colours);
  EXPECT_TRUE(xterm.bce);
  EXPECT_EQ(xterm.Cost("rep", 'x', 10), 5);  // x ESC [ 9 b
  EXPECT_EQ(xterm.Cost("setab", 6), 5);      // ESC [ 4 6 m
  EXPECT_NE(xterm.lineSetKeys.find('x'), std::string::npos);
}

}  // namespace
}  // namespace TulkBench
