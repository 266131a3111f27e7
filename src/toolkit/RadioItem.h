#pragma once
/// A radio button: "(o) caption" when selected, "( ) caption" when not.
/// The dialog keeps its group exclusive.

#include <string>

#include "toolkit/LabelItem.h"

namespace Tulk {

class RadioItem : public LabelItem {
 public:
  explicit RadioItem(std::string caption, bool selected = false);

  void SetSelected(bool selected);
  bool Selected() const { return selected_; }
  const std::string& Caption() const { return caption_; }

 private:
  void Relabel();

  std::string caption_;
  bool selected_;
};

}  // namespace Tulk
