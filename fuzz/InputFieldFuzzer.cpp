// Key handling of an input field: the first bytes choose the row and field
// widths and the initial value, the rest is a sequence of keys (editing
// keys and printable bytes). After every key the state must stay
// consistent and the row must format with the cursor inside the field.

#include <curses.h>

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "include/Keys.h"
#include "render/MarkupLayout.h"
#include "toolkit/InputField.h"

namespace {

constexpr int kSpecialKeys[] = {
    KEY_HOME,        KEY_LEFT, KEY_RIGHT, KEY_END,  KEY_DC, KEY_BACKSPACE,
    Tulk::kKeyCtrlH, KEY_F(1), KEY_UP,    KEY_DOWN, 10,     27,
    KEY_IC,          0x7f,     0,         255,
};

void Check(bool condition) {
  if (!condition) {
    std::abort();
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size < 4) {
    return 0;
  }
  const int rowWidth = 1 + data[0] % 120;
  const int fieldWidth = static_cast<int>(data[1] % 64) - 1;
  const std::size_t valueLength = data[2] % 40;
  const bool masked = (data[3] & 1) != 0;
  std::size_t at = 4;
  std::string value;
  while (value.size() < valueLength && at < size) {
    value += static_cast<char>(data[at++]);
  }
  Tulk::InputField state = Tulk::InputField::WithValue(value);
  const std::string label = "Name:";
  while (at < size) {
    std::uint8_t byte = data[at++];
    int key = byte < 0x20 ? kSpecialKeys[byte % 16] : byte;
    state = Tulk::InputField::HandleKey(state, key);
    Check(state.cursor <= state.value.size());
    Check(!state.pristine);

    Tulk::InputField::Row row =
        Tulk::InputField::FormatRow(state, label, rowWidth, fieldWidth, true, masked);
    state.scroll = row.scroll;
    Check(row.scroll <= state.cursor);
    const int field = Tulk::InputField::ResolveWidth(fieldWidth, rowWidth);
    if (field >= 0) {
      // The cursor stays inside the field: from its first column to the
      // column after its last.
      Check(row.cursorColumn >= rowWidth - 2 - field && row.cursorColumn <= rowWidth - 2);
    }
    if (field >= 0 && rowWidth >= 5 + field + static_cast<int>(label.size())) {
      // A row that fits is exactly one line of the row's width (values
      // with braces open tags, so only plain values are measured).
      if (state.value.find_first_of("{}\n") == std::string::npos) {
        std::string laidOut = Tulk::LayOutMarkup(row.text, rowWidth, {});
        Check(laidOut.find('\n') == std::string::npos);
      }
    }
  }
  return 0;
}
