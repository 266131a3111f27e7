#include "toolkit/Window.h"

#include <algorithm>
#include <string>

#include "include/ColorNumbers.h"
#include "render/TerminalText.h"
#include "runtime/Palette.h"
#include "runtime/ScreenFlush.h"

namespace Tulk {
namespace {

// A character of the terminal's line-drawing set, by its key ("q" the
// horizontal line, "l", "k", "m", "j" the corners), with the colours of
// `attribute`. Curses sends it in the terminal's line-drawing set where the
// description has one, and as the Unicode line character where it has
// none. (The WACS_ characters go out as three bytes of UTF-8 in a UTF-8
// locale, and the narrow ACS_ ones keep only 8 bits of the colour pair,
// which reaches 1800 here.)
cchar_t LineSetCell(char key, const ColorAttribute& attribute) {
  const wchar_t text[] = {static_cast<wchar_t>(key), L'\0'};
  int pair = attribute.pair;
  cchar_t cell{};
  setcchar(&cell, text, attribute.attrs | A_ALTCHARSET, static_cast<short>(pair), &pair);
  return cell;
}

// A Unicode character with the colours of `attribute`.
cchar_t UnicodeCell(wchar_t character, const ColorAttribute& attribute) {
  const wchar_t text[] = {character, L'\0'};
  int pair = attribute.pair;
  cchar_t cell{};
  setcchar(&cell, text, attribute.attrs, static_cast<short>(pair), &pair);
  return cell;
}

// Cuts [start, start + length) to [low, high); returns false when empty.
bool Clip(int& start, int& length, int low, int high) {
  if (start < low) {
    length -= low - start;
    start = low;
  }
  length = std::min(length, high - start);
  return length > 0;
}

}  // namespace

Window::DrawBatch::DrawBatch() = default;

Window::Window(int column, int row, int width, int height, int background, int foreground)
    : background_(background), foreground_(foreground) {
  if (Clip(column, width, 0, COLS) && Clip(row, height, 0, LINES)) {
    column_ = column;
    row_ = row;
    width_ = width;
    height_ = height;
    Create(newwin(height, width, row, column));
  }
}

Window::Window(Window* parent, int column, int row, int width, int height, int background,
               int foreground)
    : parent_(parent),
      background_(background == -1 ? parent->background_ : background),
      foreground_(foreground == -1 ? parent->foreground_ : foreground) {
  parent->children_.push_back(this);
  column += parent->column_;
  row += parent->row_;
  if (parent->window_ != nullptr &&
      Clip(column, width, parent->column_, parent->column_ + parent->width_) &&
      Clip(row, height, parent->row_, parent->row_ + parent->height_)) {
    column_ = column;
    row_ = row;
    width_ = width;
    height_ = height;
    Create(subwin(parent->window_, height, width, row, column));
  }
}

void Window::Create(WINDOW* window) {
  window_ = window;
  if (window_ == nullptr) {
    width_ = 0;
    height_ = 0;
    return;
  }
  // Curses clears the whole terminal before it first draws a window of
  // the screen's full size; the cells that really change are enough.
  clearok(window_, FALSE);
  ApplyBackground(true);
  werase(window_);
}

Window::~Window() {
  if (parent_ != nullptr) {
    auto& siblings = parent_->children_;
    siblings.erase(std::remove(siblings.begin(), siblings.end(), this), siblings.end());
  }
  std::vector<Window*> children;
  children.swap(children_);
  for (Window* child : children) {
    child->parent_ = nullptr;
    delete child;
  }
  if (window_ != nullptr) {
    delwin(window_);
  }
}

void Window::ApplyBackground(bool active) {
  if (window_ == nullptr) {
    return;
  }
  ColorAttribute attribute =
      active ? ColorAttr(background_, foreground_) : ColorAttr(kBlack, kDarkGrey);
  SetWindowBackground(window_, attribute);
  SetWindowAttribute(window_, attribute);
}

void Window::Redraw(bool active) {
  DropTypeaheadAtFlush();
  // The cursor is handed over only when the window changes state: a window
  // drawn active again keeps the cursor its screen has just shown.
  const bool wasActive = active_;
  if (parent_ == nullptr && !active && wasActive) {
    savedCursor_ = ScreenCursor();
    ShowCursor(false);
  }
  active_ = active;
  drawn_ = true;
  if (window_ != nullptr) {
    ApplyBackground(active);
    werase(window_);
    DrawTexts();
  }
  PaintContents(active);
  for (Window* child : children_) {
    child->Redraw(active);
  }
  DrawDecorations();
  Update();
  if (parent_ == nullptr && active && !wasActive) {
    SetScreenCursor(savedCursor_);
  }
}

void Window::PaintContents(bool /*active*/) {
}

void Window::RepaintContents() {
  if (window_ == nullptr) {
    return;
  }
  ApplyBackground(active_);
  werase(window_);
  PaintContents(active_);
  Update();
}

void Window::SetColors(int background, int foreground) {
  if (background != -1) {
    background_ = background;
  } else if (parent_ != nullptr) {
    background_ = parent_->background_;
  }
  if (foreground != -1) {
    foreground_ = foreground;
  } else if (parent_ != nullptr) {
    foreground_ = parent_->foreground_;
  }
  if (!active_) {
    return;
  }
  ApplyBackground(true);
  for (Window* child : children_) {
    child->SetColors(background, foreground);
  }
}

void Window::Touch() {
  if (window_ != nullptr) {
    touchwin(window_);
  }
}

void Window::Update() {
  const Window* top = this;
  while (top->parent_ != nullptr) {
    top = top->parent_;
  }
  // A window being built (before its frame is first drawn) stays off the
  // screen.
  if (window_ == nullptr || !top->drawn_) {
    return;
  }
  Touch();
  wnoutrefresh(window_);
}

void Window::RedrawLines() {
  if (window_ != nullptr) {
    wredrawln(window_, 0, height_);
  }
  for (Window* child : children_) {
    child->RedrawLines();
  }
}

void Window::WriteClipped(WINDOW* window, int column, int row, std::string_view text) {
  if (window == nullptr || wmove(window, row, column) == ERR) {
    return;
  }
  std::string safe;
  if (!IsTerminalSafe(text)) {
    safe = TerminalSafe(text);
    text = safe;
  }
  int room = getmaxx(window) - column;
  int length = static_cast<int>(std::min<std::size_t>(text.size(), static_cast<std::size_t>(room)));
  if (length > 0) {
    waddnstr(window, text.data(), length);
  }
}

void Window::PutText(int column, int row, std::string_view text) {
  auto kept = std::find_if(texts_.begin(), texts_.end(), [&](const KeptText& existing) {
    return existing.column == column && existing.row == row;
  });
  if (kept != texts_.end()) {
    kept->text = text;
  } else {
    texts_.push_back(KeptText{column, row, std::string(text)});
  }
  if (window_ != nullptr) {
    SetDrawingAttribute();
    WriteClipped(window_, column, row, text);
  }
}

void Window::Erase() {
  texts_.clear();
  lines_.clear();
  boxed_ = false;
  if (window_ != nullptr) {
    werase(window_);
  }
}

void Window::Box() {
  boxed_ = true;
  DrawDecorations();
}

void Window::HorizontalLine(int column, int row, int length) {
  lines_.push_back(Line{column, row, length});
  DrawDecorations();
}

ColorAttribute Window::DrawingAttribute() const {
  return active_ ? ColorAttr(background_, foreground_) : ColorAttr(kBlack, kDarkGrey);
}

void Window::SetDrawingAttribute() {
  SetWindowAttribute(window_, DrawingAttribute());
}

void Window::DrawTexts() {
  SetDrawingAttribute();
  for (const KeptText& text : texts_) {
    WriteClipped(window_, text.column, text.row, text.text);
  }
}

void Window::DrawDecorations() {
  if (window_ == nullptr) {
    return;
  }
  SetDrawingAttribute();
  // Curses enters and leaves the line-drawing set with the terminal's full
  // attribute control, and leaves it (and enters it again) around every
  // cursor move: worth it for a run of line characters, far dearer than
  // three bytes of UTF-8 for the single cell of a vertical line between
  // other colours, or for a corner that ends a row. So the horizontal lines
  // and the left corners go out in the set, the vertical lines and the
  // right corners in Unicode.
  const ColorAttribute attribute = DrawingAttribute();
  const cchar_t horizontal = LineSetCell('q', attribute);
  if (boxed_) {
    const cchar_t vertical = UnicodeCell(L'\u2502', attribute);
    const cchar_t upperLeft = LineSetCell('l', attribute);
    const cchar_t upperRight = UnicodeCell(L'\u2510', attribute);
    const cchar_t lowerLeft = LineSetCell('m', attribute);
    const cchar_t lowerRight = UnicodeCell(L'\u2518', attribute);
    wborder_set(window_, &vertical, &vertical, &horizontal, &horizontal, &upperLeft, &upperRight,
                &lowerLeft, &lowerRight);
  }
  for (const Line& line : lines_) {
    mvwhline_set(window_, line.row, line.column, &horizontal, line.length);
  }
}

void Window::MoveCursor(int column, int row) {
  ScreenCursorState cursor = ScreenCursor();
  cursor.column = column_ + column;
  cursor.row = row_ + row;
  SetScreenCursor(cursor);
  if (window_ != nullptr) {
    wmove(window_, row, column);
  }
}

void Window::ShowCursor(bool visible) {
  ScreenCursorState cursor = ScreenCursor();
  cursor.visible = visible;
  SetScreenCursor(cursor);
}

bool Window::CursorVisible() {
  return ScreenCursor().visible;
}

}  // namespace Tulk
