#include "render/MarkupLayout.h"

#include <algorithm>

#include "render/MarkupTag.h"

namespace Tulk {
namespace {

constexpr std::size_t kNone = std::string::npos;
// Larger than any window: a padding field this wide is never cut.
constexpr long kMaxPadding = 1000000;

enum class Align { kLeft, kRight, kCenter, kPadding };

// What isspace() holds for in every locale the console uses: blank, tab,
// newline, vertical tab, form feed, carriage return.
bool IsBlank(char c) {
  return c == ' ' || (c >= '\t' && c <= '\r');
}

long ParseLeadingDecimal(std::string_view text) {
  long value = 0;
  for (char c : text) {
    if (c < '0' || c > '9') {
      break;
    }
    value = std::min(kMaxPadding, value * 10 + (c - '0'));
  }
  return value;
}

class Layout {
 public:
  Layout(int width, const VariableLookup& variables)
      : width_(width), room_(width), variables_(variables) {}

  std::string Run(std::string_view text) {
    out_.reserve(text.size() + static_cast<std::size_t>(std::max(width_, 0)));
    ScanMarkup(
        text, [this](std::string_view tag) { Tag(tag); },
        [this](char c) {
          if (c == '\n') {
            TextNewline();
          } else {
            Visible(c);
          }
          return true;
        });
    return std::move(out_);
  }

 private:
  void TextNewline() {
    out_ += '\n';
    room_ = width_;
    lastBlank_ = kNone;
    sinceBlank_ = 0;
    segmentStart_ = out_.size();
  }

  bool FieldFull() const { return mode_ == Align::kPadding && padOpen_ <= 0; }

  void Written() {
    --room_;
    ++sinceBlank_;
    if (mode_ == Align::kPadding) {
      --padOpen_;
    }
  }

  void Visible(char c) {
    if (FieldFull()) {
      return;
    }
    if (IsBlank(c)) {
      if (room_ > 0) {
        out_ += c;
        Written();
        lastBlank_ = out_.size() - 1;
        sinceBlank_ = 1;
      } else {
        HardBreak();
      }
      return;
    }
    if (room_ <= 0) {
      Break();
    }
    out_ += c;
    Written();
  }

  // Returns false when the value ends (its padding field is full).
  bool ValueByte(char c) {
    if (c == '\n') {
      TextNewline();
      return true;
    }
    if (FieldFull()) {
      return false;
    }
    if (room_ <= 0) {
      HardBreak();
    }
    out_ += c;
    Written();
    return true;
  }

  // A full line: move the last word to the next line when the line has a
  // blank, else break inside the word.
  void Break() {
    if (lastBlank_ == kNone) {
      HardBreak();
      return;
    }
    out_[lastBlank_] = '\n';
    room_ = width_ + 1 - sinceBlank_;
    segmentStart_ = std::max(segmentStart_, lastBlank_ + 1);
    lastBlank_ = kNone;
  }

  void HardBreak() {
    out_ += '\n';
    room_ = width_;
    lastBlank_ = kNone;
    sinceBlank_ = 0;
    segmentStart_ = out_.size();
  }

  void InsertBlanks(std::size_t at, int count) {
    if (count <= 0) {
      return;
    }
    out_.insert(at, static_cast<std::size_t>(count), ' ');
    if (lastBlank_ != kNone) {
      if (lastBlank_ >= at) {
        lastBlank_ += static_cast<std::size_t>(count);
      } else {
        sinceBlank_ += count;
      }
    }
  }

  void OpenAlign(std::string_view value) {
    if (open_) {
      return;
    }
    open_ = true;
    segmentStart_ = out_.size();
    padOpen_ = 0;
    if (value == "right") {
      mode_ = Align::kRight;
    } else if (value == "center") {
      mode_ = Align::kCenter;
    } else if (value.starts_with("padding:")) {
      mode_ = Align::kPadding;
      padOpen_ = ParseLeadingDecimal(value.substr(8));
    } else {
      mode_ = Align::kLeft;
    }
  }

  void CloseAlign() {
    switch (mode_) {
      case Align::kRight:
        InsertBlanks(segmentStart_, room_);
        room_ = std::min(room_, 0);
        break;
      case Align::kCenter: {
        int half = std::max(room_, 0) / 2;
        InsertBlanks(segmentStart_, half);
        room_ = half;
        break;
      }
      case Align::kPadding:
        if (padOpen_ > 0) {
          int fill = static_cast<int>(std::min<long>(padOpen_, std::max(room_, 0)));
          out_.append(static_cast<std::size_t>(fill), ' ');
          sinceBlank_ += fill;
          room_ = static_cast<int>(std::max<long>(room_ - padOpen_, 0));
        }
        break;
      case Align::kLeft:
        break;
    }
    mode_ = Align::kLeft;
    open_ = false;
    padOpen_ = 0;
  }

  void Tag(std::string_view text) {
    MarkupTag tag = MarkupTag::Split(text);
    if (tag.name == "align" && tag.hasValue) {
      OpenAlign(tag.value);
      return;
    }
    if (tag.name == "/align") {
      CloseAlign();
      return;
    }
    if (!tag.hasValue && variables_ && variables_(tag.name, value_)) {
      for (char c : value_) {
        if (!ValueByte(c)) {
          break;
        }
      }
      return;
    }
    out_ += '{';
    out_ += text;
    out_ += '}';
  }

  const int width_;
  int room_;
  const VariableLookup& variables_;
  std::string out_;
  std::string value_;
  std::size_t lastBlank_ = kNone;
  // Columns from the last blank (the blank included) to the line's end.
  int sinceBlank_ = 0;
  std::size_t segmentStart_ = 0;
  Align mode_ = Align::kLeft;
  bool open_ = false;
  long padOpen_ = 0;
};

}  // namespace

std::string LayOutMarkup(std::string_view text, int width, const VariableLookup& variables) {
  return Layout(width, variables).Run(text);
}

}  // namespace Tulk
