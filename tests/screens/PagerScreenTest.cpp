// The log pager in front of the console, with the real pager: what it may
// be given, what it may leave behind, and what happens to the console while
// it runs (the idle timeout, a resize, signals) and after it.

#include <gtest/gtest.h>
#include <signal.h>
#include <sys/stat.h>

#include <filesystem>
#include <optional>
#include <string>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using namespace std::chrono_literals;

constexpr char kLogLine[] = "first line of the host log";

// The menu driver on a root whose syslog holds kLogLine; `more` adds files.
TulkTest::Options WithSyslog(
    const std::function<void(const std::filesystem::path&)>& more = nullptr,
    const nlohmann::json& host = DemoHostState()) {
  TulkTest::Options options = DriverOptions(host);
  options.prepareRoot = [more](const std::filesystem::path& root) {
    WriteRootFile(root, "/var/log/syslog.log", std::string(kLogLine) + "\n");
    if (more) {
      more(root);
    }
  };
  return options;
}

// Opens the first log in the pager from the menu.
::testing::AssertionResult OpenSyslog(TestConsole& console) {
  if (auto selected = SelectEntry(console, "View System Logs"); !selected) {
    return selected;
  }
  console.Type("1");
  return console.WaitForText(kLogLine);
}

TEST(PagerScreenTest, OnlyRegularFilesAreOffered) {
  TestConsole console(WithSyslog([](const std::filesystem::path& root) {
    std::filesystem::create_directories(root / "var/log");
    ASSERT_EQ(mkfifo((root / "var/log/hykernel.log").c_str(), 0644), 0);
    std::filesystem::create_symlink("/dev/zero", root / "var/log/sysboot.log");
    WriteRootFile(root, "/var/log/mgmtd.log", "agent\n");
  }));
  ASSERT_TRUE(SelectEntry(console, "View System Logs"));
  EXPECT_TRUE(console.WaitForText("<2> Management Agent (mgmtd)"));
  EXPECT_TRUE(console.Contains("<1> Syslog"));
  EXPECT_FALSE(console.Contains("> Hykernel"));
  EXPECT_FALSE(console.Contains("> Config"));
  EXPECT_FALSE(console.Contains("<3>"));

  // The digit past the list lands on the third row (the device): refused.
  console.Type("3");
  EXPECT_TRUE(console.WaitForLog("<12>Not showing /var/log/sysboot.log: not a regular file"));
  console.Key("Down");
  EXPECT_TRUE(console.WaitUntil([&] { return RightTitle(console) == "View Support Information"; },
                                "the menu answering"));
}

// In the pager: shell commands are refused, a search leaves no history
// file, a suspend signal leaves the pager and the terminal alone; after it
// the menu comes back with the terminal as it was, and the console's end
// leaves the alternate screen.
TEST(PagerScreenTest, PagerRefusesShellCommandsAndLeavesNoTraceBehind) {
  TulkTest::Options options = WithSyslog();
  options.env["HOME"] = ".";  // the test folder, where the console runs
  options.unsetEnv = {"XDG_DATA_HOME", "XDG_STATE_HOME", "LESSHISTFILE"};
  options.keepOutput = true;
  TestConsole console(options);
  ASSERT_TRUE(SelectEntry(console, "View System Logs"));
  const termios menuAttributes = *console.TerminalAttributes();
  console.Type("1");
  // The pager has the terminal now: the console reports nothing until it
  // is back, so these waits are for text.
  ASSERT_TRUE(console.WaitForText(kLogLine));
  EXPECT_TRUE(console.WaitForText("<Q> Quit </> RegExp Search <H> Help"));
  EXPECT_FALSE(console.Contains("System Customization"));
  console.Type("/host\n");
  EXPECT_TRUE(console.WaitForText("first line"));
  console.Type("!");
  EXPECT_TRUE(console.WaitForText("Command not available"));
  console.Signal(SIGTSTP);
  console.Type("h");
  EXPECT_TRUE(console.WaitForText("SUMMARY OF LESS COMMANDS"));
  EXPECT_FALSE(console.Contains("System Customization")) << console.Dump();
  console.Type("q");
  EXPECT_TRUE(console.WaitForText(kLogLine));
  console.Type("q");

  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_TRUE(console.WaitForText("<1> Syslog"));
  EXPECT_FALSE(console.Contains(kLogLine));
  const termios restored = *console.TerminalAttributes();
  EXPECT_EQ(restored.c_lflag, menuAttributes.c_lflag);
  EXPECT_EQ(restored.c_iflag, menuAttributes.c_iflag);
  console.Key("Down");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_EQ(RightTitle(console), "View Support Information") << console.Dump();
  const std::filesystem::path folder = console.Root().parent_path();
  EXPECT_FALSE(std::filesystem::exists(folder / ".lesshst"));
  EXPECT_FALSE(std::filesystem::exists(folder / "lesshst"));

  console.Signal(SIGTERM);
  EXPECT_EQ(console.WaitExit(), 0);
  const std::string& output = console.Output();
  const std::size_t entered = output.rfind("\x1b[?1049h");
  const std::size_t left = output.rfind("\x1b[?1049l");
  ASSERT_NE(left, std::string::npos);
  EXPECT_TRUE(entered == std::string::npos || entered < left)
      << "the alternate screen was entered again after the console left it";
  EXPECT_FALSE(console.Contains("System Customization")) << console.Dump();
  // The line is back in the mode the console found it in, not the pager's.
  const termios after = *console.TerminalAttributes();
  EXPECT_NE(after.c_lflag & ICANON, 0U);
  EXPECT_NE(after.c_lflag & ECHO, 0U);
}

TEST(PagerScreenTest, ResizeWhileThePagerRunsEndsTheConsoleAfterIt) {
  TestConsole console(WithSyslog());
  ASSERT_TRUE(OpenSyslog(console));
  console.Resize(100, 30);
  // The pager may take a key in the middle of its own repaint for the new
  // size: quit until it has gone. Back at the menu, a "q" does nothing.
  std::optional<int> status;
  for (int attempt = 0; attempt < 20 && !status; ++attempt) {
    console.Type("q");
    status = console.WaitExit(500ms);
  }
  EXPECT_EQ(status, 0) << console.Dump();
  EXPECT_TRUE(console.WaitForLog("<14>Resized window to 100x30"));
}

TEST(PagerScreenTest, IdleTimeoutEndsThePagerAndTheSession) {
  nlohmann::json host = DemoHostState();
  host["advancedOptions"]["/UserVars/TulkTimeOut"] = 60;
  TulkTest::Options options = WithSyslog(nullptr, host);
  options.timeScale = 10;
  TestConsole console(options);
  ASSERT_TRUE(OpenSyslog(console));
  EXPECT_TRUE(console.WaitForText("result: -1", 20s));
  EXPECT_FALSE(console.Contains(kLogLine)) << console.Dump();
}

TEST(PagerScreenTest, TerminatingSignalEndsThePagerAndTheConsole) {
  TestConsole console(WithSyslog());
  ASSERT_TRUE(OpenSyslog(console));
  console.Signal(SIGTERM);
  EXPECT_EQ(console.WaitExit(), 0);
  const termios after = *console.TerminalAttributes();
  EXPECT_NE(after.c_lflag & ICANON, 0U);
}

}  // namespace
