#include "toolkit/Window.h"

#include <algorithm>

#include "include/ColorNumbers.h"
#include "runtime/Palette.h"

namespace Tulk {
namespace {

struct ProcessCursor {
  bool visible = false;
  int column = 0;
  int row = 0;
};

ProcessCursor g_cursor;
int g_batchDepth = 0;
bool g_flushPending = false;

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

Window::DrawBatch::DrawBatch() {
  ++g_batchDepth;
}

Window::DrawBatch::~DrawBatch() {
  if (--g_batchDepth == 0) {
    FinishOutput();
  }
}

void Window::FinishOutput() {
  // Typed-ahead keys are dropped before the new state reaches the screen,
  // so that a key pressed after the operator saw it is kept.
  if (g_flushPending) {
    g_flushPending = false;
    flushinp();
  }
  if (newscr != nullptr) {
    // A hidden cursor is left where drawing ended instead of being moved
    // back: fewer bytes on a slow line.
    leaveok(newscr, g_cursor.visible ? FALSE : TRUE);
    if (g_cursor.visible) {
      wmove(newscr, g_cursor.row, g_cursor.column);
    }
  }
  doupdate();
}

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
  DrawBatch batch;
  g_flushPending = true;
  // The cursor is handed over only when the window changes state: a window
  // drawn active again keeps the cursor its screen has just shown.
  const bool wasActive = active_;
  if (parent_ == nullptr && !active && wasActive) {
    savedCursor_ = CursorState{g_cursor.visible, g_cursor.column, g_cursor.row};
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
    g_cursor = ProcessCursor{savedCursor_.visible, savedCursor_.column, savedCursor_.row};
    curs_set(g_cursor.visible ? 1 : 0);
  }
}

void Window::PaintContents(bool /*active*/) {
}

void Window::RepaintContents() {
  if (window_ == nullptr) {
    return;
  }
  DrawBatch batch;
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
  if (g_batchDepth == 0) {
    FinishOutput();
  }
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

void Window::SetDrawingAttribute() {
  SetWindowAttribute(window_,
                     active_ ? ColorAttr(background_, foreground_) : ColorAttr(kBlack, kDarkGrey));
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
  // The wide-character calls: the narrow ones keep only 8 bits of the
  // colour pair, and pair numbers reach 1800.
  if (boxed_) {
    wborder_set(window_, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
  }
  for (const Line& line : lines_) {
    mvwhline_set(window_, line.row, line.column, WACS_HLINE, line.length);
  }
}

void Window::MoveCursor(int column, int row) {
  g_cursor.column = column_ + column;
  g_cursor.row = row_ + row;
  if (window_ != nullptr) {
    wmove(window_, row, column);
  }
  if (g_batchDepth == 0) {
    FinishOutput();
  }
}

void Window::ShowCursor(bool visible) {
  g_cursor.visible = visible;
  curs_set(visible ? 1 : 0);
  if (visible && g_batchDepth == 0) {
    FinishOutput();
  }
}

bool Window::CursorVisible() {
  return g_cursor.visible;
}

}  // namespace Tulk
