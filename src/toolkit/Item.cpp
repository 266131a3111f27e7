#include "toolkit/Item.h"

#include "include/ColorNumbers.h"

namespace Tulk {

void Item::SetFocused(bool focused) {
  if (focused == focused_) {
    return;
  }
  focused_ = focused;
  FocusChanged();
}

void Item::SetEnabled(bool enabled) {
  enabled_ = enabled;
  foreground_ = enabled ? kBlack : kDarkGrey;
}

}  // namespace Tulk
