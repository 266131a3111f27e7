#pragma once
/// Hands the terminal to the pager to show one log file, and takes it
/// back.
///
/// The pager is "/bin/less" (under the host root) with "less", "-cfP",
/// "<Q> Quit </> RegExp Search <H> Help" and the file: it repaints from
/// the top and shows that prompt. It runs with LESSSECURE=1, which keeps it
/// from running shell commands, opening other files or writing files, and
/// with LESSHISTFILE=- (no history file is written, in the operator's home
/// or anywhere else).
///
/// Decisions of this implementation: the pager gets none of the pager
/// variables of the console's environment but LESSSECURE (LESS=-R would let
/// a log's escape sequences reach the terminal, LESSOPEN would run a
/// preprocessor on the file), and it shows the file as ASCII
/// (LESSCHARSET=ascii): control characters as "^X", ESC as "ESC" and every
/// other byte outside ASCII as "<XX>". Host logs are ASCII; a log line
/// holding bidirectional-text controls (U+202E and the like), which the
/// pager would pass through to the terminal in a UTF-8 character set,
/// cannot then reorder what the operator reads.
///
/// Only a regular file (or one that does not exist: the pager then says
/// so) is shown. Anything else in a log's place (a FIFO, a device such as
/// /dev/zero or /dev/tty) would hang the pager, and with it the console:
/// it is not opened, and "Not showing %s: not a regular file" is logged at
/// warning level.
///
/// While it runs the console's screen is suspended: the terminal has the
/// attributes saved at start-up (runtime/Terminal.h) with the suspend key
/// switched off (the console has no shell to return to) and flow control
/// off (Ctrl-S would otherwise freeze the pager's output, and the pager with
/// it, until Ctrl-Q), the pager is in
/// front of the console (runtime/ForegroundProgram.h) and no window is
/// current. Afterwards, whatever the pager's exit status (or when it could
/// not be started at all), LESSSECURE is set back (an unset variable comes
/// back set and empty), the console's terminal attributes and foreground
/// group are restored, keypad mode is switched off and on again, the
/// terminal's alternate screen (if it has one) is entered again, the
/// cursor is hidden or shown as before, and `screen` is repainted in full.
///
/// The session's idle timeout keeps running while the pager is open (keys
/// read by the pager count as activity): when it passes, the pager is
/// ended, the terminal taken back and TulkTimeout thrown, so the session
/// ends as it does everywhere else. A resize while the pager ran (only the
/// pager hears of it) ends the console once the pager is done, as a resize
/// does in the key loop.

#include <string>
#include <vector>

namespace Tulk {

class RuntimeFrame;

/// The environment variable that puts the pager in secure mode.
inline constexpr char kLessSecure[] = "LESSSECURE";
/// The environment variable that names the pager's history file.
inline constexpr char kLessHistoryFile[] = "LESSHISTFILE";
/// The environment variable that names the pager's character set.
inline constexpr char kLessCharacterSet[] = "LESSCHARSET";

/// Shows the host file `path` (such as "/var/log/syslog.log") in the pager
/// and repaints `screen` (the current window) when it ends. Throws
/// TulkTimeout when the session's idle timeout ended the pager.
void ShowLogInPager(RuntimeFrame* screen, const std::string& path);

/// Whether the file at `hostPath` (resolved under the host root) may be
/// given to the pager: a regular file, or one that cannot be found.
bool PageableFile(const std::string& hostPath);

/// The pager's argument vector for the host file `path` (already resolved
/// under the host root).
std::vector<std::string> PagerArguments(const std::string& path);

}  // namespace Tulk
