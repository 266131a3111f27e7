// The layout pass with arbitrary text and widths 1 to 300. The first two
// bytes choose the width, the rest is the text. Besides not crashing, no
// laid-out line may be wider than the width. The same text made safe for
// the terminal must be safe, stay as it is when made safe again, and hold
// no control character.

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>

#include "render/MarkupLayout.h"
#include "render/TerminalText.h"

namespace {

bool Variables(std::string_view name, std::string& value) {
  if (name == "v") {
    value = "ab cd";
  } else if (name == "n") {
    value = "x\ny";
  } else if (name == "e") {
    value.clear();
  } else if (name == "long") {
    value.assign(400, 'w');
  } else {
    return false;
  }
  return true;
}

// Visible columns of the widest line (tags take none).
std::size_t WidestLine(std::string_view text) {
  std::size_t widest = 0;
  std::size_t line = 0;
  for (std::size_t i = 0; i < text.size(); ++i) {
    if (text[i] == '{') {
      std::size_t close = text.find('}', i + 1);
      if (close == std::string_view::npos) {
        break;
      }
      i = close;
    } else if (text[i] == '\n') {
      line = 0;
    } else if (++line > widest) {
      widest = line;
    }
  }
  return widest;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size < 2) {
    return 0;
  }
  int width = 1 + (data[0] | (data[1] << 8)) % 300;
  std::string_view text(reinterpret_cast<const char*>(data + 2), size - 2);
  std::string laidOut = Tulk::LayOutMarkup(text, width, Variables);
  if (WidestLine(laidOut) > static_cast<std::size_t>(width)) {
    std::abort();
  }
  const std::string safe = Tulk::TerminalSafe(text);
  if (!Tulk::IsTerminalSafe(safe) || Tulk::TerminalSafe(safe) != safe ||
      Tulk::IsTerminalSafe(text) != (safe == text)) {
    std::abort();
  }
  for (char c : safe) {
    if (static_cast<unsigned char>(c) < 0x20 || c == 0x7F) {
      std::abort();
    }
  }
  return 0;
}
