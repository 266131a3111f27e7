// How the console ends when its terminal goes away or a signal asks it to,
// and when it cannot use its terminal at all: always with a known status,
// the terminal restored where there still is one, and never by spinning.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <poll.h>
#include <pty.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <optional>
#include <string>
#include <vector>

#include "TestConsole.h"
#include "VirtualTerminal.h"

namespace {

using namespace std::chrono_literals;
using Clock = std::chrono::steady_clock;
using TulkTest::Options;
using TulkTest::TestConsole;

// How long a wait lasts before it fails; a passing one ends much sooner.
constexpr auto kWaitLimit = 15s;

// Where the key-echo program reads its keys from.
enum class Input { kTerminal, kPipe, kDevNull };

// The key-echo program on a pseudo-terminal of its own, started with SIGHUP
// ignored (as under nohup), so that only the terminal itself can tell it
// that the line is gone. Its standard input is the terminal, a pipe the
// test holds, or /dev/null.
class LoneConsole {
 public:
  explicit LoneConsole(Input input) : terminal_(25, 80) {
    std::string pattern = (std::filesystem::temp_directory_path() / "tulk-end-XXXXXX").string();
    folder_ = mkdtemp(pattern.data());
    log_ = folder_ / "syslog.txt";
    int inputPipe[2] = {-1, -1};
    if (input == Input::kPipe && pipe(inputPipe) != 0) {
      throw std::runtime_error("pipe failed");
    }
    const std::string logSetting = "TULK_LOG_FILE=" + log_.string();
    const std::string rootSetting = "TULK_ROOT=" + folder_.string();
    winsize size{25, 80, 0, 0};
    pid_ = forkpty(&master_, nullptr, nullptr, &size);
    if (pid_ == 0) {
      signal(SIGHUP, SIG_IGN);
      sigset_t none;
      sigemptyset(&none);
      sigprocmask(SIG_SETMASK, &none, nullptr);
      if (input == Input::kPipe) {
        dup2(inputPipe[0], 0);
      } else if (input == Input::kDevNull) {
        const int null = open("/dev/null", O_RDONLY);
        dup2(null, 0);
      }
      close_range(3, ~0U, 0);
      const char* argv[] = {TULK_TEST_KEYECHO_BINARY, nullptr};
      const char* envp[] = {"TERM=xterm-256color", logSetting.c_str(), rootSetting.c_str(),
                            nullptr};
      execve(argv[0], const_cast<char* const*>(argv), const_cast<char* const*>(envp));
      _exit(127);
    }
    if (input == Input::kPipe) {
      close(inputPipe[0]);
      inputWriter_ = inputPipe[1];
    }
    fcntl(master_, F_SETFL, fcntl(master_, F_GETFL) | O_NONBLOCK);
  }

  ~LoneConsole() {
    if (!status_) {
      kill(pid_, SIGKILL);
      waitpid(pid_, nullptr, 0);
    }
    CloseInput();
    CloseTerminal();
    std::error_code ignored;
    std::filesystem::remove_all(folder_, ignored);
  }
  LoneConsole(const LoneConsole&) = delete;
  LoneConsole& operator=(const LoneConsole&) = delete;

  ::testing::AssertionResult WaitForText(const std::string& text) {
    const auto deadline = Clock::now() + kWaitLimit;
    while (Clock::now() < deadline) {
      Pump();
      for (int row = 0; row < terminal_.Rows(); ++row) {
        if (terminal_.Row(row).find(text) != std::string::npos) {
          return ::testing::AssertionSuccess();
        }
      }
    }
    return ::testing::AssertionFailure() << "\"" << text << "\" did not appear";
  }

  void Type(const std::string& bytes) {
    ssize_t written = write(master_, bytes.data(), bytes.size());
    (void)written;
  }
  void Signal(int signal) { kill(pid_, signal); }
  void CloseTerminal() {
    if (master_ >= 0) {
      close(master_);
      master_ = -1;
    }
  }
  void CloseInput() {
    if (inputWriter_ >= 0) {
      close(inputWriter_);
      inputWriter_ = -1;
    }
  }

  // The exit status once the program has ended, nullopt when it still runs
  // at the deadline (it is then killed by the destructor).
  std::optional<int> WaitExit() {
    const auto deadline = Clock::now() + kWaitLimit;
    while (!status_ && Clock::now() < deadline) {
      Pump();
      int status = 0;
      if (waitpid(pid_, &status, WNOHANG) == pid_) {
        status_ = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
      }
    }
    return status_;
  }

  bool Logged(const std::string& line) const {
    std::ifstream in(log_);
    for (std::string text; std::getline(in, text);) {
      if (text == line) {
        return true;
      }
    }
    return false;
  }

 private:
  void Pump() {
    if (master_ < 0) {
      poll(nullptr, 0, 20);
      return;
    }
    pollfd fd{master_, POLLIN, 0};
    if (poll(&fd, 1, 20) > 0) {
      char buffer[4096];
      const ssize_t got = read(master_, buffer, sizeof buffer);
      if (got > 0) {
        terminal_.Write(std::string_view(buffer, static_cast<std::size_t>(got)));
      }
    }
  }

  std::filesystem::path folder_;
  std::filesystem::path log_;
  TulkTest::VirtualTerminal terminal_;
  pid_t pid_ = -1;
  int master_ = -1;
  int inputWriter_ = -1;
  std::optional<int> status_;
};

TEST(Ending, LostTerminalEndsTheConsoleWithStatusZero) {
  struct Case {
    const char* name;
    Input input;
    // Null: the input has ended before the console starts (it may be gone
    // before its screen is read).
    void (*loseIt)(LoneConsole&);
  };
  const Case cases[] = {
      {"pseudo-terminal closed", Input::kTerminal, [](LoneConsole& c) { c.CloseTerminal(); }},
      {"input pipe closed", Input::kPipe, [](LoneConsole& c) { c.CloseInput(); }},
      {"input at the end of /dev/null", Input::kDevNull, nullptr},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    LoneConsole console(c.input);
    if (c.loseIt != nullptr) {
      ASSERT_TRUE(console.WaitForText("KEYECHO active"));
      c.loseIt(console);
    }
    EXPECT_EQ(console.WaitExit(), 0);
    EXPECT_TRUE(console.Logged("<14>Terminal hung up"));
  }
}

TEST(Ending, IgnoredHangUpSignalStaysIgnoredUntilTheLineGoes) {
  LoneConsole console(Input::kTerminal);
  ASSERT_TRUE(console.WaitForText("KEYECHO active"));
  console.Signal(SIGHUP);
  console.Type("x");
  EXPECT_TRUE(console.WaitForText("keys: 1"));
  console.CloseTerminal();
  EXPECT_EQ(console.WaitExit(), 0);
}

TEST(Ending, HangUpAndBrokenPipeSignalsRestoreTheTerminal) {
  for (int signal : {SIGHUP, SIGPIPE}) {
    TestConsole console(TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY));
    ASSERT_TRUE(console.WaitForText("KEYECHO active"));
    const termios before = *console.TerminalAttributes();
    console.Signal(signal);
    EXPECT_EQ(console.WaitExit(), 0) << "signal " << signal;
    // endwin() ran: the alternate screen is left, the cursor shows again
    // and the line is back in the mode the console found it in.
    EXPECT_FALSE(console.Contains("KEYECHO")) << console.Dump();
    EXPECT_TRUE(console.Cursor().visible) << "signal " << signal;
    const termios after = *console.TerminalAttributes();
    EXPECT_NE(after.c_lflag, before.c_lflag) << "still in the console's raw mode";
    EXPECT_NE(after.c_lflag & ICANON, 0U);
  }
}

TEST(Ending, TerminalTypeCursesCannotUseIsLogged) {
  for (const char* term : {"no-such-terminal", ""}) {
    Options options;
    options.env["TERM"] = term;
    TestConsole console(options);
    EXPECT_EQ(console.WaitExit(), 1) << "TERM=" << term;
    EXPECT_TRUE(console.WaitForLog(std::string("<11>Error opening terminal: ") + term + "."));
  }
}

}  // namespace
