#include "toolkit/TextArea.h"

#include "render/MarkupLayout.h"
#include "render/MarkupPainter.h"

namespace Tulk {

TextArea::TextArea(Window* parent, int column, int row, int width, int height, int background,
                   int foreground)
    : Window(parent, column, row, width, height, background, foreground) {
}

void TextArea::SetText(std::string_view text) {
  text_ = text;
  RepaintContents();
}

void TextArea::Append(std::string_view text) {
  std::string joined = text_;
  joined += text;
  SetText(joined);
}

void TextArea::PaintContents(bool active) {
  if (Curses() == nullptr || text_.empty()) {
    return;
  }
  VariableLookup lookup = [this](std::string_view name, std::string& value) {
    return variables_.Lookup(name, value);
  };
  std::string laidOut = LayOutMarkup(text_, Width(), lookup);
  PaintMarkup(Curses(), laidOut, PaintStyle{Background(), Foreground(), active}, colors_);
}

}  // namespace Tulk
