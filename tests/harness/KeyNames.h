#pragma once
/// The bytes a terminal of the xterm family sends for a named key.
///
/// Names: "F1" to "F12", "Up", "Down", "Left", "Right", "Home", "End",
/// "PageUp", "PageDown", "Insert", "Delete", "Enter", "Esc", "Tab",
/// "Backspace", "Space". Arrows, Home and End are sent in the keypad's
/// application mode (ESC O x), which curses switches on.

#include <string>
#include <string_view>

namespace TulkTest {

/// The bytes of the key; throws std::invalid_argument for an unknown name.
std::string KeyBytes(std::string_view name);

/// `bytes` for a test message: printable ASCII as it is, every other byte
/// as "\xNN".
std::string VisibleBytes(std::string_view bytes);

}  // namespace TulkTest
