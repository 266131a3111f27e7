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
/// Drawing reaches the terminal once per outermost drawing operation: the
/// windows are copied to the virtual screen as they are drawn and curses
/// sends only the cells that changed when the operation ends. Nothing of a
/// top-level window reaches the terminal before its first Redraw(), so a
/// frame can fill its texts in its constructor.
///
/// The terminal cursor is process-wide state: MoveCursor() and
/// ShowCursor() remember it; a top-level window saves it when it is dimmed
/// and puts it back when it is drawn active again (a window that was active
/// already leaves the cursor as it is). The dimmed owner hides the cursor,
/// so a frame opened above it starts with the cursor hidden.

#include <curses.h>

#include <string>
#include <string_view>
#include <vector>

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
  /// ahead keys are discarded in both cases: keys pressed while a window
  /// changes state are dropped.
  virtual void Redraw(bool active);

  /// Stores new colours (-1 keeps the parent's) and, when the window is
  /// active, applies them at once to the window and passes the same
  /// colours to every child.
  void SetColors(int background, int foreground);
  /// Marks every line of the window as changed.
  void Touch();
  /// Touch(), then refresh the window on the terminal (once its top-level
  /// window has been drawn).
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

  /// Moves the terminal cursor to `column`, `row` of this window and
  /// remembers the screen position.
  void MoveCursor(int column, int row);
  /// Shows or hides the terminal cursor and remembers it.
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

  /// Groups drawing: while one exists, windows are only copied to the
  /// virtual screen; the terminal is updated once, when the outermost group
  /// ends. Every drawing operation of the toolkit opens one.
  class DrawBatch {
   public:
    DrawBatch();
    ~DrawBatch();
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
  struct CursorState {
    bool visible = false;
    int column = 0;
    int row = 0;
  };
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
  void SetDrawingAttribute();
  void DrawTexts();
  void DrawDecorations();
  static void WriteClipped(WINDOW* window, int column, int row, std::string_view text);
  static void FinishOutput();

  CursorState savedCursor_;
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
