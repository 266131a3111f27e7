#pragma once
/// Text from the host made safe for the terminal.
///
/// Host values (the host name, the welcome message, NIC names and
/// descriptions, vendor strings, log file names) reach the screen as text,
/// and nothing in them may act on the terminal. The curses library already
/// turns C0 control characters into visible "^X" forms when text is added
/// to a window; this covers what it passes through unchanged:
///
/// | In the text                                           | On the screen |
/// |-------------------------------------------------------|---------------|
/// | C0 control characters and DEL                         | a blank       |
/// | C1 control characters (U+0080-U+009F, e.g. U+009B CSI)| a blank       |
/// | a byte that is not part of valid UTF-8                | a blank       |
/// | bidirectional marks, embeddings, overrides, isolates  | dropped       |
/// |   (U+061C, U+200E, U+200F, U+202A-U+202E, U+2066-U+2069) |            |
///
/// Decisions of this implementation: the bidirectional controls take no
/// cell, so dropping them keeps every column where it was; a control
/// character takes one, so it becomes a blank. Line feeds are the caller's
/// business (the markup painter breaks lines on them before this runs).

#include <string>
#include <string_view>

namespace Tulk {

/// True when `text` holds nothing that TerminalSafe() would change.
bool IsTerminalSafe(std::string_view text);

/// `text` with control characters, invalid bytes and bidirectional
/// controls replaced as the table above says.
std::string TerminalSafe(std::string_view text);

}  // namespace Tulk
