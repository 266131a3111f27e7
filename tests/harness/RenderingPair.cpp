#include "RenderingPair.h"

#include <vterm.h>

#include <cstdio>

namespace TulkTest {
namespace {

VTerm* NewTerminal(int rows, int cols) {
  VTerm* terminal = vterm_new(rows, cols);
  vterm_set_utf8(terminal, 1);
  VTermScreen* screen = vterm_obtain_screen(terminal);
  vterm_screen_enable_altscreen(screen, 1);
  vterm_screen_reset(screen, 1);
  return terminal;
}

bool SameColour(VTermColor a, VTermColor b) {
  return vterm_color_is_equal(&a, &b) != 0;
}

bool SameCell(const VTermScreenCell& a, const VTermScreenCell& b) {
  for (int i = 0; i < VTERM_MAX_CHARS_PER_CELL; ++i) {
    if (a.chars[i] != b.chars[i]) {
      return false;
    }
    if (a.chars[i] == 0) {
      break;
    }
  }
  return a.width == b.width && a.attrs.bold == b.attrs.bold &&
         a.attrs.underline == b.attrs.underline && a.attrs.italic == b.attrs.italic &&
         a.attrs.blink == b.attrs.blink && a.attrs.reverse == b.attrs.reverse &&
         a.attrs.strike == b.attrs.strike && a.attrs.font == b.attrs.font &&
         SameColour(a.fg, b.fg) && SameColour(a.bg, b.bg);
}

std::string Describe(const char* what, int row, int col) {
  char text[96];
  (void)std::snprintf(text, sizeof text, "%s differs at row %d, column %d", what, row, col);
  return text;
}

}  // namespace

RenderingPair::RenderingPair(int rows, int cols)
    : original_(NewTerminal(rows, cols)),
      filtered_(NewTerminal(rows, cols)),
      rows_(rows),
      cols_(cols) {
}

RenderingPair::~RenderingPair() {
  vterm_free(original_);
  vterm_free(filtered_);
}

void RenderingPair::Feed(std::string_view original, std::string_view filtered) {
  vterm_input_write(original_, original.data(), original.size());
  vterm_input_write(filtered_, filtered.data(), filtered.size());
}

std::string RenderingPair::Difference() const {
  VTermScreen* a = vterm_obtain_screen(original_);
  VTermScreen* b = vterm_obtain_screen(filtered_);
  for (int row = 0; row < rows_; ++row) {
    for (int col = 0; col < cols_; ++col) {
      VTermScreenCell ca{};
      VTermScreenCell cb{};
      const VTermPos pos{row, col};
      vterm_screen_get_cell(a, pos, &ca);
      vterm_screen_get_cell(b, pos, &cb);
      if (!SameCell(ca, cb)) {
        return Describe("the cell", row, col);
      }
    }
  }
  VTermState* sa = vterm_obtain_state(original_);
  VTermState* sb = vterm_obtain_state(filtered_);
  VTermPos pa{};
  VTermPos pb{};
  vterm_state_get_cursorpos(sa, &pa);
  vterm_state_get_cursorpos(sb, &pb);
  if (pa.row != pb.row || pa.col != pb.col) {
    return Describe("the cursor", pa.row, pa.col);
  }
  for (VTermAttr attribute : {VTERM_ATTR_BOLD, VTERM_ATTR_UNDERLINE, VTERM_ATTR_ITALIC,
                              VTERM_ATTR_BLINK, VTERM_ATTR_REVERSE, VTERM_ATTR_STRIKE,
                              VTERM_ATTR_FONT, VTERM_ATTR_FOREGROUND, VTERM_ATTR_BACKGROUND}) {
    VTermValue va{};
    VTermValue vb{};
    vterm_state_get_penattr(sa, attribute, &va);
    vterm_state_get_penattr(sb, attribute, &vb);
    const bool same = attribute == VTERM_ATTR_FOREGROUND || attribute == VTERM_ATTR_BACKGROUND
                          ? SameColour(va.color, vb.color)
                          : va.number == vb.number;
    if (!same) {
      return "the attribute " + std::to_string(attribute) + " a character would get differs";
    }
  }
  return {};
}

}  // namespace TulkTest
