#pragma once
// A curses screen for unit tests: a terminal that can change colours (or a
// monochrome one), sized as asked, writing to /dev/null, with the console's
// palette. Cells are read back from windows or from the terminal's image
// (curscr) after an update.

#include <curses.h>
#include <gtest/gtest.h>

#include <clocale>
#include <cstdio>
#include <string>

#include "include/ProcessFlags.h"
#include "runtime/Palette.h"

namespace TulkTest {

struct CellInfo {
  std::string text;
  int background = -1;
  int foreground = -1;
  bool standout = false;
};

class CursesTestScreen {
 public:
  explicit CursesTestScreen(int cols = 80, int rows = 25, const char* term = "xterm-256color") {
    // The block characters of the scroll bar need a UTF-8 locale.
    std::setlocale(LC_ALL, "C.UTF-8");
    out_ = std::fopen("/dev/null", "w");
    in_ = std::fopen("/dev/null", "r");
    screen_ = newterm(term, out_, in_);
    set_term(screen_);
    resizeterm(rows, cols);
    start_color();
    Tulk::monochrome = false;
    Tulk::InitColors();
  }
  ~CursesTestScreen() {
    endwin();
    delscreen(screen_);
    std::fclose(out_);
    std::fclose(in_);
    Tulk::monochrome = false;
  }
  CursesTestScreen(const CursesTestScreen&) = delete;
  CursesTestScreen& operator=(const CursesTestScreen&) = delete;

  bool Valid() const { return screen_ != nullptr; }

 private:
  FILE* out_;
  FILE* in_;
  SCREEN* screen_;
};

inline CellInfo CellAt(WINDOW* window, int row, int col) {
  cchar_t cell;
  CellInfo info;
  if (mvwin_wch(window, row, col, &cell) == ERR) {
    return info;
  }
  wchar_t text[CCHARW_MAX + 1] = {};
  attr_t attrs = 0;
  short shortPair = 0;
  int pair = 0;
  getcchar(&cell, text, &attrs, &shortPair, &pair);
  char bytes[16] = {};
  std::snprintf(bytes, sizeof bytes, "%lc", static_cast<wint_t>(text[0]));
  info.text = bytes;
  info.standout = (attrs & A_STANDOUT) != 0;
  if (pair > 0) {
    info.background = (pair - 1) / COLORS;
    info.foreground = (pair - 1) % COLORS;
  }
  return info;
}

/// The characters of a window row (one byte per ASCII cell).
inline std::string RowText(WINDOW* window, int row) {
  std::string text;
  for (int col = 0; col < getmaxx(window); ++col) {
    text += CellAt(window, row, col).text;
  }
  return text;
}

}  // namespace TulkTest
