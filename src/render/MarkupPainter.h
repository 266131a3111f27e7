#pragma once
/// The paint pass of the markup renderer: writes laid-out text
/// (MarkupLayout.h) into a curses window and switches colours at the colour
/// tags.
///
/// Colour tags: "{color:NAME}" and "{bgcolor:NAME}" change the foreground
/// or background for the text that follows; "{/color}" and "{/bgcolor}"
/// return to the window's own colours. Colours are applied only while the
/// window is drawn active; drawn inactive, all text shows in the dimmed
/// look (dark grey on black). Unknown names and every other tag change
/// nothing and show nothing.
///
/// Text goes out one run of plain bytes at a time, each written at its row
/// and column. A newline moves to the next row; text below the window's
/// last row is not drawn. Decisions beyond those rules: a run is cut at the
/// window's right edge (it never wraps onto the next row), and control
/// bytes (below 0x20, and 0x7F) are shown as blanks so that one byte stays
/// one column.

#include <curses.h>

#include <string_view>

#include "render/ColorTable.h"

namespace Tulk {

/// How the window is drawn: its own colours and whether it is active.
struct PaintStyle {
  int background = 0;
  int foreground = 7;
  bool active = true;
};

/// Paints `laidOut` into `window` from its top-left corner. The window is
/// not erased first.
void PaintMarkup(WINDOW* window, std::string_view laidOut, const PaintStyle& style,
                 const ColorTable& colors);

}  // namespace Tulk
