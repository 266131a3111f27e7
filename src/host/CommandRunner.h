#pragma once
/// The one way the console starts programs: a runner with pipes, optional
/// standard input, a timeout and captured output, and the two thin runners
/// built on it.
///
/// Every function here returns an exit code and never throws: the
/// program's exit status (0 to 255) when it ended normally, -1 when the
/// pipes or the start failed, when it was killed by the timeout, or when it
/// ended by a signal. Failures are logged to the system log.
///
/// Programs and their environment:
/// - The program path goes through HostPath(), so "/bin/sh" names the
///   confined root's shell under a test or demo root. A path without a
///   slash is looked up in ProgramSearchPath().
/// - The child starts with an empty signal mask and default signal
///   dispositions (the console blocks six signals in every thread), and
///   inherits no descriptor beyond 0 to 2.
/// - The child's environment is ChildEnvironment() (runtime/ChildProcess.h):
///   with a confined root (TULK_ROOT not "/") its PATH is always
///   ProgramSearchPath(), also in an environment the caller gives, and a
///   given environment is completed with the process's TULK_* variables, so
///   that simulated host tools see the same root, host state and log copy
///   as the console.
///
/// - The child runs in a process group of its own: a command killed by its
///   time limit takes every process it started with it (the programs of a
///   shell pipeline), and keys typed at the console never signal it.
///
/// Test seam: TULK_COMMAND_TIME_SCALE set to a number N > 0 makes every
/// time limit pass N times faster in real time (the warning still names
/// the limit in seconds), so that tests of hung commands need not wait for
/// the full limits.
///
/// The screen: before it starts a program, the runner sends the screen's
/// pending changes to the terminal (FlushBeforeCommand(),
/// runtime/ScreenFlush.h), so that what the console announces is shown
/// before the command runs. Queries run inside a HostQueryScope and send
/// nothing.
///
/// Safe to call from any thread: the runner keeps no shared state (only
/// the main thread sends the screen).

#include <cstdint>
#include <string>
#include <vector>

namespace Tulk {

/// Capacity of the capture buffers the wrappers use: 255 bytes of text and
/// the terminating NUL.
inline constexpr std::int32_t kCaptureBufferSize = 256;

/// Time limits (seconds) of the commands the console runs. The console runs
/// them on its main thread, so a command that hangs would freeze the screen
/// and keep every key and signal waiting: none runs without a limit. A
/// command killed by its limit ends with -1 and the warning "Killing
/// process because %d seconds timeout expired", and its caller takes the
/// same path as for any other failure of the command.
///
/// Decisions of this implementation (the limits):
/// | Limit | Seconds | Commands |
/// |---|---|---|
/// | kQueryTimeoutSeconds | 10 | reads: the "get" forms of osk-cmd, service "status" scripts, the certificate thumbprint (openssl), host key fingerprints (ssh-keygen) |
/// | kPackageQueryTimeoutSeconds | 30 | the package query behind the operations agent's version test (the package database is slower to ask) |
/// | kChangeTimeoutSeconds | 60 | changes: osk-cmd commands, tavcli settings and switch commands, service start, stop and restart, the configuration backup; the default of RunShellCommand() and RunLoggedCommand() |
/// | kPowerCommandTimeoutSeconds | 120 | the power-off and restart command lines (on a real host they do not return) |
/// | kResetTimeoutSeconds | 300 | the reset of the system configuration |
/// | kPowerOffVmsTimeoutSeconds | 900 | stopping the virtual machines before a shutdown, a restart or a factory network restore (guests shut down one after another) |
inline constexpr int kQueryTimeoutSeconds = 10;
inline constexpr int kPackageQueryTimeoutSeconds = 30;
inline constexpr int kChangeTimeoutSeconds = 60;
inline constexpr int kPowerCommandTimeoutSeconds = 120;
inline constexpr int kResetTimeoutSeconds = 300;
inline constexpr int kPowerOffVmsTimeoutSeconds = 900;

/// Runs `program` with `arguments` (arguments[0] is the name the program
/// sees; an empty vector passes the program path alone) and returns its exit
/// code.
///
/// Captures: `output`/`outputLength` and `error`/`errorLength` are optional
/// caller-owned buffers; on entry the length is the buffer's capacity, on
/// return the number of bytes captured. At most capacity - 1 bytes are
/// captured and the text is always NUL-terminated inside the buffer. The
/// captures are read only after the child has ended (or was killed), so a
/// child that writes more than a pipe holds (64 KiB) blocks until the
/// timeout ends it; keep captures small. An absent capture sends that
/// stream to "/dev/null", so a chatty program can never block on it.
///
/// Input: when `input` is given, its `inputLength` bytes are written to the
/// child's standard input (retrying on EAGAIN and EINTR, giving up on any
/// other error, such as a child that exits without reading), then the pipe
/// is closed so the child sees end of file. Without input the child sees
/// end of file at once.
///
/// Timeout: `timeoutSeconds` > 0 limits the run, counted from the start of
/// the child. The child is polled with a non-blocking wait every 20 ms (and
/// at once when it exits); when the time is used up, "Killing process
/// because %d seconds timeout expired" is logged at warning level, the
/// child's process group gets SIGKILL and the result is -1. The killed child is reaped if it goes
/// within 100 ms; it is not waited for beyond that. A timeout of 0 or less
/// waits without limit.
///
/// `environment` is a list of "NAME=value" entries; null means the process's
/// own environment.
///
/// A child that ends by a signal logs "Run Command did not terminate
/// normally" at error level. Failed system calls log "%s with errno(%d):
/// %s". Every descriptor the runner opened is closed on every path.
int RunCommand(const std::string& program, const std::vector<std::string>& arguments, char* output,
               std::int32_t* outputLength, char* error, std::int32_t* errorLength,
               const char* input, std::int32_t inputLength, int timeoutSeconds,
               const std::vector<std::string>* environment = nullptr) noexcept;

/// Runs "/bin/sh" with "sh", "-c" and `commandLine`: nothing captured, no
/// input, limited to `timeoutSeconds` (see the limits above). Returns the
/// exit code. The shell resolves the paths inside the line itself: name
/// programs without a folder (found through the confined PATH) or put host
/// paths through HostPath() when building the line.
int RunShellCommand(const std::string& commandLine,
                    int timeoutSeconds = kChangeTimeoutSeconds) noexcept;

/// Runs `program` capturing up to 255 bytes each of output and error,
/// limited to `timeoutSeconds`, then logs "Command \"%s\" failed (rc=%d):
/// (stdout=%s, stderr=%s)" at error level when the exit code is not 0, or
/// "Command \"%s\" succeeded" at info level. The command text is
/// `arguments` joined with blanks. Returns the exit code.
int RunLoggedCommand(const std::string& program, const std::vector<std::string>& arguments,
                     const std::vector<std::string>* environment = nullptr,
                     int timeoutSeconds = kChangeTimeoutSeconds) noexcept;

/// `arguments` joined with single blanks: the command text of the log lines.
std::string CommandText(const std::vector<std::string>& arguments);

}  // namespace Tulk
