#pragma once
/// The one-column scroll bar of an ItemList: a dark shade block in every
/// row and a full block at the position of the list's first shown item.

#include <optional>

#include "toolkit/Window.h"

namespace Tulk {

class ScrollBar : public Window {
 public:
  /// A bar in `parent` at `column`, `row`, one column wide, `height` rows
  /// high, in the parent's colours.
  ScrollBar(Window* parent, int column, int row, int height);

  /// Shows the bar for a list whose first shown item is `top` out of
  /// `items` with `rows` rows (items > rows), and draws it.
  void Show(int top, int items, int rows);
  /// Hides the bar and draws the empty column.
  void Hide();

  /// The row of the full block, or nullopt when the bar is hidden.
  std::optional<int> BlockRow() const { return blockRow_; }

  /// The full block's row: (rows - 1) x position / 100, where position is
  /// top x 100 / (items - rows) in whole per cent.
  static int BlockRowFor(int top, int items, int rows);

 protected:
  void PaintContents(bool active) override;

 private:
  std::optional<int> blockRow_;
};

}  // namespace Tulk
