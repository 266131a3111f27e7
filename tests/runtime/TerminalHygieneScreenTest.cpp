// The console on its terminal line through the test-only key-echo program:
// flow control, the escape delay from the environment, and a wall clock
// that steps while the console waits.

#include <gtest/gtest.h>
#include <signal.h>
#include <termios.h>
#include <unistd.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <thread>

#include "TestConsole.h"

namespace {

using namespace std::chrono_literals;
using TulkTest::Options;
using TulkTest::TestConsole;

TEST(TerminalHygiene, CtrlSIsAKeyAndFlowControlComesBackAtExit) {
  TestConsole console(TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY));
  ASSERT_TRUE(console.WaitForText("KEYECHO active"));
  // With XON/XOFF on, the line would swallow Ctrl-S and stop the console's
  // output until a Ctrl-Q, and the exit below would wait for it too.
  console.Send("\x13");
  ASSERT_TRUE(console.WaitForText("keys: 1")) << "the console's output stopped";
  EXPECT_TRUE(console.Contains("last key: ^S (19)")) << console.Dump();
  console.Type("a");
  ASSERT_TRUE(console.WaitForText("last key: a (97)"));

  console.Signal(SIGTERM);
  ASSERT_EQ(console.WaitExit(), 0);
  auto attributes = console.TerminalAttributes();
  ASSERT_TRUE(attributes.has_value());
  EXPECT_NE(attributes->c_iflag & IXON, 0U) << "flow control not restored";
}

TEST(TerminalHygiene, EscDelayFromTheEnvironmentIsHonoured) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  // A remote line slow enough to split a sequence by a third of a second.
  options.env["ESCDELAY"] = "10000";
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("KEYECHO active"));
  console.SendNow("\x1b");
  std::this_thread::sleep_for(300ms);  // the line's gap, not a wait for the console
  console.SendNow("OB");
  ASSERT_TRUE(console.WaitForText("keys: 1", 15s));
  EXPECT_TRUE(console.Contains("last key: KEY_DOWN")) << console.Dump();
}

// A file the clock-step preload reads: while it exists, the wall clock is
// off by the seconds it holds.
class ClockStep {
 public:
  ClockStep()
      : path_(std::filesystem::temp_directory_path() /
              ("tulk-clock-step-" + std::to_string(getpid()) + "-" + std::to_string(++count_))) {
    std::filesystem::remove(path_);
  }
  ~ClockStep() { std::filesystem::remove(path_); }
  ClockStep(const ClockStep&) = delete;
  ClockStep& operator=(const ClockStep&) = delete;

  /// A key-echo session with an idle timeout of ten minutes, whose console
  /// minute lasts 60 / `timeScale` real seconds, under the preload.
  Options SessionOptions(double timeScale) const {
    Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
    options.timeScale = timeScale;
    options.env["TULK_KEYECHO_SESSION"] = "1";
    options.env["TULK_KEYECHO_IDLE_TIMEOUT"] = "600";
    options.env["LD_PRELOAD"] = TULK_TEST_CLOCK_STEP_LIBRARY;
    options.env["TULK_TEST_CLOCK_STEP_FILE"] = path_.string();
    // The sanitizer runtime refuses to come after a preloaded library.
    const char* asan = std::getenv("ASAN_OPTIONS");
    options.env["ASAN_OPTIONS"] =
        (asan != nullptr ? std::string(asan) + ":" : std::string()) + "verify_asan_link_order=0";
    return options;
  }

  void Step(long seconds) const { std::ofstream(path_) << seconds << "\n"; }

 private:
  static inline int count_ = 0;
  std::filesystem::path path_;
};

TEST(TerminalHygiene, ClockStepForwardDoesNotEndTheSession) {
  ClockStep clock;
  // Dimming after one real second, the timeout after ten.
  TestConsole console(clock.SessionOptions(60));
  ASSERT_TRUE(console.WaitForText("KEYECHO active"));
  // The step comes once the wait has begun (the screen shows just before).
  std::this_thread::sleep_for(300ms);
  clock.Step(24 * 3600);
  // On the wall clock the first wake-up would find the session a day old.
  ASSERT_TRUE(console.WaitForText("KEYECHO dimmed")) << "the session ended at the clock step";
  console.Type("a");
  ASSERT_TRUE(console.WaitForText("last key: a (97)"));
  EXPECT_FALSE(console.Contains("timeout after")) << console.Dump();
}

TEST(TerminalHygiene, ClockStepBackDoesNotPostponeTheTimeout) {
  ClockStep clock;
  // Dimming after a tenth of a real second, the timeout after one second.
  TestConsole console(clock.SessionOptions(600));
  ASSERT_TRUE(console.WaitForText("KEYECHO active"));
  clock.Step(-24 * 3600);
  // On the wall clock the timeout would move a day away.
  EXPECT_TRUE(console.WaitForText("timeout after:", 20s));
}

}  // namespace
