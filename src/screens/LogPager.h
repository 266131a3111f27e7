#pragma once
/// Hands the terminal to the pager to show one log file, and takes it
/// back.
///
/// The pager is "/bin/less" (under the host root) with "less", "-cfP",
/// "<Q> Quit </> RegExp Search <H> Help" and the file: it repaints from
/// the top, opens even special files and shows that prompt. It runs with
/// LESSSECURE=1, which keeps it from running shell commands, opening
/// other files or writing files.
///
/// While it runs the console's screen is suspended: the terminal has the
/// attributes saved at start-up (runtime/Terminal.h), the pager's own
/// process group is the terminal's foreground group, and no window is
/// current. Afterwards, whatever the pager's exit status (or when it could
/// not be started at all), LESSSECURE is set back (an unset variable comes
/// back set and empty), the console's terminal attributes and foreground
/// group are restored, keypad mode is switched off and on again, the
/// terminal's alternate screen (if it has one) is entered again, the
/// cursor is hidden or shown as before, and `screen` is repainted in full.
///
/// A pager stopped by the suspend key is continued at once: the console
/// has no shell to return to.

#include <string>
#include <vector>

namespace Tulk {

class RuntimeFrame;

/// The environment variable that puts the pager in secure mode.
inline constexpr char kLessSecure[] = "LESSSECURE";

/// Shows the host file `path` (such as "/var/log/syslog.log") in the pager
/// and repaints `screen` (the current window) when it ends.
void ShowLogInPager(RuntimeFrame* screen, const std::string& path);

/// The pager's argument vector for the host file `path` (already resolved
/// under the host root).
std::vector<std::string> PagerArguments(const std::string& path);

}  // namespace Tulk
