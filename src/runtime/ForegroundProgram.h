#pragma once
/// Running a program in front of the console: the program's own process
/// group becomes the terminal's foreground group while the console waits,
/// and the console takes the terminal back when it has ended. The log pager
/// is such a program.
///
/// While the program runs the console draws nothing and reads no key, but
/// it is not deaf:
/// - SIGINT, SIGQUIT, SIGTERM, SIGHUP and SIGPIPE end the program (SIGTERM
///   to its process group, SIGKILL when it has not gone after a second),
///   then the console as everywhere else (exit 0);
/// - SIGUSR1, SIGUSR2 and SIGWINCH are handed back to the signal pipe and
///   acted on by the next key wait (a SIGWINCH then ends the console as a
///   resize does, whether or not the size changed; a real resize reaches
///   only the program, and ExitIfResizedMeanwhile() notices it);
/// - a program stopped from the outside is continued: the console has no
///   shell to return to;
/// - with the idle timeout active, the session's deadline keeps running as
///   in WaitForKey() (at least one minute from the start), moved on by the
///   keys the program reads. The console learns of those through the
///   terminal's access time, which the kernel updates at most every eight
///   seconds. When the deadline passes, the program is ended and the
///   caller hears of it.
///
/// The console wakes once a second meanwhile (to notice a stop and the
/// keys), and at once when the program ends or a signal arrives.

#include <string>
#include <vector>

namespace Tulk {

/// How a program run in front of the console ended.
enum class ForegroundEnd {
  /// It exited, or could not be started.
  kEnded,
  /// The session's idle deadline passed; the program was ended.
  kIdleTimeout,
};

/// Runs `program` with `arguments` (arguments[0] is the name it sees) and
/// `environment` ("NAME=value" entries) in front of the console, on the
/// terminal as it is (the caller sets its attributes), with the signals the
/// console blocks unblocked and their defaults restored. `idleTimeout`
/// says whether the session's idle timeout applies. When this returns, the
/// console's process group owns the terminal again.
ForegroundEnd RunInForeground(const std::string& program, const std::vector<std::string>& arguments,
                              const std::vector<std::string>& environment, bool idleTimeout);

/// Ends the console as a resize in the key loop does (HandleResize(), then
/// exit 0) when the terminal's size is no longer the one curses draws on:
/// while a program ran in front of the console, the resize signal went to
/// that program only.
void ExitIfResizedMeanwhile();

}  // namespace Tulk
