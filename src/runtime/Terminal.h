#pragma once
/// The terminal the console runs on: its type, the virtual terminal to
/// switch to, and the attributes saved at start-up.

#include <termios.h>

#include <optional>

namespace Tulk {

/// Parses the command line's VT argument as strtol() does (base 10,
/// trailing text ignored, no number gives 0). Returns the number when it is
/// 1 to 63, nullopt otherwise.
std::optional<int> ParseVtArgument(const char* text);

/// Standard output is a Linux virtual console (the KDGKBTYPE request
/// succeeds on descriptor 1).
bool IsLinuxConsole();

/// Applies the TERM/TERMINFO rules and sets `localConsole`:
/// - on a Linux virtual console: `localConsole`, TERM=linux;
/// - otherwise TERM "linux" becomes "vt102" (a serial line), and TERM
///   "xterm" without SSH_CLIENT sets `localConsole`;
/// - then TERMINFO=/usr/share/terminfo and TERM=vt102 unless already set.
void ApplyTerminalType(bool linuxConsole);

/// Saves the attributes of standard output (tcgetattr on descriptor 1).
void SaveTerminalAttributes();

/// The attributes saved at start-up (empty when standard output is not a
/// terminal).
const std::optional<termios>& SavedTerminalAttributes();

/// Activates virtual terminal `vt` through the console device (resolved
/// under the host root). Only when VT_ACTIVATE fails is VT_WAITACTIVE
/// issued; a successful activation is not waited for.
void SwitchToVt(int vt);

/// Disables the suspend character in the saved attributes and applies them
/// to standard output at once.
void DisableSuspendCharacter();

/// Switches off XON/XOFF flow control on the terminal (IXON, IXOFF), once
/// curses has started: Ctrl-S then reaches the console as a key instead of
/// stopping its output, and nothing (a terminating signal included) waits
/// for a Ctrl-Q. Curses' program mode takes the change, so it survives
/// every later mode switch; endwin() restores the terminal as it was at
/// start-up, flow control included.
void DisableFlowControl();

}  // namespace Tulk
