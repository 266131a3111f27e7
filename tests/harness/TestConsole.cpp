#include "TestConsole.h"

#include <fcntl.h>
#include <poll.h>
#include <pty.h>
#include <signal.h>
#include <sys/ioctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <fstream>
#include <sstream>
#include <stdexcept>

#include "KeyNames.h"
#include "ProcessHygiene.h"

namespace TulkTest {
namespace {

using Clock = std::chrono::steady_clock;

}  // namespace

std::string TulkBinary() {
  return TULK_TEST_TULK_BINARY;
}

std::string HostToolBinary() {
  return TULK_TEST_HOSTTOOL_BINARY;
}

TestConsole::TestConsole(Options options)
    : options_(std::move(options)), folder_(options_, HostToolBinary()) {
  terminal_ = std::make_unique<VirtualTerminal>(options_.rows, options_.cols);
  if (options_.start) {
    Start();
  }
}

TestConsole::~TestConsole() {
  Stop();
  if (master_ >= 0) {
    close(master_);
  }
}

void TestConsole::Start() {
  std::string program = options_.program.empty() ? TulkBinary() : options_.program;
  std::vector<std::string> argv{program};
  argv.insert(argv.end(), options_.args.begin(), options_.args.end());
  std::vector<std::string> env =
      folder_.Environment(options_, {{"TULK_READY_FD", std::to_string(ReadyChannel::kChildFd)}});

  winsize size{};
  size.ws_row = static_cast<unsigned short>(options_.rows);
  size.ws_col = static_cast<unsigned short>(options_.cols);
  NoteSent();
  pid_ = forkpty(&master_, nullptr, nullptr, &size);
  if (pid_ < 0) {
    throw std::runtime_error("forkpty failed: " + std::string(std::strerror(errno)));
  }
  if (pid_ == 0) {
    ready_.PassToChild();
    close_range(ReadyChannel::kChildFd + 1, ~0U, 0);
    sigset_t none;
    sigemptyset(&none);
    sigprocmask(SIG_SETMASK, &none, nullptr);
    std::vector<char*> args;
    for (const std::string& arg : argv) {
      args.push_back(const_cast<char*>(arg.c_str()));
    }
    args.push_back(nullptr);
    std::vector<char*> envp;
    for (const std::string& entry : env) {
      envp.push_back(const_cast<char*>(entry.c_str()));
    }
    envp.push_back(nullptr);
    chdir(folder_.Path().c_str());
    execve(args[0], args.data(), envp.data());
    _exit(127);
  }
  ready_.CloseWriteEnd();
  fcntl(master_, F_SETFL, fcntl(master_, F_GETFL) | O_NONBLOCK);
  fcntl(master_, F_SETFD, FD_CLOEXEC);
}

void TestConsole::Stop() {
  if (pid_ <= 0 || reaped_) {
    return;
  }
  if (!exitStatus_) {
    // A terminating signal ends the console through exit(): pam_wrapper
    // removes its folder then, and the sanitizers run their exit checks.
    kill(pid_, SIGTERM);
    const auto deadline = std::chrono::steady_clock::now() + 5s;
    while (!exitStatus_ && std::chrono::steady_clock::now() < deadline) {
      Pump(10ms);
      CheckExit(false);
    }
    if (!exitStatus_) {
      kill(pid_, SIGKILL);
      CheckExit(true);
    }
  }
  std::vector<pid_t> ended = SignalSession(pid_, SIGKILL);
  ended.push_back(pid_);
  if (!options_.pamUsers.empty()) {
    RemovePamFolders(folder_.Path().string() + "/", ended);
  }
  while (waitpid(pid_, nullptr, 0) < 0 && errno == EINTR) {
  }
  reaped_ = true;
}

void TestConsole::NoteSent() {
  lastSent_ = ReadyChannel::Now();
}

void TestConsole::Key(std::string_view name, int times) {
  std::string bytes;
  for (int i = 0; i < times; ++i) {
    bytes += KeyBytes(name);
  }
  Send(bytes);
}

void TestConsole::Type(std::string_view text) {
  Send(text);
}

void TestConsole::Send(std::string_view bytes) {
  AwaitTurn();
  Write(bytes);
}

void TestConsole::SendNow(std::string_view bytes) {
  Write(bytes);
}

void TestConsole::AwaitTurn() {
  if (!Running()) {
    return;
  }
  ready_.Read();
  // Only while the program itself holds the terminal: a pager in front of
  // it reads the keys, and the program reports nothing until it is back.
  if (ready_.Newest() <= lastSent_ && tcgetpgrp(master_) == pid_) {
    auto ready = WaitReady();
    if (!ready && Running()) {
      ADD_FAILURE() << "input waited for its turn in vain (SendNow() sends at once): "
                    << ready.message();
    }
  }
}

void TestConsole::Write(std::string_view bytes) {
  if (bytes.empty()) {
    return;  // no input: nothing the program could report about
  }
  NoteSent();
  while (!bytes.empty()) {
    ssize_t written = write(master_, bytes.data(), bytes.size());
    if (written < 0) {
      if (errno == EAGAIN || errno == EINTR) {
        Pump(10ms);
        continue;
      }
      return;
    }
    bytes.remove_prefix(static_cast<std::size_t>(written));
  }
}

void TestConsole::Signal(int signal) {
  AwaitTurn();
  if (Running()) {
    NoteSent();
    kill(pid_, signal);
  }
}

void TestConsole::Resize(int cols, int rows) {
  winsize size{};
  size.ws_row = static_cast<unsigned short>(rows);
  size.ws_col = static_cast<unsigned short>(cols);
  AwaitTurn();
  NoteSent();
  ioctl(master_, TIOCSWINSZ, &size);
  terminal_->Resize(rows, cols);
}

void TestConsole::Pump(Millis timeout) {
  if (master_ < 0) {
    return;
  }
  auto deadline = Clock::now() + timeout;
  for (;;) {
    auto left = std::chrono::duration_cast<Millis>(deadline - Clock::now());
    pollfd fds[2] = {{master_, POLLIN, 0}, {ready_.ReadEnd(), POLLIN, 0}};
    int ready = poll(fds, 2, static_cast<int>(std::max<long>(left.count(), 0)));
    if (ready <= 0) {
      return;
    }
    if ((fds[1].revents & POLLIN) != 0) {
      ready_.Read();
    }
    if ((fds[0].revents & (POLLIN | POLLHUP | POLLERR)) != 0) {
      char buffer[8192];
      ssize_t got = read(master_, buffer, sizeof buffer);
      if (got < 0 && errno != EAGAIN && errno != EINTR) {
        return;  // EIO: the program closed the terminal
      }
      if (got > 0) {
        Absorb(buffer, static_cast<std::size_t>(got));
      } else if (got == 0 || (fds[0].revents & POLLIN) == 0) {
        return;
      }
    }
    // Keep reading what is already there, without waiting any longer.
    deadline = std::min(deadline, Clock::now());
  }
}

void TestConsole::DrainOutput() {
  // read() on the pseudo-terminal, unlike poll(), first waits for the
  // kernel to pass on what the program has written: all output sent before
  // a readiness report is read here.
  char buffer[8192];
  for (;;) {
    ssize_t got = read(master_, buffer, sizeof buffer);
    if (got < 0 && errno == EINTR) {
      continue;
    }
    if (got <= 0) {
      return;
    }
    Absorb(buffer, static_cast<std::size_t>(got));
  }
}

void TestConsole::Absorb(const char* bytes, std::size_t count) {
  bytesReceived_ += count;
  if (options_.keepOutput) {
    output_.append(bytes, count);
  }
  terminal_->Write(std::string_view(bytes, count));
  std::string replies = terminal_->TakeReplies();
  if (!replies.empty()) {
    Write(replies);  // the program may be waiting for them: no turn to await
  }
}

::testing::AssertionResult TestConsole::WaitReady(Millis timeout) {
  auto deadline = Clock::now() + timeout;
  for (;;) {
    ready_.Read();
    if (ready_.Newest() > lastSent_) {
      DrainOutput();
      if (ready_.Newest() > lastSent_) {  // unless draining sent a reply
        return ::testing::AssertionSuccess();
      }
      continue;
    }
    CheckExit(false);
    if (exitStatus_) {
      Pump(0ms);
      return ::testing::AssertionFailure()
             << "the program ended (status " << *exitStatus_ << ") instead of waiting for a key\n"
             << Dump();
    }
    if (Clock::now() >= deadline) {
      return ::testing::AssertionFailure()
             << "the program did not wait for a key within " << timeout.count() << " ms\n"
             << Dump();
    }
    Pump(20ms);
  }
}

std::chrono::steady_clock::time_point TestConsole::ReadyAt() const {
  return std::chrono::steady_clock::time_point(std::chrono::nanoseconds(ready_.Newest()));
}

::testing::AssertionResult TestConsole::WaitForText(std::string_view text, Millis timeout) {
  return WaitUntil([&] { return Contains(text); }, "\"" + std::string(text) + "\" to appear",
                   timeout);
}

::testing::AssertionResult TestConsole::WaitForTextGone(std::string_view text, Millis timeout) {
  return WaitUntil([&] { return !Contains(text); }, "\"" + std::string(text) + "\" to go", timeout);
}

::testing::AssertionResult TestConsole::WaitUntil(const std::function<bool()>& condition,
                                                  std::string_view what, Millis timeout) {
  auto deadline = Clock::now() + timeout;
  for (;;) {
    Pump(0ms);
    if (condition()) {
      return ::testing::AssertionSuccess();
    }
    if (Clock::now() >= deadline) {
      return ::testing::AssertionFailure()
             << "timed out waiting for " << what << " (" << timeout.count() << " ms)\n"
             << Dump();
    }
    Pump(20ms);
  }
}

::testing::AssertionResult TestConsole::WaitForLog(std::string_view text, Millis timeout) {
  auto deadline = Clock::now() + timeout;
  for (;;) {
    for (const std::string& line : LogLines()) {
      if (line.find(text) != std::string::npos) {
        return ::testing::AssertionSuccess();
      }
    }
    if (Clock::now() >= deadline) {
      std::ostringstream lines;
      for (const std::string& line : LogLines()) {
        lines << "  " << line << "\n";
      }
      return ::testing::AssertionFailure() << "no log line with \"" << text << "\" within "
                                           << timeout.count() << " ms; the log holds:\n"
                                           << lines.str() << Dump();
    }
    Pump(20ms);
  }
}

void TestConsole::CheckExit(bool block) {
  if (pid_ <= 0 || exitStatus_ || reaped_) {
    return;
  }
  siginfo_t info{};
  int done;
  do {
    done = waitid(P_PID, static_cast<id_t>(pid_), &info, WEXITED | WNOWAIT | (block ? 0 : WNOHANG));
  } while (done < 0 && errno == EINTR);
  if (done == 0 && info.si_pid == pid_) {
    exitStatus_ = info.si_code == CLD_EXITED ? info.si_status : 128 + info.si_status;
  }
}

std::optional<int> TestConsole::WaitExit(Millis timeout) {
  auto deadline = Clock::now() + timeout;
  for (;;) {
    Pump(0ms);
    CheckExit(false);
    if (exitStatus_) {
      DrainOutput();
      return exitStatus_;
    }
    if (Clock::now() >= deadline) {
      return std::nullopt;
    }
    Pump(10ms);
  }
}

std::optional<termios> TestConsole::TerminalAttributes() const {
  termios attributes{};
  if (master_ < 0 || tcgetattr(master_, &attributes) != 0) {
    return std::nullopt;
  }
  return attributes;
}

std::string TestConsole::Row(int row) const {
  return terminal_->Row(row);
}

std::string TestConsole::Screen() const {
  std::string text;
  for (int row = 0; row < terminal_->Rows(); ++row) {
    text += terminal_->Row(row);
    text += '\n';
  }
  return text;
}

bool TestConsole::Contains(std::string_view text) const {
  for (int row = 0; row < terminal_->Rows(); ++row) {
    if (terminal_->Row(row).find(text) != std::string::npos) {
      return true;
    }
  }
  return false;
}

Cell TestConsole::At(int row, int col) const {
  return terminal_->At(row, col);
}

CursorState TestConsole::Cursor() const {
  return terminal_->Cursor();
}

std::string TestConsole::Dump() const {
  std::ostringstream out;
  CursorState cursor = terminal_->Cursor();
  out << "screen " << terminal_->Cols() << "x" << terminal_->Rows() << ", cursor at row "
      << cursor.row << " col " << cursor.col << (cursor.visible ? " (visible)" : " (hidden)")
      << ":\n";
  for (int row = 0; row < terminal_->Rows(); ++row) {
    char number[16];
    std::snprintf(number, sizeof number, "%2d|", row);
    out << number << terminal_->Row(row) << "|\n";
  }
  return out.str();
}

std::vector<std::string> TestConsole::LogLines() const {
  std::vector<std::string> lines;
  std::ifstream in(folder_.LogPath());
  std::string line;
  while (std::getline(in, line)) {
    lines.push_back(line);
  }
  return lines;
}

}  // namespace TulkTest
