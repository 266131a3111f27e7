#pragma once
/// The fewest bytes a terminal update could take: a snapshot of the screen
/// before and after a key, and an estimate of the shortest output that
/// turns one into the other.

#include <string>
#include <vector>

#include "TestConsole.h"

namespace TulkBench {

/// Every cell of the console's screen.
struct ScreenSnapshot {
  int rows = 0;
  int cols = 0;
  std::vector<TulkTest::Cell> cells;

  static ScreenSnapshot Take(const TulkTest::TestConsole& console, int rows, int cols);
  const TulkTest::Cell& At(int row, int col) const { return cells[row * cols + col]; }
};

/// The bytes of the shortest update from `before` to `after` under a simple
/// model of a terminal, a lower bound of what a careful screen library
/// sends: the changed cells of each row are grouped into runs (an unchanged
/// gap of up to three cells is cheaper to write again than to jump over);
/// each run costs one cursor address ("ESC [ row ; col H") and the UTF-8
/// bytes of its cells, except that blanks of one look are erased when that
/// is shorter (to the end of the row with "ESC [ K", or by count with
/// "ESC [ n X" and a move over them with "ESC [ n C"); an attribute change
/// ("ESC [ ... m" in its shortest form) is counted only where a cell's
/// look differs from the last one written.
std::size_t FewestBytes(const ScreenSnapshot& before, const ScreenSnapshot& after);

}  // namespace TulkBench
