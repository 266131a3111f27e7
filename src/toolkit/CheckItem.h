#pragma once
/// A check box: "[X] caption" when checked, "[ ] caption" when not, after
/// `indent` blanks.

#include <string>

#include "toolkit/LabelItem.h"

namespace Tulk {

class CheckItem : public LabelItem {
 public:
  /// A check box with `caption` after `indent` blanks (negative: none).
  explicit CheckItem(std::string caption, bool checked = false, int indent = 0);

  /// Checks or clears the box; the label follows.
  void SetChecked(bool checked);
  /// Flips the box (Space in most dialogs).
  void Toggle() { SetChecked(!checked_); }
  /// Whether the box is checked.
  bool Checked() const { return checked_; }
  /// Replaces the caption (markup); the label follows.
  void SetCaption(std::string caption);
  /// The caption without the box.
  const std::string& Caption() const { return caption_; }

 private:
  void Relabel();

  std::string caption_;
  bool checked_;
  int indent_;
};

}  // namespace Tulk
