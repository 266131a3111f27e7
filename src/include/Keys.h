#pragma once
/// Key codes the screens compare with.
///
/// Every key arrives as a curses key code from WaitForKey(): the curses
/// KEY_* codes for function keys, arrows, Home/End, Insert/Delete,
/// Page Up/Down, Backspace and KEY_RESIZE, plus the plain bytes below.
/// The extra escape sequences that map onto the curses codes are registered
/// at start-up by DefineKeys() (runtime/KeyTable.h).

namespace Tulk {

inline constexpr int kKeyCtrlH = 8;
inline constexpr int kKeyTab = 9;
inline constexpr int kKeyEnter = 10;
inline constexpr int kKeyEsc = 27;
inline constexpr int kKeySpace = 32;

}  // namespace Tulk
