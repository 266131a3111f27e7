// The real tulk binary in a pseudo-terminal: start-up, the pid file, the
// VT argument and every way the process ends.

#include <gtest/gtest.h>
#include <signal.h>
#include <termios.h>

#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

#include "TestConsole.h"
#include "include/ColorNumbers.h"

namespace {

using TulkTest::Options;
using TulkTest::TestConsole;

// A text of the welcome screen (its footer), shown once the console runs.
constexpr char kWelcomeText[] = "Customize System/View Logs";

std::string ReadFile(const std::filesystem::path& path) {
  std::ifstream in(path);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

bool HasLine(const TestConsole& console, const std::string& line) {
  for (const std::string& logged : console.LogLines()) {
    if (logged == line) {
      return true;
    }
  }
  return false;
}

// The start is logged and the pid file written; a colour terminal is drawn
// white on black; a resize logs the new size and ends the console.
TEST(Startup, LogsStartDrawsInColourAndEndsOnResize) {
  TestConsole console;
  ASSERT_TRUE(console.WaitForLog("Starting TULK"));
  ASSERT_TRUE(console.WaitForText(kWelcomeText));
  EXPECT_TRUE(HasLine(console, "<14>Starting TULK"));
  EXPECT_EQ(ReadFile(console.Root() / "var/run/tulk.pid"), std::to_string(console.Pid()));
  ASSERT_TRUE(console.WaitReady());
  const TulkTest::Cell cell = console.At(0, 0);
  EXPECT_EQ(cell.fg, Tulk::kWhite);
  EXPECT_EQ(cell.bg, Tulk::kBlack);
  EXPECT_FALSE(cell.reverse);
  console.Resize(132, 43);
  EXPECT_EQ(console.WaitExit(), 0);
  EXPECT_TRUE(HasLine(console, "<14>Resized window to 132x43"));
}

TEST(Startup, LivePidFileIsKeptAndTheConsoleStillStarts) {
  const std::string live = std::to_string(getpid());
  Options options;
  options.prepareRoot = [&](const std::filesystem::path& root) {
    std::ofstream(root / "var/run/tulk.pid") << live;
  };
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText(kWelcomeText));
  EXPECT_TRUE(HasLine(
      console, "<11>Attempt to run multiple TULK instances, not updating /var/run/tulk.pid"));
  EXPECT_EQ(ReadFile(console.Root() / "var/run/tulk.pid"), live);
}

TEST(Startup, InvalidVtIsLoggedAndTheTerminalLeftAlone) {
  for (const char* argument : {"0", "64", "-1", "abc"}) {
    Options options;
    options.args = {argument};
    TestConsole console(options);
    ASSERT_TRUE(console.WaitForText(kWelcomeText)) << argument;
    EXPECT_TRUE(HasLine(console, std::string("<11>Invalid VT specified for TULK: ") + argument))
        << argument;
    auto attributes = console.TerminalAttributes();
    ASSERT_TRUE(attributes.has_value());
    EXPECT_NE(attributes->c_cc[VSUSP], 0) << "suspend character changed for " << argument;
  }
}

TEST(Startup, ValidVtDisablesTheSuspendCharacter) {
  Options options;
  options.args = {"7x"};
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText(kWelcomeText));
  for (const std::string& line : console.LogLines()) {
    EXPECT_EQ(line.find("Invalid VT"), std::string::npos) << line;
  }
  auto attributes = console.TerminalAttributes();
  ASSERT_TRUE(attributes.has_value());
  EXPECT_EQ(attributes->c_cc[VSUSP], 0);
}

TEST(Startup, TerminatingSignalsExitZeroWithTheTerminalRestored) {
  for (int signal : {SIGINT, SIGQUIT, SIGTERM, SIGUSR2}) {
    TestConsole console;
    ASSERT_TRUE(console.WaitForText(kWelcomeText));
    console.Signal(signal);
    EXPECT_EQ(console.WaitExit(), 0) << "signal " << signal;
    // endwin() ran: the alternate screen is left and the cursor shows again.
    EXPECT_FALSE(console.Contains(kWelcomeText)) << console.Dump();
    EXPECT_TRUE(console.Cursor().visible) << "signal " << signal;
  }
}

// A terminal that cannot change colours (vt102, also the fallback for an
// unset TERM) is drawn in standout.
TEST(Startup, TerminalWithoutColourChangeDrawsInStandout) {
  for (const char* term : {"vt102", ""}) {
    SCOPED_TRACE(std::string("TERM=") + term);
    Options options;
    options.term = term;
    TestConsole console(options);
    ASSERT_TRUE(console.WaitReady());
    ASSERT_TRUE(console.Contains(kWelcomeText)) << console.Dump();
    EXPECT_EQ(console.At(0, 0).text, "┌");
    EXPECT_TRUE(console.At(0, 0).reverse) << console.Dump();
    EXPECT_TRUE(console.At(1, 2).reverse) << console.Dump();
  }
}

TEST(Startup, MalformedHostStateIsReportedBeforeTheScreenStarts) {
  Options options;
  options.hostState = "{ \"advancedOptions\": [1, 2] ";
  options.keepOutput = true;  // the message holds the test folder's path and may wrap
  TestConsole console(options);
  EXPECT_EQ(console.WaitExit(), 1);
  EXPECT_NE(console.Output().find("malformed host state"), std::string::npos) << console.Dump();
  EXPECT_EQ(ReadFile(console.HostStatePath()), *options.hostState);
}

}  // namespace
