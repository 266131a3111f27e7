#include "VirtualTerminal.h"

#include <vterm.h>

#include <cstdio>

namespace TulkTest {

struct VirtualTerminalCallbacks {
  static void Output(const char* bytes, size_t length, void* user) {
    static_cast<VirtualTerminal*>(user)->replies_.append(bytes, length);
  }
  static int TermProp(VTermProp prop, VTermValue* value, void* user) {
    if (prop == VTERM_PROP_CURSORVISIBLE) {
      static_cast<VirtualTerminal*>(user)->cursorVisible_ = value->boolean != 0;
    }
    return 1;
  }
};

namespace {

std::string Utf8(uint32_t codepoint) {
  std::string out;
  if (codepoint < 0x80) {
    out += static_cast<char>(codepoint);
  } else if (codepoint < 0x800) {
    out += static_cast<char>(0xC0 | (codepoint >> 6));
    out += static_cast<char>(0x80 | (codepoint & 0x3F));
  } else if (codepoint < 0x10000) {
    out += static_cast<char>(0xE0 | (codepoint >> 12));
    out += static_cast<char>(0x80 | ((codepoint >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (codepoint & 0x3F));
  } else {
    out += static_cast<char>(0xF0 | (codepoint >> 18));
    out += static_cast<char>(0x80 | ((codepoint >> 12) & 0x3F));
    out += static_cast<char>(0x80 | ((codepoint >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (codepoint & 0x3F));
  }
  return out;
}

int ColorIndex(const VTermColor& color, bool foreground) {
  if (foreground ? VTERM_COLOR_IS_DEFAULT_FG(&color) : VTERM_COLOR_IS_DEFAULT_BG(&color)) {
    return -1;
  }
  if (VTERM_COLOR_IS_INDEXED(&color)) {
    return color.indexed.idx;
  }
  return -2;  // a direct RGB colour; the console never sends one
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

const VTermScreenCallbacks kScreenCallbacks = {
    nullptr, nullptr, nullptr, &VirtualTerminalCallbacks::TermProp,
    nullptr, nullptr, nullptr, nullptr,
};

}  // namespace

VirtualTerminal::VirtualTerminal(int rows, int cols)
    : vt_(vterm_new(rows, cols)), screen_(nullptr), rows_(rows), cols_(cols) {
  vterm_set_utf8(vt_, 1);
  vterm_output_set_callback(vt_, &VirtualTerminalCallbacks::Output, this);
  screen_ = vterm_obtain_screen(vt_);
  vterm_screen_set_callbacks(screen_, &kScreenCallbacks, this);
  vterm_screen_enable_altscreen(screen_, 1);
  vterm_screen_reset(screen_, 1);
}

VirtualTerminal::~VirtualTerminal() {
  vterm_free(vt_);
}

void VirtualTerminal::Write(std::string_view bytes) {
  vterm_input_write(vt_, bytes.data(), bytes.size());
  vterm_screen_flush_damage(screen_);
}

void VirtualTerminal::Resize(int rows, int cols) {
  rows_ = rows;
  cols_ = cols;
  vterm_set_size(vt_, rows, cols);
}

Cell VirtualTerminal::At(int row, int col) const {
  Cell cell;
  VTermScreenCell raw{};
  VTermPos pos{row, col};
  if (row < 0 || col < 0 || row >= rows_ || col >= cols_ ||
      vterm_screen_get_cell(screen_, pos, &raw) == 0) {
    cell.text = " ";
    return cell;
  }
  if (raw.chars[0] == 0) {
    cell.text = " ";
  } else {
    for (int i = 0; i < VTERM_MAX_CHARS_PER_CELL && raw.chars[i] != 0; ++i) {
      cell.text += Utf8(raw.chars[i]);
    }
  }
  cell.fg = ColorIndex(raw.fg, true);
  cell.bg = ColorIndex(raw.bg, false);
  cell.bold = raw.attrs.bold != 0;
  cell.reverse = raw.attrs.reverse != 0;
  cell.underline = raw.attrs.underline != 0;
  return cell;
}

std::string VirtualTerminal::Row(int row) const {
  std::string text;
  for (int col = 0; col < cols_; ++col) {
    text += At(row, col).text;
  }
  return text;
}

CursorState VirtualTerminal::Cursor() const {
  VTermPos pos{};
  vterm_state_get_cursorpos(vterm_obtain_state(vt_), &pos);
  return CursorState{pos.row, pos.col, cursorVisible_};
}

std::string VirtualTerminal::TakeReplies() {
  std::string replies;
  replies.swap(replies_);
  return replies;
}

std::string VirtualTerminal::Difference(const VirtualTerminal& other) const {
  if (rows_ != other.rows_ || cols_ != other.cols_) {
    return "the size differs";
  }
  for (int row = 0; row < rows_; ++row) {
    for (int col = 0; col < cols_; ++col) {
      VTermScreenCell ca{};
      VTermScreenCell cb{};
      const VTermPos pos{row, col};
      vterm_screen_get_cell(screen_, pos, &ca);
      vterm_screen_get_cell(other.screen_, pos, &cb);
      if (!SameCell(ca, cb)) {
        return Describe("the cell", row, col);
      }
    }
  }
  VTermState* sa = vterm_obtain_state(vt_);
  VTermState* sb = vterm_obtain_state(other.vt_);
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
