#include "toolkit/LabelItem.h"

#include "toolkit/TextArea.h"

namespace Tulk {

LabelItem::LabelItem(std::string label, bool focusable)
    : Item(focusable), label_(std::move(label)) {
}

void LabelItem::Draw(TextArea& area) {
  area.SetText(label_);
}

}  // namespace Tulk
