#pragma once
/// Drives a real console binary in a pseudo-terminal and reads its screen
/// through a terminal emulator.
///
/// Each TestConsole gets a fresh host root under a temporary folder
/// (TULK_ROOT), with the simulated host tools installed when available, a
/// copy of the system log (TULK_LOG_FILE) and, when given, its own host
/// state file (TULK_HOST_STATE). Waits take a deadline and return an
/// assertion result whose failure message holds the whole screen:
///
///   TulkTest::TestConsole console;
///   ASSERT_TRUE(console.WaitForText("Customize System"));
///   console.Key("F2");
///   EXPECT_EQ(console.At(10, 12).bg, Tulk::kYellow);
///
/// The folder is removed afterwards unless TULK_KEEP_TEST_ROOT is set.

#include <gtest/gtest.h>
#include <sys/types.h>
#include <termios.h>

#include <chrono>
#include <filesystem>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "VirtualTerminal.h"

namespace TulkTest {

using namespace std::chrono_literals;
using Millis = std::chrono::milliseconds;

struct Options {
  int cols = 80;
  int rows = 25;
  /// TERM for the program; empty leaves TERM unset.
  std::string term = "xterm-256color";
  /// Arguments after the program name.
  std::vector<std::string> args;
  /// Extra environment; these win over the harness's own settings.
  std::map<std::string, std::string> env;
  /// Variables removed from the environment.
  std::vector<std::string> unsetEnv;
  /// The program; empty means the tulk binary of this build.
  std::string program;
  /// JSON text of the simulated host's state, written into the test folder
  /// and named by TULK_HOST_STATE. Unset: the built-in demo host.
  std::optional<std::string> hostState;
  /// TULK_TIME_SCALE for the program; 0 leaves it unset.
  double timeScale = 0;
  /// Install the simulated host tools into the root.
  bool hostTools = true;
  /// Called with the root before the program starts (to add files).
  std::function<void(const std::filesystem::path& root)> prepareRoot;
  /// Start the program in the constructor.
  bool start = true;
  /// Keep every byte the program writes (Output()).
  bool keepOutput = false;
  /// Console logins through the real PAM library: pam_wrapper preloaded,
  /// a "tulk" service of pam_matrix with these users (name → password), and
  /// the test policy module before it. Empty: no PAM set-up.
  std::map<std::string, std::string> pamUsers;
  /// Lines "user:outcome" for the test policy module: "expired",
  /// "denied", "chauthtok-fails".
  std::vector<std::string> pamPolicy;
};

class TestConsole {
 public:
  explicit TestConsole(Options options = {});
  ~TestConsole();
  TestConsole(const TestConsole&) = delete;
  TestConsole& operator=(const TestConsole&) = delete;

  /// Starts the program (done by the constructor unless options.start is
  /// false).
  void Start();

  // Input.
  /// Sends a named key (KeyNames.h) `times` times.
  void Key(std::string_view name, int times = 1);
  /// Sends text as typed.
  void Type(std::string_view text);
  /// Sends raw bytes.
  void Send(std::string_view bytes);
  /// Sends a signal to the program.
  void Signal(int signal);
  /// Changes the pseudo-terminal's size (the program gets SIGWINCH).
  void Resize(int cols, int rows);

  // Waiting. Each pumps the program's output into the terminal.
  ::testing::AssertionResult WaitForText(std::string_view text, Millis timeout = 5s);
  ::testing::AssertionResult WaitForTextGone(std::string_view text, Millis timeout = 5s);
  /// Waits for a system-log line containing `text`.
  ::testing::AssertionResult WaitForLog(std::string_view text, Millis timeout = 5s);
  /// Waits until the program has written nothing for `quiet`.
  void WaitQuiet(Millis quiet = 150ms, Millis timeout = 5s);
  /// Waits for the program to end: its exit status, or 128 + signal when
  /// a signal ended it; nullopt when it still runs at the deadline.
  std::optional<int> WaitExit(Millis timeout = 5s);
  /// Reads whatever output is pending, waiting at most `timeout`.
  void Pump(Millis timeout = 0ms);

  // The screen.
  std::string Row(int row) const;
  std::string Screen() const;
  bool Contains(std::string_view text) const;
  Cell At(int row, int col) const;
  CursorState Cursor() const;
  /// The screen with row numbers and the cursor, for failure messages.
  std::string Dump() const;

  // Side channels.
  /// The copy of the system log, one "<N>message" line each.
  std::vector<std::string> LogLines() const;
  /// The host root of this test.
  const std::filesystem::path& Root() const { return root_; }
  /// The pam_matrix password file (passwords changed through PAM land here).
  std::filesystem::path PamPasswordFile() const { return folder_ / "pam" / "passdb"; }
  /// The host state file (the demo host's private copy when none was given).
  std::filesystem::path HostStatePath() const { return folder_ / "host-state.json"; }
  /// Every byte the program wrote to the terminal so far.
  std::size_t BytesReceived() const { return bytesReceived_; }
  /// The raw bytes the program wrote (kept when options.keepOutput).
  const std::string& Output() const { return output_; }
  /// The terminal's current attributes (as the program left them).
  std::optional<termios> TerminalAttributes() const;
  pid_t Pid() const { return pid_; }
  bool Running() const { return pid_ > 0 && !exitStatus_; }

 private:
  void Reap(bool block);
  void WritePamServices();
  std::vector<std::string> BuildEnvironment() const;

  Options options_;
  std::filesystem::path folder_;
  std::filesystem::path root_;
  std::filesystem::path logPath_;
  std::unique_ptr<VirtualTerminal> terminal_;
  int master_ = -1;
  pid_t pid_ = -1;
  std::optional<int> exitStatus_;
  std::size_t bytesReceived_ = 0;
  std::string output_;
};

/// Path of the tulk binary of this build.
std::string TulkBinary();
/// Path of the simulated host tool of this build (empty when not built).
std::string HostToolBinary();

}  // namespace TulkTest
