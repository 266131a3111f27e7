#include "toolkit/ScrollBar.h"

namespace Tulk {

ScrollBar::ScrollBar(Window* parent, int column, int row, int height)
    : Window(parent, column, row, 1, height) {
}

int ScrollBar::BlockRowFor(int top, int items, int rows) {
  if (items <= rows) {
    return 0;
  }
  int position = top * 100 / (items - rows);
  return (rows - 1) * position / 100;
}

void ScrollBar::Show(int top, int items, int rows) {
  blockRow_ = BlockRowFor(top, items, rows);
  RepaintContents();
}

void ScrollBar::Hide() {
  blockRow_.reset();
  RepaintContents();
}

void ScrollBar::PaintContents(bool /*active*/) {
  if (!blockRow_ || Curses() == nullptr) {
    return;
  }
  for (int row = 0; row < Height(); ++row) {
    mvwaddwstr(Curses(), row, 0, row == *blockRow_ ? L"\u2588" : L"\u2593");
  }
}

}  // namespace Tulk
