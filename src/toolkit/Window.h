#pragma once
/// A rectangle of the console's screen: a curses window with a position, a
/// size, a background and foreground colour (include/ColorNumbers.h), a
/// parent and children.
///
/// A top-level window is a curses window of its own; a child is a curses
/// sub-window of its parent and shares its cells. Children are created with
/// `new` and belong to their parent, which deletes them with itself:
///
///   auto* pane = new Window(frame, 0, 0, 40, 24, kYellow, kWhite);
///
/// A window shows only what it keeps: its background, the texts written
/// with PutText(), a box and lines (Box(), HorizontalLine()) and whatever a
/// subclass paints in PaintContents() (a TextArea's text, an ItemList's
/// rows). Redraw() repaints all of it, parent before children (the box and
/// lines after the children, above them), so that a window and its
/// children always show their own colours, active or dimmed, in colour and
/// in monochrome.
///
/// Drawing only changes curses' picture of the screen: the windows are
/// copied to it as they are drawn, and the terminal gets the cells that
/// changed when the console is about to wait for a key or a command
/// (runtime/ScreenFlush.h). Everything one key does reaches the terminal
/// as one update. Nothing of a top-level window is copied before its first
/// Redraw(), so a frame can fill its texts in its constructor.
///
/// Horizontal lines and the left corners of boxes are drawn in the
/// terminal's own line-drawing set where its description has one (curses
/// sends the Unicode line characters where it has none); the sides and the
/// right corners of a box are Unicode line characters, which cost fewer
/// bytes one cell at a time.
///
/// The terminal cursor is process-wide state (runtime/ScreenFlush.h):
/// MoveCursor() and ShowCursor() set it; it reaches the terminal with the
/// screen. A top-level window saves it when it is dimmed and puts it back
/// when it is drawn active again (a window that was active already leaves
/// the cursor as it is). The dimmed owner hides the cursor, so a frame
/// opened above it starts with the cursor hidden.

#include <curses.h>

#include <string>
#include <string_view>
#include <vector>

#include "runtime/Palette.h"
#include "runtime/ScreenFlush.h"

namespace Tulk {

class Window {
 public:
  /// Repaint order. Curses converts the cells of a window to a new
  /// background by comparing each cell with the old background; on the
  /// shared cells of sub-windows that comparison loses a child's colours
  /// when the parent goes first and loses the standout attribute of
  /// monochrome mode when the children go first. This toolkit therefore
  /// never relies on the conversion: every window erases and repaints its
  /// own content, which requires the parent to be painted before its
  /// children. The order is the same with every curses library.
  static constexpr bool kChildrenFirst = false;

  /// A top-level window. Parts outside the screen are cut off.
  Window(int column, int row, int width, int height, int background, int foreground);
  /// A child window at `column`, `row` relative to `parent`. A background
  /// or foreground of -1 takes the parent's. Parts outside the parent are
  /// cut off; a window with no cells left has no curses window and draws
  /// nothing.
  Window(Window* parent, int column, int row, int width, int height, int background = -1,
         int foreground = -1);
  /// Unregisters from the parent, deletes the children, then the curses
  /// window.
  virtual ~Window();
  Window(const Window&) = delete;
  Window& operator=(const Window&) = delete;

  /// The one drawing operation. Active: the window's own colours. Inactive:
  /// the dimmed look, dark grey on black (standout in monochrome). Repaints
  /// the window and its children and refreshes them; a top-level window
  /// also saves (inactive) or restores (active) the cursor state. Typed-
  /// ahead keys are discarded in both cases, as the new state is sent:
  /// keys pressed while a window changes state are dropped.
  virtual void Redraw(bool active);

  /// Stores new colours (-1 keeps the parent's) and, when the window is
  /// active, applies them at once to the window and passes the same
  /// colours to every child.
  void SetColors(int background, int foreground);
  /// Marks every line of the window as changed.
  void Touch();
  /// Touch(), then copy the window to curses' picture of the screen (once
  /// its top-level window has been drawn); the terminal gets it with the
  /// next update.
  void Update();
  /// Has the terminal repaint the window's lines and its children's.
  void RedrawLines();
  /// Writes `text` at `column`, `row` of the window and keeps it: later
  /// redraws show it again. A text at the same place replaces the kept one.
  /// Text beyond the right edge is cut off; nothing is written when the
  /// position lies outside the window.
  void PutText(int column, int row, std::string_view text);
  /// Clears the window and forgets its kept texts, box and lines.
  void Erase();
  /// Draws a line box along the window's edge and keeps it.
  void Box();
  /// Draws a horizontal line of `length` cells and keeps it.
  void HorizontalLine(int column, int row, int length);

  /// Puts the terminal cursor at `column`, `row` of this window.
  void MoveCursor(int column, int row);
  /// Shows or hides the terminal cursor.
  static void ShowCursor(bool visible);
  /// Whether the terminal cursor is currently shown.
  static bool CursorVisible();

  /// The curses window (null when the window has no cells).
  WINDOW* Curses() const { return window_; }
  /// The parent (null for a top-level window) and the children in
  /// creation order.
  Window* Parent() const { return parent_; }
  const std::vector<Window*>& Children() const { return children_; }
  /// Screen column and row of the top-left corner.
  int Column() const { return column_; }
  int Row() const { return row_; }
  /// Size in cells.
  int Width() const { return width_; }
  int Height() const { return height_; }
  /// The window's own colours.
  int Background() const { return background_; }
  int Foreground() const { return foreground_; }
  /// The window was last drawn active.
  bool Active() const { return active_; }

  /// Marks the steps of one drawing operation. Nothing reaches the
  /// terminal before the console waits, so a group does not change what
  /// is sent; it remains for the code that marks its operations with it.
  class DrawBatch {
   public:
    DrawBatch();
    ~DrawBatch() = default;
    DrawBatch(const DrawBatch&) = delete;
    DrawBatch& operator=(const DrawBatch&) = delete;
  };

 protected:
  /// Paints what a subclass shows, after the window was erased and its
  /// kept texts were drawn, before the children are drawn. The box and
  /// lines are drawn last, above the children.
  virtual void PaintContents(bool active);
  /// Erases the window and paints its contents again in its current state
  /// (for windows whose contents change between full draws).
  void RepaintContents();

  /// Sets the curses background for the current state (active or dimmed)
  /// and makes it the drawing attribute.
  void ApplyBackground(bool active);

 private:
  struct KeptText {
    int column;
    int row;
    std::string text;
  };
  struct Line {
    int column;
    int row;
    int length;
  };

  void Create(WINDOW* window);
  ColorAttribute DrawingAttribute() const;
  void SetDrawingAttribute();
  void DrawTexts();
  void DrawDecorations();
  static void WriteClipped(WINDOW* window, int column, int row, std::string_view text);

  ScreenCursorState savedCursor_;
  Window* parent_ = nullptr;
  WINDOW* window_ = nullptr;
  int column_ = 0;
  int row_ = 0;
  int width_ = 0;
  int height_ = 0;
  int background_ = 0;
  int foreground_ = 7;
  std::vector<Window*> children_;
  bool active_ = true;
  bool drawn_ = false;
  bool boxed_ = false;
  std::vector<KeptText> texts_;
  std::vector<Line> lines_;
};

}  // namespace Tulk
