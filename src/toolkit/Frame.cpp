#include "toolkit/Frame.h"

namespace Tulk {

Frame::Frame(Frame* owner, int column, int row, int width, int height, int background,
             int foreground)
    : Window(column, row, width, height, background, foreground),
      owner_(owner),
      strings_(GetStringFactory("en_US")) {
}

void Frame::Redraw(bool active) {
  Window::Redraw(active);
}

const char* Frame::Text(std::uint32_t id) const {
  return strings_ != nullptr ? strings_->GetString(id) : "";
}

}  // namespace Tulk
