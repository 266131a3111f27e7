#pragma once
/// Drives a real console binary in a pseudo-terminal and reads its screen
/// through a terminal emulator.
///
/// Each TestConsole gets a fresh host root under a temporary folder
/// (TULK_ROOT), with the simulated host tools installed when available, a
/// copy of the system log (TULK_LOG_FILE) and, when given, its own host
/// state file (TULK_HOST_STATE). Waits take a deadline and return an
/// assertion result whose failure message holds the whole screen.
///
/// The program reports through TULK_READY_FD each time it has handled its
/// input, sent its screen and waits for a key (ReadyChannel.h). WaitReady()
/// waits for the first such report after the last key or signal sent, so
/// what the screen shows then is final, and so is what it does not show:
///
///   TulkTest::TestConsole console;
///   ASSERT_TRUE(console.WaitReady());
///   console.Key("F2");
///   ASSERT_TRUE(console.WaitReady());
///   EXPECT_EQ(console.At(10, 12).bg, Tulk::kYellow);
///   EXPECT_FALSE(console.Contains("Invalid"));
///
/// Input takes turns: while the program holds the terminal, each Key(),
/// Type(), Send() or Signal() first waits until the program has handled the
/// input before it, so the next report is about this one. A program that is
/// not in its key loop (a pager in front of it, a command it waits for)
/// reports nothing until it is back; waits for that time are waits for text.
///
/// At the end the program gets SIGTERM (SIGKILL when it does not end), every
/// process it left in its session SIGKILL, and the pam_wrapper folders of
/// all of them are removed (ProcessHygiene.h). The test folder is removed
/// too unless TULK_KEEP_TEST_ROOT is set.

#include <gtest/gtest.h>
#include <sys/types.h>
#include <termios.h>

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Options.h"
#include "ReadyChannel.h"
#include "TestFolder.h"
#include "VirtualTerminal.h"

namespace TulkTest {

using namespace std::chrono_literals;
using Millis = std::chrono::milliseconds;

/// How long a wait lasts before it fails: long enough for a sanitizer build
/// on a machine busy with other tests; a passing wait ends much sooner.
inline constexpr Millis kWait = 15s;

class TestConsole {
 public:
  explicit TestConsole(Options options = {});
  ~TestConsole();
  TestConsole(const TestConsole&) = delete;
  TestConsole& operator=(const TestConsole&) = delete;

  /// Starts the program (done by the constructor unless options.start is
  /// false).
  void Start();

  // Input. Each waits first, while the program holds the terminal, until it
  // has handled what was sent before (as WaitReady()): one call's bytes
  // arrive together, as a burst of typing, but no call's input lands in the
  // middle of the previous one's handling. Keys for a program the console
  // started in front of itself (the pager) go out at once.
  /// Sends a named key (KeyNames.h) `times` times, in one write.
  void Key(std::string_view name, int times = 1);
  /// Sends text as typed, in one write.
  void Type(std::string_view text);
  /// Sends raw bytes, in one write.
  void Send(std::string_view bytes);
  /// Sends raw bytes at once, even in the middle of the handling of earlier
  /// input: parts of one key as a slow line delivers them, keys typed ahead.
  /// A WaitReady() that follows may then end before these bytes are read.
  void SendNow(std::string_view bytes);
  /// Sends a signal to the program.
  void Signal(int signal);
  /// Changes the pseudo-terminal's size (the program gets SIGWINCH).
  void Resize(int cols, int rows);

  // Waiting. Each pumps the program's output into the terminal.
  /// Waits until the program has handled everything sent to it so far (and
  /// the start), has sent its screen and waits for a key; the terminal then
  /// holds all it wrote. Fails when the program ends first.
  ::testing::AssertionResult WaitReady(Millis timeout = kWait);
  ::testing::AssertionResult WaitForText(std::string_view text, Millis timeout = kWait);
  ::testing::AssertionResult WaitForTextGone(std::string_view text, Millis timeout = kWait);
  /// Waits until `condition` holds; the failure names `what`. For what
  /// changes without a key (dimming, a timeout, a worker): make the whole
  /// expected state the condition, as no report marks its end.
  ::testing::AssertionResult WaitUntil(const std::function<bool()>& condition,
                                       std::string_view what, Millis timeout = kWait);
  /// Waits for a system-log line containing `text`.
  ::testing::AssertionResult WaitForLog(std::string_view text, Millis timeout = kWait);
  /// Waits for the program to end: its exit status, or 128 + signal when
  /// a signal ended it; nullopt when it still runs at the deadline.
  std::optional<int> WaitExit(Millis timeout = kWait);
  /// Reads whatever output and readiness reports are pending, waiting at
  /// most `timeout` for the first.
  void Pump(Millis timeout = 0ms);
  /// When the program last reported ready (its own clock reading, taken
  /// after it had drawn and before it blocked); the epoch before the first.
  std::chrono::steady_clock::time_point ReadyAt() const;

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
  std::filesystem::path Root() const { return folder_.Root(); }
  /// The pam_matrix password file (passwords changed through PAM land here).
  std::filesystem::path PamPasswordFile() const { return folder_.PamPasswordFile(); }
  /// The host state file (the demo host's private copy when none was given).
  std::filesystem::path HostStatePath() const { return folder_.HostStatePath(); }
  /// Every byte the program wrote to the terminal so far.
  std::size_t BytesReceived() const { return bytesReceived_; }
  /// The raw bytes the program wrote (kept when options.keepOutput).
  const std::string& Output() const { return output_; }
  /// The terminal's current attributes (as the program left them).
  std::optional<termios> TerminalAttributes() const;
  pid_t Pid() const { return pid_; }
  bool Running() const { return pid_ > 0 && !exitStatus_; }

 private:
  // Notes the exit status once the program has ended; the process is left
  // unreaped (its id stays ours) until Stop().
  void CheckExit(bool block);
  // Ends the program and what it left behind, and reaps it.
  void Stop();
  // Reads the pseudo-terminal until it holds nothing more.
  void DrainOutput();
  void Absorb(const char* bytes, std::size_t count);
  // Before a key or signal: while the program holds the terminal and has
  // not reported since the last input, waits for it to (see Send()).
  void AwaitTurn();
  // Writes to the terminal as is, noting the time first.
  void Write(std::string_view bytes);
  void NoteSent();

  Options options_;
  TestFolder folder_;
  std::unique_ptr<VirtualTerminal> terminal_;
  ReadyChannel ready_;
  // When the last key, signal or resize went to the program (monotonic ns),
  // read just before it went: a report newer than this proves the input
  // handled, as input is only sent while the program waits for it.
  std::int64_t lastSent_ = 0;
  int master_ = -1;
  pid_t pid_ = -1;
  bool reaped_ = false;
  std::optional<int> exitStatus_;
  std::size_t bytesReceived_ = 0;
  std::string output_;
};

/// Path of the tulk binary of this build.
std::string TulkBinary();
/// Path of the simulated host tool of this build (empty when not built).
std::string HostToolBinary();

}  // namespace TulkTest
