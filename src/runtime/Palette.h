#pragma once
/// The console's palette and the attribute for a pair of colour numbers.
///
/// On a terminal that can change colours, InitColors() redefines yellow
/// (amber), cyan (dark grey), green (light grey), white and red, and creates
/// the 36 pairs of the six colours in use: pair number
/// foreground + COLORS x background + 1. On any other terminal no pairs
/// exist and `monochrome` is set: colours are replaced by standout.
///
/// Pair numbers above 255 (COLORS is 256 on xterm-256color) do not fit in a
/// chtype, so the attribute is carried as attributes plus an extended pair
/// number and applied with the extended-colour calls below.

#include <curses.h>

namespace Tulk {

struct ColorAttribute {
  attr_t attrs = A_NORMAL;
  int pair = 0;

  friend bool operator==(const ColorAttribute&, const ColorAttribute&) = default;
};

/// Redefines the palette and creates the pairs, or sets `monochrome`.
void InitColors();

/// The attribute for drawing `foreground` on `background` (colour numbers
/// of include/ColorNumbers.h). In `monochrome` mode: standout on black or
/// dark grey, no attribute otherwise.
ColorAttribute ColorAttr(int background, int foreground);

/// The pair number ColorAttr() uses for a background and foreground.
int ColorPairNumber(int background, int foreground);

/// Sets the window's background (blank cells and the attribute merged into
/// every cell) to `attribute`, like wbkgd().
void SetWindowBackground(WINDOW* window, ColorAttribute attribute);

/// Makes `attribute` the window's current drawing attribute, like wattrset().
void SetWindowAttribute(WINDOW* window, ColorAttribute attribute);

/// Whether the terminal can change its colours (it could when the console
/// started; F4 on the welcome screen toggles `monochrome` only then).
bool PaletteChangeable();

}  // namespace Tulk
