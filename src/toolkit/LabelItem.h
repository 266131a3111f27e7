#pragma once
/// An item that shows a marked-up label.

#include <string>
#include <string_view>

#include "toolkit/Item.h"

namespace Tulk {

class LabelItem : public Item {
 public:
  /// `focusable` false makes a plain text row that is never current.
  explicit LabelItem(std::string label = {}, bool focusable = true);

  /// Replaces the row's text with the label and draws it.
  void Draw(TextArea& area) override;

  /// Replaces the label (markup); shown at the next draw.
  void SetText(std::string label) { label_ = std::move(label); }
  /// The label (markup).
  const std::string& Label() const { return label_; }

 private:
  std::string label_;
};

}  // namespace Tulk
