#pragma once
/// The signal thread: turns asynchronous signals into one-byte codes on a
/// pipe that PollInput() reads.
///
/// | Signal                                  | Code | PollInput() result |
/// |-----------------------------------------|------|--------------------|
/// | SIGUSR1                                 | 1    | -3                 |
/// | SIGUSR2                                 | 2    | -4                 |
/// | SIGWINCH                                | 3    | -5                 |
/// | SIGINT, SIGQUIT, SIGTERM, SIGHUP, SIGPIPE | 4  | -6                 |
///
/// Decisions of this implementation:
/// - SIGHUP and SIGPIPE end the console as the other terminating signals
///   do (exit 0 with the terminal restored), instead of killing it with
///   the terminal left in raw mode on the alternate screen. Either one that
///   was ignored when the console started (nohup, a service manager that
///   ignores SIGPIPE) stays ignored. With SIGPIPE taken here, a write to a
///   terminal whose reader is gone fails with EPIPE instead of killing the
///   console; the key loop then ends the console (TakeBrokenPipe()).
/// - SIGTSTP is taken and dropped: the console has no shell to return to,
///   and the curses library's own suspend handler would otherwise write to
///   the terminal from whatever thread it runs on, also while the pager
///   owns it.
/// - Bursts of SIGUSR1 are merged: while a reload code waits unread in the
///   pipe, further SIGUSR1 add nothing, so a flood of them costs at most one
///   reload beyond the one running and never delays a terminating signal
///   behind a queue of reloads.

namespace Tulk {

/// Creates the pipe, blocks the forwarded signals (and SIGTSTP) in the
/// calling thread (so every later thread inherits the mask) and starts the
/// thread. Exits the process with status 1 when the pipe or the thread
/// cannot be created.
void StartSignalThread();

/// Read end of the signal pipe (-1 before StartSignalThread()).
int SignalPipeReadFd();

/// Maps a signal to its pipe code, 0 for signals that are not forwarded.
unsigned char SignalCode(int signal);

/// Writes `signal`'s code to the pipe as the signal thread does (nothing
/// for a SIGUSR1 while a reload code is still unread). Safe from any
/// thread; used by the thread itself and to hand back a signal that a wait
/// outside the key loop took from the pipe.
void ForwardSignal(int signal);

/// Reads one code byte from the pipe (repeating on EINTR) and returns it,
/// or 0 when nothing was read. Reading the reload code lets the next
/// SIGUSR1 through again.
int ReadSignalCode();

/// True, once, when a write of the calling thread raised SIGPIPE (the
/// terminal's reader is gone); the signal is taken off the pending set.
bool TakeBrokenPipe();

}  // namespace Tulk
