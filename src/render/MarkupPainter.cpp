#include "render/MarkupPainter.h"

#include <algorithm>
#include <string>
#include <vector>

#include "include/ColorNumbers.h"
#include "render/MarkupTag.h"
#include "render/TerminalText.h"
#include "runtime/Palette.h"

namespace Tulk {
namespace {

class Painter {
 public:
  Painter(WINDOW* window, const PaintStyle& style, const ColorTable& colors)
      : window_(window),
        style_(style),
        colors_(colors),
        height_(getmaxy(window)),
        width_(getmaxx(window)),
        foreground_(style.foreground),
        background_(style.background) {}

  void Run(std::string_view text) {
    SetAttribute(style_.active ? ColorAttr(style_.background, style_.foreground)
                               : ColorAttr(kBlack, kDarkGrey));
    const bool toTheEnd = ScanMarkup(
        text, [this](std::string_view tag) { Tag(tag); },
        [this](char c) {
          if (c == '\n') {
            Flush();
            if (row_ + 1 >= height_) {
              return false;  // the window is full
            }
            ++row_;
            column_ = 0;
          } else {
            unsigned char byte = static_cast<unsigned char>(c);
            pending_ += (byte < 0x20 || byte == 0x7f) ? ' ' : c;
          }
          return true;
        });
    if (toTheEnd) {
      Flush();
    }
  }

 private:
  void SetAttribute(ColorAttribute attribute) {
    SetWindowAttribute(window_, attribute);
    int pair = attribute.pair;
    setcchar(&cell_, L" ", attribute.attrs, static_cast<short>(pair), &pair);
  }

  void Flush() {
    if (pending_.empty()) {
      return;
    }
    if (!IsTerminalSafe(pending_)) {
      pending_ = TerminalSafe(pending_);
    }
    int length = static_cast<int>(std::min<std::size_t>(pending_.size(), 1 << 20));
    int fits = std::min(length, width_ - column_);
    if (row_ < height_ && fits > 0) {
      Write(fits);
    }
    column_ += length;
    pending_.clear();
  }

  // ASCII runs are copied into the window as cells, which is several times
  // faster than adding them as a (possibly multi-byte) string; other runs go
  // through curses' character conversion.
  void Write(int count) {
    bool ascii = std::all_of(pending_.begin(), pending_.begin() + count,
                             [](char c) { return static_cast<unsigned char>(c) < 0x80; });
    if (!ascii) {
      if (wmove(window_, row_, column_) != ERR) {
        waddnstr(window_, pending_.data(), count);
      }
      return;
    }
    cells_.assign(static_cast<std::size_t>(count), cell_);
    for (int i = 0; i < count; ++i) {
      cells_[static_cast<std::size_t>(i)].chars[0] =
          static_cast<wchar_t>(pending_[static_cast<std::size_t>(i)]);
    }
    mvwadd_wchnstr(window_, row_, column_, cells_.data(), count);
  }

  void Restore() {
    if (style_.active) {
      SetAttribute(ColorAttr(style_.background, style_.foreground));
    }
    foreground_ = style_.foreground;
    background_ = style_.background;
    colorInForce_ = false;
    backgroundInForce_ = false;
  }

  void Tag(std::string_view text) {
    if (text.empty()) {
      return;
    }
    MarkupTag tag = MarkupTag::Split(text);
    bool color = tag.name == "color";
    bool background = tag.name == "bgcolor";
    bool endColor = tag.name == "/color";
    bool endBackground = tag.name == "/bgcolor";
    if (!color && !background && !endColor && !endBackground) {
      return;
    }
    Flush();
    if (color || background) {
      std::optional<int> number = tag.hasValue ? colors_.Find(tag.value) : std::nullopt;
      if (!number) {
        return;
      }
      if (color) {
        foreground_ = *number;
        colorInForce_ = true;
      } else {
        background_ = *number;
        backgroundInForce_ = true;
      }
      if (style_.active) {
        SetAttribute(ColorAttr(background_, foreground_));
      }
    } else if ((endColor && colorInForce_) || (endBackground && backgroundInForce_)) {
      Restore();
    }
  }

  WINDOW* window_;
  const PaintStyle& style_;
  const ColorTable& colors_;
  const int height_;
  const int width_;
  int row_ = 0;
  int column_ = 0;
  std::string pending_;
  cchar_t cell_{};
  std::vector<cchar_t> cells_;
  int foreground_;
  int background_;
  bool colorInForce_ = false;
  bool backgroundInForce_ = false;
};

}  // namespace

void PaintMarkup(WINDOW* window, std::string_view laidOut, const PaintStyle& style,
                 const ColorTable& colors) {
  if (window == nullptr) {
    return;
  }
  Painter(window, style, colors).Run(laidOut);
}

}  // namespace Tulk
