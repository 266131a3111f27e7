#include "toolkit/RadioItem.h"

namespace Tulk {

RadioItem::RadioItem(std::string caption, bool selected)
    : caption_(std::move(caption)), selected_(selected) {
  Relabel();
}

void RadioItem::SetSelected(bool selected) {
  selected_ = selected;
  Relabel();
}

void RadioItem::Relabel() {
  SetText((selected_ ? "(o) " : "( ) ") + caption_);
}

}  // namespace Tulk
