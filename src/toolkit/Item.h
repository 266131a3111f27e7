#pragma once
/// One row of an ItemList: a label, an input field, a check box, a radio
/// button.
///
/// An item draws itself into the row's text area; the list decides the
/// row's colours (the item's own for every row but the current one, white
/// on black for the current one). The dialog owns its items; the list only
/// points at them.

#include "include/ColorNumbers.h"

namespace Tulk {

class TextArea;

class Item {
 public:
  /// A focusable item can become the list's current item (when enabled);
  /// a label built without it is a plain text row.
  explicit Item(bool focusable = true) : focusable_(focusable) {}
  virtual ~Item() = default;
  Item(const Item&) = delete;
  Item& operator=(const Item&) = delete;

  /// Draws the item into the row's text area.
  virtual void Draw(TextArea& area) = 0;
  /// Marks the item as the list's current item or not; calls
  /// FocusChanged() when the flag changes.
  virtual void SetFocused(bool focused);

  /// Enables or disables the item; a disabled item cannot become current
  /// and is drawn dark grey instead of black.
  void SetEnabled(bool enabled);
  /// Makes the item take part in the list's order, or a plain row.
  void SetFocusable(bool focusable) { focusable_ = focusable; }

  /// Flags: takes part in the order, is the current item, can be chosen.
  bool Focusable() const { return focusable_; }
  bool Focused() const { return focused_; }
  bool Enabled() const { return enabled_; }
  /// Colours of the item's row when it is not the current row (yellow,
  /// black at construction).
  int Background() const { return background_; }
  int Foreground() const { return foreground_; }
  /// Overrides the row colours (SetEnabled() sets the foreground again).
  void SetBackground(int background) { background_ = background; }
  void SetForeground(int foreground) { foreground_ = foreground; }

 protected:
  /// Called when the focused flag changes.
  virtual void FocusChanged() {}

 private:
  bool focusable_;
  bool focused_ = false;
  bool enabled_ = true;
  int background_ = kYellow;
  int foreground_ = kBlack;
};

}  // namespace Tulk
