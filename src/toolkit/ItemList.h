#pragma once
/// A column of items in a window, one item per row, with a highlighted
/// current row, scrolling and a one-column scroll bar.
///
/// Layout: the rows take the list's width minus one column; the last
/// column is the scroll bar, drawn only when there are more items than
/// rows. Each row shows its item through a text area inset by one column
/// on each side. Rows show their item's colours (black on yellow, dark
/// grey when disabled); the current row shows white on black and is drawn
/// last, so that an input field's cursor ends up in it.
///
/// The dialog owns the items and gives the list its keys' meaning:
///
///   list->SetItems({&name, &password});
///   ...
///   if (key == KEY_DOWN) list->MoveDown();
///   else if (key == KEY_UP) list->MoveUp();
///   else { password.HandleKey(key); list->Draw(); }
///
/// Only focusable and enabled items become current. The ordinal of the
/// current item counts the focusable items before it, enabled or not.

#include <vector>

#include "toolkit/Window.h"

namespace Tulk {

class Item;
class ScrollBar;
class TextArea;

class ItemList : public Window {
 public:
  /// A list at `column`, `row` of `parent`, `width` x `height`, in the
  /// parent's colours.
  ItemList(Window* parent, int column, int row, int width, int height);

  /// Shows `items` from the top and makes the first focusable and enabled
  /// one current (scrolled into view). An empty sequence leaves the cursor
  /// row as it was; a sequence without such an item has no current item.
  /// Does not draw.
  void SetItems(std::vector<Item*> items);
  /// The items as given to SetItems().
  const std::vector<Item*>& Items() const { return items_; }

  /// Makes the n-th focusable item (from 0) current, scrolling it into
  /// view; returns false and changes nothing when there are fewer. Does
  /// not draw.
  bool SelectByOrdinal(int ordinal);
  /// Makes `item` current (when it is one of the list's focusable items),
  /// scrolling it into view; returns false and changes nothing otherwise.
  /// Does not draw.
  bool SelectItem(const Item* item);

  /// Steps to the previous or next enabled focusable item, scrolling as
  /// needed, and draws the list. At either end nothing changes and
  /// nothing is drawn. Returns whether the current item changed.
  bool MoveUp();
  bool MoveDown();

  /// Draws the rows, the scroll bar and the current row, and refreshes.
  void Draw();

  /// Drawn active, the list is drawn anew (Draw); drawn inactive, its rows
  /// keep their texts in the dimmed look.
  void Redraw(bool active) override;

  /// The current item, or null.
  Item* Current() const;
  /// Index of the current item in Items(), or -1.
  int CurrentIndex() const;
  /// The count of focusable items before the current one.
  int Ordinal() const { return ordinal_; }
  /// Index of the first shown item.
  int Top() const { return top_; }
  /// Row of the current item relative to Top(), or -1 when there is none.
  int CursorRow() const { return cursorRow_; }
  /// The number of rows (the list's height).
  int Rows() const { return static_cast<int>(rows_.size()); }
  /// The text area of row `row` (for tests and for screens that need the
  /// row's position).
  TextArea* RowArea(int row) const;
  /// The scroll bar.
  const ScrollBar* Bar() const { return scrollBar_; }

 private:
  bool Selectable(int index) const;
  int CountFocusableBefore(int index) const;
  void MakeCurrent(int index);

  Window* content_;
  ScrollBar* scrollBar_;
  std::vector<TextArea*> rows_;
  std::vector<Item*> items_;
  int top_ = 0;
  int cursorRow_ = -1;
  int ordinal_ = 0;
};

}  // namespace Tulk
