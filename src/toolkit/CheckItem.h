#pragma once
/// A check box: "[X] caption" when checked, "[ ] caption" when not, after
/// `indent` blanks.

#include <string>

#include "toolkit/LabelItem.h"

namespace Tulk {

class CheckItem : public LabelItem {
 public:
  explicit CheckItem(std::string caption, bool checked = false, int indent = 0);

  void SetChecked(bool checked);
  void Toggle() { SetChecked(!checked_); }
  bool Checked() const { return checked_; }
  void SetCaption(std::string caption);
  const std::string& Caption() const { return caption_; }

 private:
  void Relabel();

  std::string caption_;
  bool checked_;
  int indent_;
};

}  // namespace Tulk
