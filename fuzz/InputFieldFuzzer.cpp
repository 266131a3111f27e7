// Key handling of an input field behind its key filter: the first bytes
// choose the row and field widths, the filter, the length limit and the
// initial value, the rest is a sequence of keys (editing keys and
// printable bytes). Keys the filter refuses never reach the field. After
// every key the state must stay consistent, the value must hold only what
// the filter takes and no more than the limit, and the row must format
// with the cursor inside the field.

#include <curses.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "include/Keys.h"
#include "render/MarkupLayout.h"
#include "toolkit/InputField.h"
#include "toolkit/KeyFilter.h"

namespace {

constexpr int kSpecialKeys[] = {
    KEY_HOME,        KEY_LEFT, KEY_RIGHT, KEY_END,  KEY_DC, KEY_BACKSPACE,
    Tulk::kKeyCtrlH, KEY_F(1), KEY_UP,    KEY_DOWN, 10,     27,
    KEY_IC,          0x7f,     0,         255,
};

const Tulk::KeyFilter* const kFilters[] = {
    &Tulk::kAnyText,   &Tulk::kLoginText,   &Tulk::kDigits,   &Tulk::kIpv4,
    &Tulk::kDnsServer, &Tulk::kIpv6Network, &Tulk::kHostName, &Tulk::kSuffixes,
};

void Check(bool condition) {
  if (!condition) {
    std::abort();
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size < 5) {
    return 0;
  }
  const int rowWidth = 1 + data[0] % 120;
  const int fieldWidth = static_cast<int>(data[1] % 64) - 1;
  const std::size_t valueLength = data[2] % 40;
  const bool masked = (data[3] & 1) != 0;
  const Tulk::KeyFilter& filter = *kFilters[(data[3] >> 1) % 8];
  const std::size_t maxLength = data[4] % 8;  // 0: no limit
  std::size_t at = 5;
  std::string value;
  while (value.size() < valueLength && at < size) {
    const char byte = static_cast<char>(data[at++]);
    if (filter.Accepts(static_cast<unsigned char>(byte)) && byte >= 0x20) {
      value += byte;
    }
  }
  Tulk::InputField state = Tulk::InputField::WithValue(value);
  state.maxLength = maxLength;
  const std::size_t longest = std::max(maxLength, value.size());
  const std::string label = "Name:";
  while (at < size) {
    std::uint8_t byte = data[at++];
    int key = byte < 0x20 ? kSpecialKeys[byte % 16] : byte;
    if (!filter.Accepts(key)) {
      continue;
    }
    state = Tulk::InputField::HandleKey(state, key);
    Check(state.cursor <= state.value.size());
    Check(!state.pristine);
    for (char c : state.value) {
      Check(filter.Accepts(static_cast<unsigned char>(c)));
    }
    if (maxLength != 0) {
      Check(state.value.size() <= longest);
    }

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
