#include "toolkit/CheckItem.h"

#include <algorithm>

namespace Tulk {

CheckItem::CheckItem(std::string caption, bool checked, int indent)
    : caption_(std::move(caption)), checked_(checked), indent_(std::max(indent, 0)) {
  Relabel();
}

void CheckItem::SetChecked(bool checked) {
  checked_ = checked;
  Relabel();
}

void CheckItem::SetCaption(std::string caption) {
  caption_ = std::move(caption);
  Relabel();
}

void CheckItem::Relabel() {
  std::string label(static_cast<std::size_t>(indent_), ' ');
  label += checked_ ? "[X] " : "[ ] ";
  label += caption_;
  SetText(std::move(label));
}

}  // namespace Tulk
