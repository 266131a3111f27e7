#include "ScreenDiff.h"

namespace TulkBench {
namespace {

constexpr int kGap = 3;

bool Same(const TulkTest::Cell& a, const TulkTest::Cell& b) {
  return a.text == b.text && a.fg == b.fg && a.bg == b.bg && a.bold == b.bold &&
         a.reverse == b.reverse && a.underline == b.underline;
}

bool SameLook(const TulkTest::Cell& a, const TulkTest::Cell& b) {
  return a.fg == b.fg && a.bg == b.bg && a.bold == b.bold && a.reverse == b.reverse &&
         a.underline == b.underline;
}

std::string Colour(int base, int colour) {
  return colour < 8 ? std::to_string(base + colour)
                    : std::to_string(base + 8) + ";5;" + std::to_string(colour);
}

// The shortest attribute change to `cell`'s look: "ESC [ 3f ; 4b [;1] [;7]
// [;4] m" (the eight basic colours in their short form).
std::size_t Attributes(const TulkTest::Cell& cell) {
  std::string parameters = "0";
  if (cell.fg >= 0) {
    parameters += ";" + Colour(30, cell.fg);
  }
  if (cell.bg >= 0) {
    parameters += ";" + Colour(40, cell.bg);
  }
  parameters += std::string(cell.bold ? ";1" : "") + (cell.reverse ? ";7" : "") +
                (cell.underline ? ";4" : "");
  if (parameters.size() > 2) {
    parameters.erase(0, 2);  // a full set of colours needs no reset
  }
  return 3 + parameters.size();
}

std::size_t Address(int row, int col) {
  return ("\x1b[" + std::to_string(row + 1) + ";" + std::to_string(col + 1) + "H").size();
}

}  // namespace

ScreenSnapshot ScreenSnapshot::Take(const TulkTest::TestConsole& console, int rows, int cols) {
  ScreenSnapshot snapshot;
  snapshot.rows = rows;
  snapshot.cols = cols;
  for (int row = 0; row < rows; ++row) {
    for (int col = 0; col < cols; ++col) {
      snapshot.cells.push_back(console.At(row, col));
    }
  }
  return snapshot;
}

std::size_t Digits(int value) {
  return std::to_string(value).size();
}

bool Blank(const TulkTest::Cell& cell) {
  return cell.text.empty() || cell.text == " ";
}

std::size_t FewestBytes(const ScreenSnapshot& before, const ScreenSnapshot& after) {
  std::size_t bytes = 0;
  const TulkTest::Cell* look = nullptr;  // the attributes last written
  auto write = [&](const TulkTest::Cell& cell) {
    if (look == nullptr || !SameLook(cell, *look)) {
      bytes += Attributes(cell);
      look = &cell;
    }
  };
  for (int row = 0; row < after.rows; ++row) {
    int col = 0;
    while (col < after.cols) {
      if (Same(before.At(row, col), after.At(row, col))) {
        ++col;
        continue;
      }
      // A run from `col` to the last changed cell before a longer gap.
      int end = col;
      for (int next = col + 1; next < after.cols && next - end <= kGap + 1; ++next) {
        if (!Same(before.At(row, next), after.At(row, next))) {
          end = next;
        }
      }
      bytes += Address(row, col);
      int cell = col;
      while (cell <= end) {
        const TulkTest::Cell& now = after.At(row, cell);
        // Blanks of one look: erased rather than written, to the end of the
        // row ("ESC [ K") or by count ("ESC [ n X", then "ESC [ n C" on).
        int blanks = cell;
        while (blanks < after.cols && Blank(after.At(row, blanks)) &&
               SameLook(after.At(row, blanks), now)) {
          ++blanks;
        }
        const int count = blanks - cell;
        if (Blank(now) && count > 0) {
          const bool toEnd = blanks == after.cols;
          const std::size_t erase =
              toEnd ? 3 : 3 + Digits(count) + (blanks <= end ? 3 + Digits(count) : 0);
          const int written = std::min(blanks, end + 1) - cell;
          write(now);
          if (erase < static_cast<std::size_t>(written)) {
            bytes += erase;
            cell = toEnd ? end + 1 : std::min(blanks, end + 1);
            continue;
          }
        }
        write(now);
        bytes += now.text.empty() ? 1 : now.text.size();
        ++cell;
      }
      col = end + 1;
    }
  }
  return bytes;
}

}  // namespace TulkBench
