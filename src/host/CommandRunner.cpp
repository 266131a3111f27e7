#include "host/CommandRunner.h"

#include <fcntl.h>
#include <poll.h>
#include <pthread.h>
#include <signal.h>
#include <spawn.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <syslog.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <cmath>
#include <cstdlib>
#include <optional>
#include <string_view>
#include <utility>

#include "runtime/ChildProcess.h"
#include "runtime/HostPath.h"
#include "runtime/ScreenFlush.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

using SteadyClock = std::chrono::steady_clock;

constexpr int kPollMilliseconds = 20;
constexpr int kReapAttempts = 5;

class Descriptor {
 public:
  Descriptor() = default;
  explicit Descriptor(int fd) : fd_(fd) {}
  ~Descriptor() { Close(); }
  Descriptor(const Descriptor&) = delete;
  Descriptor& operator=(const Descriptor&) = delete;
  Descriptor(Descriptor&& other) noexcept : fd_(std::exchange(other.fd_, -1)) {}
  Descriptor& operator=(Descriptor&& other) noexcept {
    if (this != &other) {
      Close();
      fd_ = std::exchange(other.fd_, -1);
    }
    return *this;
  }

  int Get() const { return fd_; }
  bool IsOpen() const { return fd_ >= 0; }
  void Close() {
    if (fd_ >= 0) {
      close(fd_);
      fd_ = -1;
    }
  }

 private:
  int fd_ = -1;
};

struct Pipe {
  Descriptor read;
  Descriptor write;
};

bool OpenPipe(Pipe& pipe) {
  int fds[2];
  if (pipe2(fds, O_CLOEXEC) != 0) {
    LogErrno("pipe() failed");
    return false;
  }
  pipe.read = Descriptor(fds[0]);
  pipe.write = Descriptor(fds[1]);
  return true;
}

class SpawnActions {
 public:
  SpawnActions() { posix_spawn_file_actions_init(&actions_); }
  ~SpawnActions() { posix_spawn_file_actions_destroy(&actions_); }
  SpawnActions(const SpawnActions&) = delete;
  SpawnActions& operator=(const SpawnActions&) = delete;
  posix_spawn_file_actions_t* Get() { return &actions_; }

 private:
  posix_spawn_file_actions_t actions_;
};

class SpawnAttributes {
 public:
  SpawnAttributes() { posix_spawnattr_init(&attributes_); }
  ~SpawnAttributes() { posix_spawnattr_destroy(&attributes_); }
  SpawnAttributes(const SpawnAttributes&) = delete;
  SpawnAttributes& operator=(const SpawnAttributes&) = delete;
  posix_spawnattr_t* Get() { return &attributes_; }

 private:
  posix_spawnattr_t attributes_;
};

// Writing to a pipe whose reader has gone raises SIGPIPE, which would end
// the console. The signal is blocked in this thread for the write and a
// SIGPIPE the write raised is taken off the pending set before unblocking.
class SigpipeGuard {
 public:
  SigpipeGuard() {
    sigemptyset(&set_);
    sigaddset(&set_, SIGPIPE);
    sigset_t pending;
    sigpending(&pending);
    alreadyPending_ = sigismember(&pending, SIGPIPE) == 1;
    sigset_t old;
    pthread_sigmask(SIG_BLOCK, &set_, &old);
    wasBlocked_ = sigismember(&old, SIGPIPE) == 1;
  }
  ~SigpipeGuard() {
    if (raised_ && !alreadyPending_) {
      timespec zero{};
      while (sigtimedwait(&set_, nullptr, &zero) < 0 && errno == EINTR) {
      }
    }
    if (!wasBlocked_) {
      pthread_sigmask(SIG_UNBLOCK, &set_, nullptr);
    }
  }
  SigpipeGuard(const SigpipeGuard&) = delete;
  SigpipeGuard& operator=(const SigpipeGuard&) = delete;
  void Raised() { raised_ = true; }

 private:
  sigset_t set_;
  bool alreadyPending_ = false;
  bool wasBlocked_ = false;
  bool raised_ = false;
};

std::string ResolveProgram(const std::string& program) {
  if (program.empty() || program.front() == '/') {
    return HostPath(program);
  }
  if (program.find('/') != std::string::npos) {
    return program;
  }
  const std::string searchPath = ProgramSearchPath();
  std::string_view search = searchPath;
  while (!search.empty()) {
    std::size_t colon = search.find(':');
    std::string_view folder = search.substr(0, colon);
    search = colon == std::string_view::npos ? std::string_view() : search.substr(colon + 1);
    if (folder.empty()) {
      continue;
    }
    std::string candidate = std::string(folder) + "/" + program;
    if (access(candidate.c_str(), X_OK) == 0) {
      return candidate;
    }
  }
  return program;
}

// One optional capture: the caller's buffer, its capacity and the pipe.
struct Capture {
  Capture(char* callerBuffer, std::int32_t* callerLength)
      : buffer(callerBuffer), length(callerLength) {
    if (Wanted()) {
      capacity = std::max<std::int32_t>(*length, 0);
      *length = 0;
      if (capacity > 0) {
        buffer[0] = '\0';
      }
    }
  }
  bool Wanted() const { return buffer != nullptr && length != nullptr; }
  Pipe* PipeOrNull() { return Wanted() ? &pipe : nullptr; }

  char* buffer;
  std::int32_t* length;
  std::int32_t capacity = 0;
  Pipe pipe;
};

void RouteOutput(SpawnActions& actions, int target, const Pipe* pipe) {
  if (pipe != nullptr) {
    posix_spawn_file_actions_adddup2(actions.Get(), pipe->write.Get(), target);
  } else {
    posix_spawn_file_actions_addopen(actions.Get(), target, "/dev/null", O_WRONLY, 0);
  }
}

std::optional<pid_t> Spawn(const std::string& program, const std::vector<std::string>& arguments,
                           const std::vector<std::string>* environment, const Pipe& in,
                           const Pipe* out, const Pipe* err) {
  SpawnActions actions;
  posix_spawn_file_actions_adddup2(actions.Get(), in.read.Get(), 0);
  RouteOutput(actions, 1, out);
  RouteOutput(actions, 2, err);
  posix_spawn_file_actions_addclosefrom_np(actions.Get(), 3);

  SpawnAttributes attributes;
  sigset_t none;
  sigemptyset(&none);
  sigset_t all;
  sigfillset(&all);
  posix_spawnattr_setsigmask(attributes.Get(), &none);
  posix_spawnattr_setsigdefault(attributes.Get(), &all);
  posix_spawnattr_setpgroup(attributes.Get(), 0);
  posix_spawnattr_setflags(attributes.Get(),
                           POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF | POSIX_SPAWN_SETPGROUP);

  std::string path = ResolveProgram(program);
  std::vector<std::string> argumentCopy = arguments;
  if (argumentCopy.empty()) {
    argumentCopy.push_back(program);
  }
  std::vector<std::string> environmentCopy = ChildEnvironment(environment);
  std::vector<char*> argv = ExecVector(argumentCopy);
  std::vector<char*> envp = ExecVector(environmentCopy);

  pid_t pid = -1;
  int rc =
      posix_spawn(&pid, path.c_str(), actions.Get(), attributes.Get(), argv.data(), envp.data());
  if (rc != 0) {
    errno = rc;
    LogErrno("posix_spawn() failed");
    return std::nullopt;
  }
  return pid;
}

double ReadLimitScale() {
  const char* text = std::getenv("TULK_COMMAND_TIME_SCALE");
  if (text == nullptr || *text == '\0') {
    return 1.0;
  }
  char* end = nullptr;
  const double scale = std::strtod(text, &end);
  return end != text && scale > 0.0 ? scale : 1.0;
}

// The real time a limit of `seconds` lasts (TULK_COMMAND_TIME_SCALE).
std::chrono::milliseconds LimitDuration(int seconds) {
  static const double scale = ReadLimitScale();
  return std::chrono::milliseconds(
      static_cast<std::int64_t>(std::ceil(std::max(seconds, 0) * 1000.0 / scale)));
}

// A descriptor that becomes readable when the child exits, so the poll
// below wakes at once instead of at the next 20 ms tick; -1 on kernels
// without pidfd support, which then sleep between the non-blocking waits.
int OpenPidfd(pid_t pid) {
  return static_cast<int>(syscall(SYS_pidfd_open, pid, 0));
}

int MillisecondsUntil(SteadyClock::time_point deadline) {
  auto left = std::chrono::ceil<std::chrono::milliseconds>(deadline - SteadyClock::now());
  return static_cast<int>(std::clamp<std::int64_t>(left.count(), 0, kPollMilliseconds));
}

// Waits up to `milliseconds` for `fd` to report `events` (or for the child
// behind a pidfd to exit); a plain sleep when there is no descriptor.
void WaitFor(int fd, short events, int milliseconds) {
  if (fd < 0) {
    timespec pause{0, static_cast<long>(milliseconds) * 1000000L};
    nanosleep(&pause, nullptr);
    return;
  }
  pollfd entry{fd, events, 0};
  poll(&entry, 1, milliseconds);
}

void WriteInput(Descriptor& fd, const char* input, std::int32_t length,
                std::optional<SteadyClock::time_point> deadline) {
  if (input != nullptr && length > 0) {
    if (deadline) {
      fcntl(fd.Get(), F_SETFL, fcntl(fd.Get(), F_GETFL) | O_NONBLOCK);
    }
    SigpipeGuard guard;
    std::int32_t done = 0;
    while (done < length) {
      ssize_t written = write(fd.Get(), input + done, static_cast<std::size_t>(length - done));
      if (written > 0) {
        done += static_cast<std::int32_t>(written);
      } else if (written < 0 && errno == EINTR) {
        continue;
      } else if (written < 0 && errno == EAGAIN) {
        if (deadline && SteadyClock::now() >= *deadline) {
          break;
        }
        WaitFor(fd.Get(), POLLOUT, deadline ? MillisecondsUntil(*deadline) : kPollMilliseconds);
      } else {
        if (errno == EPIPE) {
          guard.Raised();
        }
        break;
      }
    }
  }
  fd.Close();
}

void ReapBriefly(pid_t pid, int pidfd) {
  for (int attempt = 0; attempt < kReapAttempts; ++attempt) {
    int status = 0;
    if (waitpid(pid, &status, WNOHANG) != 0) {
      return;
    }
    WaitFor(pidfd, POLLIN, kPollMilliseconds);
  }
}

// Returns the wait status, or nullopt when the child was killed or could not
// be waited for.
std::optional<int> WaitForChild(pid_t pid, int timeoutSeconds, SteadyClock::time_point deadline) {
  int status = 0;
  if (timeoutSeconds <= 0) {
    while (waitpid(pid, &status, 0) < 0) {
      if (errno != EINTR) {
        LogErrno("waitpid() failed");
        return std::nullopt;
      }
    }
    return status;
  }
  Descriptor pidfd(OpenPidfd(pid));
  for (;;) {
    pid_t done = waitpid(pid, &status, WNOHANG);
    if (done == pid) {
      return status;
    }
    if (done < 0 && errno != EINTR) {
      LogErrno("waitpid() failed");
      return std::nullopt;
    }
    if (SteadyClock::now() >= deadline) {
      Log(LOG_WARNING, "Killing process because %d seconds timeout expired", timeoutSeconds);
      kill(-pid, SIGKILL);
      kill(pid, SIGKILL);
      ReapBriefly(pid, pidfd.Get());
      return std::nullopt;
    }
    WaitFor(pidfd.Get(), POLLIN, MillisecondsUntil(deadline));
  }
}

void ReadCapture(Capture& capture) {
  if (!capture.Wanted() || capture.capacity == 0) {
    return;
  }
  int fd = capture.pipe.read.Get();
  fcntl(fd, F_SETFL, fcntl(fd, F_GETFL) | O_NONBLOCK);
  std::int32_t limit = capture.capacity - 1;
  std::int32_t got = 0;
  while (got < limit) {
    ssize_t n = read(fd, capture.buffer + got, static_cast<std::size_t>(limit - got));
    if (n > 0) {
      got += static_cast<std::int32_t>(n);
    } else if (n < 0 && errno == EINTR) {
      continue;
    } else {
      break;
    }
  }
  capture.buffer[got] = '\0';
  *capture.length = got;
}

int Run(const std::string& program, const std::vector<std::string>& arguments, char* output,
        std::int32_t* outputLength, char* error, std::int32_t* errorLength, const char* input,
        std::int32_t inputLength, int timeoutSeconds, const std::vector<std::string>* environment) {
  // What the screen announces is on the terminal before the command runs.
  FlushBeforeCommand();
  Capture out(output, outputLength);
  Capture err(error, errorLength);
  Pipe in;
  if (!OpenPipe(in) || (out.Wanted() && !OpenPipe(out.pipe)) ||
      (err.Wanted() && !OpenPipe(err.pipe))) {
    return -1;
  }

  std::optional<pid_t> pid =
      Spawn(program, arguments, environment, in, out.PipeOrNull(), err.PipeOrNull());
  if (!pid) {
    return -1;
  }
  SteadyClock::time_point deadline = SteadyClock::now() + LimitDuration(timeoutSeconds);
  in.read.Close();
  out.pipe.write.Close();
  err.pipe.write.Close();

  WriteInput(in.write, input, inputLength,
             timeoutSeconds > 0 ? std::optional(deadline) : std::nullopt);
  std::optional<int> status = WaitForChild(*pid, timeoutSeconds, deadline);

  ReadCapture(out);
  ReadCapture(err);

  if (!status) {
    return -1;
  }
  if (WIFEXITED(*status)) {
    return WEXITSTATUS(*status);
  }
  Log(LOG_ERR, "Run Command did not terminate normally");
  return -1;
}

}  // namespace

int RunCommand(const std::string& program, const std::vector<std::string>& arguments, char* output,
               std::int32_t* outputLength, char* error, std::int32_t* errorLength,
               const char* input, std::int32_t inputLength, int timeoutSeconds,
               const std::vector<std::string>* environment) noexcept {
  try {
    return Run(program, arguments, output, outputLength, error, errorLength, input, inputLength,
               timeoutSeconds, environment);
  } catch (const std::exception& failure) {
    Log(LOG_ERR, "Run Command failed: %s", failure.what());
    return -1;
  }
}

int RunShellCommand(const std::string& commandLine, int timeoutSeconds) noexcept {
  try {
    return RunCommand("/bin/sh", {"sh", "-c", commandLine}, nullptr, nullptr, nullptr, nullptr,
                      nullptr, 0, timeoutSeconds);
  } catch (const std::exception&) {
    return -1;
  }
}

int RunLoggedCommand(const std::string& program, const std::vector<std::string>& arguments,
                     const std::vector<std::string>* environment, int timeoutSeconds) noexcept {
  try {
    char output[kCaptureBufferSize];
    char error[kCaptureBufferSize];
    std::int32_t outputLength = kCaptureBufferSize;
    std::int32_t errorLength = kCaptureBufferSize;
    int rc = RunCommand(program, arguments, output, &outputLength, error, &errorLength, nullptr, 0,
                        timeoutSeconds, environment);
    std::string command = CommandText(arguments);
    if (rc != 0) {
      Log(LOG_ERR, "Command \"%s\" failed (rc=%d): (stdout=%s, stderr=%s)", command.c_str(), rc,
          output, error);
    } else {
      Log(LOG_INFO, "Command \"%s\" succeeded", command.c_str());
    }
    return rc;
  } catch (const std::exception&) {
    return -1;
  }
}

std::string CommandText(const std::vector<std::string>& arguments) {
  std::string text;
  for (std::size_t index = 0; index < arguments.size(); ++index) {
    if (index > 0) {
      text += ' ';
    }
    text += arguments[index];
  }
  return text;
}

}  // namespace Tulk
