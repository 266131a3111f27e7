#pragma once
/// The key loop: every screen reads its keys through WaitForKey().
///
/// One poll() covers the keyboard, the signal pipe, the one-minute dimming
/// and the idle timeout, so the wait never spins.

#include <sys/time.h>

#include <cstdint>
#include <functional>
#include <optional>

namespace Tulk {

class RuntimeFrame;
class WorkerResult;

/// Thrown when a logged-in session has been idle for the configured
/// timeout. It has no data and no base class; RunFrame() lets it through
/// every frame up to the welcome screen, which ends the session.
struct TulkTimeout {};

/// PollInput() results besides key codes (>= 0).
inline constexpr int kPollOther = -1;
inline constexpr int kPollTimeLimit = -2;
inline constexpr int kPollReload = -3;     // SIGUSR1
inline constexpr int kPollExitAfter = -4;  // SIGUSR2
inline constexpr int kPollResize = -5;     // SIGWINCH
inline constexpr int kPollTerminate = -6;  // SIGINT, SIGQUIT, SIGTERM
inline constexpr int kPollWoken = -7;      // the wake descriptor is readable
inline constexpr int kPollHangUp = -8;     // standard input hung up or ended

/// WaitForKeyOrResult(): the worker's result is set.
inline constexpr int kKeyResultReady = kPollWoken;

/// Seconds without a key after which the screen is dimmed.
inline constexpr long kDimSeconds = 60;

/// Waits for a key on standard input or a byte on the signal pipe, at most
/// for `limit` (null: without limit). Returns the curses key code, or one
/// of the kPoll* values. With `wakeFd` >= 0 it also returns kPollWoken when
/// that descriptor is readable (a key or a signal byte that is ready too
/// comes first); the byte is left for its owner. Before a wait that can
/// block, a test harness is told that the console is ready (ReadySignal.h).
///
/// kPollHangUp: standard input hung up (POLLHUP, POLLERR, POLLNVAL), or it
/// was reported readable and gave no key with nothing left to read (a read
/// of 0 bytes or EIO). A poll() that fails other than by EINTR is logged
/// and followed by a pause of 100 ms, so that no failure can make the key
/// loop spin.
int PollInput(const timeval* limit, int wakeFd = -1);

/// Returns the next key for `frame`. With `idleTimeout` true and a
/// configured timeout, throws TulkTimeout after that many seconds without a
/// key (at least one minute). Dims the frame after a minute; the key that
/// wakes it is delivered. Ends the process with exit(0) on SIGUSR2 outside
/// a session, on a resize, on SIGINT, SIGQUIT, SIGTERM, SIGHUP or SIGPIPE,
/// and when the terminal hangs up (logged as "Terminal hung up"): the
/// console cannot be used any more, and a restart gets a new terminal.
int WaitForKey(RuntimeFrame* frame, bool idleTimeout);

/// WaitForKey(), but it also returns kKeyResultReady as soon as `result`
/// is set by its worker (at once when it is set already). Dimming, the idle
/// timeout and the signals work as in WaitForKey() while the worker runs:
/// this is how a screen waits for a background check and for Esc at the
/// same time, without polling.
int WaitForKeyOrResult(RuntimeFrame* frame, bool idleTimeout, const WorkerResult& result);

/// Applies the terminal's new size to curses and logs it.
void HandleResize();

/// Marks the session open or closed; opening it re-reads the idle timeout.
void SetLoggedIn(bool value);

/// Reads "/UserVars/TulkTimeOut" again (after the operator changed it).
void ReloadIdleTimeout();

/// The idle timeout in seconds (0 = no timeout).
std::uint32_t IdleTimeoutSeconds();

/// Registration at start-up: how the idle timeout is read from the host
/// (nullopt when the option cannot be read; 600 is used then).
void SetIdleTimeoutReader(std::function<std::optional<std::uint32_t>()> reader);

/// Registration at start-up: the smart-card check run on SIGUSR1.
void SetSmartCardCheck(std::function<void()> check);

}  // namespace Tulk
