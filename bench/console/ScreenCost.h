#pragma once
/// The fewest bytes that change a terminal's screen from one picture to
/// another: the yardstick the console's output is measured against.
///
/// Method. Both pictures are read from the emulated terminal (libvterm), so
/// they are what the operator sees. A cell counts as changed when it looks
/// different: another character, or other visible colours and attributes
/// (reverse video is resolved into the colours it shows; a blank shows
/// only its background and underline). An encoder that uses only the
/// controls of the terminal's terminfo description (TerminalProfile.h), as
/// a program driving the terminal through its description must, then pays
/// per changed cell, in screen order, for
/// - getting there: the cheapest of an absolute move, a move to a column
///   or row, relative moves, carriage return and line feed, or writing the
///   unchanged cells in between;
/// - the attributes: only the colour that changed (setaf or setab), the
///   attributes switched on one by one, or a reset (sgr0) or "sgr" and
///   what is needed after it, whichever is shortest; where the
///   description's controls are ECMA-48 SGR and its own "sgr" combines
///   parameters, also all the changes in one SGR ("\e[37;42m"), or a reset
///   and what is needed after it in one ("\e[0;7;37m", a lone "\e[m");
/// - the character: one byte in ASCII; a line character one byte in the
///   terminal's line-drawing set, where it has one and entering and
///   leaving the set pays off, its UTF-8 bytes otherwise;
/// - runs: a repeated character with "rep", blanks with "ech", the rest of
///   a row or the whole screen with an erase when the erased colour is the
///   one wanted (the current background where the terminal has bce).
/// The encoder starts from the cursor's place with the attributes reset,
/// and it ends every update with the attributes reset and the line-drawing
/// set left, as curses does: whatever else reaches the line between two
/// updates (a kernel message on a serial console) must come out legible.
/// The cursor then goes to its place when it is shown, and its visibility
/// changes with the terminal's own controls. For a first screen the set-up
/// the console cannot do without is added (TerminalProfile::setup).
///
/// The encoder decides greedily cell by cell, so a cleverer one might
/// shave a little more; the ratios it gives are therefore, if anything,
/// slightly kind to the console.

#include <vector>

#include "TerminalProfile.h"
#include "VirtualTerminal.h"

namespace TulkBench {

/// A picture of the terminal: its cells row by row and the cursor.
struct Screen {
  int rows = 0;
  int cols = 0;
  std::vector<TulkTest::Cell> cells;
  TulkTest::CursorState cursor;

  const TulkTest::Cell& At(int row, int col) const {
    return cells[static_cast<std::size_t>(row * cols + col)];
  }
  TulkTest::Cell& At(int row, int col) { return cells[static_cast<std::size_t>(row * cols + col)]; }
};

/// A terminal as it starts: blank in the default colours, the cursor
/// shown at the top left.
Screen BlankScreen(int rows, int cols);

/// The two cells look the same to the operator.
bool LooksSame(const TulkTest::Cell& a, const TulkTest::Cell& b);

/// The two pictures look the same (every cell, and the cursor where it is
/// shown).
bool SameScreen(const Screen& a, const Screen& b);

/// The fewest bytes that turn `before` into `after` on `profile`'s
/// terminal (see the method above). The set-up of a first screen is not
/// included.
int FewestBytes(const Screen& before, const Screen& after, const TerminalProfile& profile);

}  // namespace TulkBench
