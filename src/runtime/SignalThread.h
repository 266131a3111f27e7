#pragma once
/// The signal thread: turns asynchronous signals into one-byte codes on a
/// pipe that PollInput() reads.
///
/// | Signal                    | Code | PollInput() result |
/// |---------------------------|------|--------------------|
/// | SIGUSR1                   | 1    | -3                 |
/// | SIGUSR2                   | 2    | -4                 |
/// | SIGWINCH                  | 3    | -5                 |
/// | SIGINT, SIGQUIT, SIGTERM  | 4    | -6                 |

namespace Tulk {

/// Creates the pipe, blocks the six signals in the calling thread (so every
/// later thread inherits the mask) and starts the thread. Exits the process
/// with status 1 when the pipe or the thread cannot be created.
void StartSignalThread();

/// Read end of the signal pipe (-1 before StartSignalThread()).
int SignalPipeReadFd();

/// Maps a signal to its pipe code, 0 for signals that are not forwarded.
unsigned char SignalCode(int signal);

}  // namespace Tulk
