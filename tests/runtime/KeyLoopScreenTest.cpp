// The key loop through the test-only key-echo program: the key table as
// curses assembles it, the lone Esc, dimming, idle timeouts and signals.
// How fast a lone Esc acts is measured in bench/console.

#include <gtest/gtest.h>
#include <signal.h>

#include <chrono>
#include <string>
#include <thread>

#include "TestConsole.h"
#include "include/ColorNumbers.h"

namespace {

using namespace std::chrono_literals;
using TulkTest::Options;
using TulkTest::TestConsole;

// Terminal sequences arrive as curses keys, a lone Esc as Esc, a key right
// after Esc without delay; readiness comes only once every key sent has
// been handled; the reload signal reaches the current frame; a normal end
// writes the palette reset.
TEST(KeyLoop, KeysReadinessReloadAndANormalEnd) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  options.keepOutput = true;
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("KEYECHO active"));
  struct Case {
    const char* bytes;
    const char* shown;
  };
  const Case cases[] = {
      {"\x1bOX", "KEY_F(9)"},
      {"\x1bOY", "KEY_F(12)"},
      {"\x1b[11~", "KEY_F(1)"},
      {"\x1b!", "KEY_F(11)"},
      {"\x7f", "KEY_BACKSPACE"},
      {"\x1b"
       "5",
       "KEY_F(5)"},
      {"\x1b[M", "KEY_F(1)"},
      {"\x1bh", "KEY_HOME"},
      {"\x1b?", "KEY_PPAGE"},
      {"\x1b[B", "KEY_DOWN"},
      {"\x1bOA", "KEY_UP"},
      {"\x1b[3~", "KEY_DC"},
  };
  int keys = 0;
  for (const Case& c : cases) {
    console.Send(c.bytes);
    ++keys;
    ASSERT_TRUE(console.WaitReady()) << c.shown;
    EXPECT_TRUE(console.Contains("keys: " + std::to_string(keys))) << c.shown << console.Dump();
    EXPECT_TRUE(console.Contains(std::string("last key: ") + c.shown)) << console.Dump();
  }

  console.Key("Esc");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("keys: 13")) << console.Dump();
  EXPECT_TRUE(console.Contains("(27)")) << console.Dump();

  // Both bytes in one write: curses reads the second while it checks
  // whether the Esc starts a sequence, and must still deliver it at once.
  console.Send(
      "\x1b"
      "a");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("keys: 15")) << console.Dump();
  EXPECT_TRUE(console.Contains("last key: a (97)")) << console.Dump();

  // Separate writes: the console may finish a key before the next arrives,
  // and its report in between must not count as the end of the last one.
  for (const char* key : {"a", "b", "c", "d"}) {
    console.Send(key);
  }
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("keys: 19")) << console.Dump();

  ASSERT_TRUE(console.WaitForText("reloads: 0"));
  console.Signal(SIGUSR1);
  ASSERT_TRUE(console.WaitForText("reloads: 1"));
  console.Signal(SIGUSR1);
  ASSERT_TRUE(console.WaitForText("reloads: 2"));

  console.Type("q");
  EXPECT_EQ(console.WaitExit(), 0);
  const std::string& output = console.Output();
  ASSERT_GE(output.size(), 3u);
  EXPECT_EQ(output.substr(output.size() - 3), "\x1b]R");
}

TEST(KeyLoop, ReadinessDescriptorOnTheTerminalIsIgnored) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  options.keepOutput = true;
  options.env["TULK_READY_FD"] = "1";
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("KEYECHO active"));
  console.SendNow("a");  // no reports come to wait for
  ASSERT_TRUE(console.WaitForText("keys: 1"));
  // A report is a binary clock reading with zero bytes; curses never
  // writes one.
  EXPECT_EQ(console.Output().find('\0'), std::string::npos);
}

TEST(KeyLoop, SequenceSplitLikeASlowSerialLineIsStillAssembled) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  // A busy test machine may hold the harness back between two bytes longer
  // than the default delay; a slow line's operator would set it so.
  options.env["ESCDELAY"] = "1000";
  TestConsole console(options);
  ASSERT_TRUE(console.WaitReady());
  // 9600 baud: about one millisecond per byte.
  for (const char* byte : {"\x1b", "[", "2", "4", "~"}) {
    console.SendNow(byte);
    std::this_thread::sleep_for(2ms);
  }
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("keys: 1")) << console.Dump();
  EXPECT_TRUE(console.Contains("last key: KEY_F(12)")) << console.Dump();
}

TEST(KeyLoop, DimsAfterAMinuteAndTheWakingKeyIsDelivered) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  options.timeScale = 300;  // one console minute = 0.2 s
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("KEYECHO dimmed"));
  EXPECT_EQ(console.At(1, 2).fg, Tulk::kDarkGrey);
  console.Type("a");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("last key: a (97)")) << console.Dump();
  EXPECT_TRUE(console.Contains("KEYECHO active")) << console.Dump();
  EXPECT_EQ(console.At(1, 2).fg, Tulk::kWhite);
}

TEST(KeyLoop, IdleTimeoutBelowAMinuteCountsAsAMinute) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  options.timeScale = 60;
  options.keepOutput = true;
  options.env["TULK_KEYECHO_SESSION"] = "1";
  options.env["TULK_KEYECHO_IDLE_TIMEOUT"] = "30";
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("timeout after:"));
  // Not before the minute (console seconds from the start of the wait)...
  int seconds = std::stoi(console.Row(8).substr(console.Row(8).find(':') + 1));
  EXPECT_GE(seconds, 60) << console.Dump();
  // ...and not after it: the screen dims at the minute, so a later timeout
  // would have dimmed it first.
  EXPECT_EQ(console.Output().find("dimmed"), std::string::npos);
}

TEST(KeyLoop, IdleTimeoutOfZeroNeverEndsTheSessionButStillDims) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  options.timeScale = 600;
  options.env["TULK_KEYECHO_SESSION"] = "1";
  options.env["TULK_KEYECHO_IDLE_TIMEOUT"] = "0";
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("KEYECHO dimmed"));
  // What never happens can only be watched for a while: fifteen console
  // minutes, past the ten a misread "0" would fall back to.
  EXPECT_FALSE(console.WaitForText("timeout after", 1500ms));
}

TEST(KeyLoop, UnreadableTimeoutDefaultsToTenMinutes) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  options.env["TULK_KEYECHO_SESSION"] = "1";
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("idle timeout: 600"));
}

TEST(KeyLoop, ExitRequestDuringASessionIsDeferred) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  options.env["TULK_KEYECHO_SESSION"] = "1";
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("exitPending: 0"));
  console.Signal(SIGUSR2);
  // The signal thread passes the signal on in its own time, and the flag is
  // drawn with the next key: keep typing until a redraw shows it.
  const auto deadline = std::chrono::steady_clock::now() + TulkTest::kWait;
  bool shown = false;
  while (!shown && std::chrono::steady_clock::now() < deadline) {
    console.Type("x");
    ASSERT_TRUE(console.WaitReady());
    shown = console.Contains("exitPending: 1");
  }
  EXPECT_TRUE(shown) << console.Dump();
  EXPECT_TRUE(console.Running());
}

TEST(KeyLoop, SignalEndsWithoutThePaletteReset) {
  Options options = TulkTest::TestProgram(TULK_TEST_KEYECHO_BINARY);
  options.keepOutput = true;
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("KEYECHO active"));
  console.Signal(SIGTERM);
  EXPECT_EQ(console.WaitExit(), 0);
  EXPECT_EQ(console.Output().find("\x1b]R"), std::string::npos);
}

}  // namespace
