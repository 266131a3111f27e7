// "View System Logs": the numbered list, the digit that picks a log, and
// the hand-over of the terminal to the real pager and back.

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <filesystem>

#include "MenuTestSupport.h"

namespace {

using MenuTest::DriverOptions;
using MenuTest::SelectEntry;
using TulkTest::TestConsole;

const char* const kLogs[] = {"syslog.log", "hykernel.log", "sysboot.log", "mgmtd.log",
                             "hlma.log",   "hagt.log",     "qobd.log"};

// Replaces the pager by a script that records LESSSECURE and its arguments.
TulkTest::Options RecordingPager(int logsPresent) {
  TulkTest::Options options = DriverOptions();
  options.prepareRoot = [logsPresent](const std::filesystem::path& root) {
    for (int i = 0; i < logsPresent; ++i) {
      TulkTest::WriteRootFile(root, std::string("/var/log/") + kLogs[i], "log\n");
    }
    const std::filesystem::path pager = root / "bin/less";
    std::filesystem::remove(pager);
    TulkTest::WriteRootFile(
        root, "/bin/less",
        "#!/bin/sh\necho \"$LESSSECURE|$*\" >> " + (root / "pager.txt").string() + "\n");
    chmod(pager.c_str(), 0755);
  };
  return options;
}

// Presses `digit` and returns the log the pager was started on, or "" when
// it was not started. The console runs the pager and waits for it before it
// reads the next key.
std::string PagerRunFor(TestConsole& console, char digit) {
  const std::filesystem::path record = console.Root() / "pager.txt";
  std::filesystem::remove(record);
  console.Type(std::string(1, digit));
  EXPECT_TRUE(console.WaitReady());
  const std::string line = MenuTest::ReadText(record);
  if (line.empty()) {
    return "";
  }
  const std::string expected =
      "1|-cfP <Q> Quit </> RegExp Search <H> Help " + (console.Root() / "var/log").string() + "/";
  EXPECT_EQ(line.rfind(expected, 0), 0U) << line;
  return std::filesystem::path(line.substr(0, line.size() - 1)).filename().string();
}

TEST(LogScreenTest, ThreeLogsAreNumberedAndDigitsKeepTheirQuirks) {
  TestConsole console(RecordingPager(3));
  ASSERT_TRUE(SelectEntry(console, "View System Logs"));
  EXPECT_TRUE(console.WaitForText("<1> Syslog"));
  EXPECT_TRUE(console.WaitForText("<2> Hykernel"));
  EXPECT_TRUE(console.WaitForText("<3> Config"));
  EXPECT_FALSE(console.Contains("<4>"));
  EXPECT_EQ(PagerRunFor(console, '2'), "hykernel.log");
  EXPECT_EQ(PagerRunFor(console, '5'), "mgmtd.log");
  EXPECT_EQ(PagerRunFor(console, '0'), "mgmtd.log");
  ASSERT_TRUE(MenuTest::Settled(console, "<3> Config"));
  console.Key("Down");
  EXPECT_EQ(PagerRunFor(console, '1'), "");
}

TEST(LogScreenTest, AllSevenLogsPresentIgnoreEightNineAndZero) {
  TestConsole console(RecordingPager(7));
  ASSERT_TRUE(SelectEntry(console, "View System Logs"));
  EXPECT_TRUE(console.WaitForText("<6> High Availibility Agent (hagt)"));
  EXPECT_TRUE(console.WaitForText("<7> Brimlo Tavi Observation log"));
  for (char digit : {'8', '9', '0'}) {
    EXPECT_EQ(PagerRunFor(console, digit), "") << digit;
  }
  EXPECT_EQ(PagerRunFor(console, '7'), "qobd.log");
}

TEST(LogScreenTest, PagerRefusesShellCommandsAndTheMenuComesBack) {
  TulkTest::Options options = DriverOptions();
  options.prepareRoot = [](const std::filesystem::path& root) {
    TulkTest::WriteRootFile(root, "/var/log/syslog.log", "first line of the host log\n");
  };
  TestConsole console(options);
  ASSERT_TRUE(SelectEntry(console, "View System Logs"));
  const termios menuAttributes = *console.TerminalAttributes();
  console.Type("1");
  // The pager has the terminal now: the console reports nothing until it
  // is back, so these waits are for text.
  ASSERT_TRUE(console.WaitForText("first line of the host log"));
  EXPECT_TRUE(console.WaitForText("<Q> Quit </> RegExp Search <H> Help"));
  EXPECT_FALSE(console.Contains("System Customization"));
  console.Type("!");
  EXPECT_TRUE(console.WaitForText("Command not available"));
  console.Type("q");
  ASSERT_TRUE(MenuTest::Settled(console, "System Customization"));
  EXPECT_TRUE(console.WaitForText("<1> Syslog"));
  EXPECT_FALSE(console.Contains("first line of the host log"));
  const termios restored = *console.TerminalAttributes();
  EXPECT_EQ(restored.c_lflag, menuAttributes.c_lflag);
  EXPECT_EQ(restored.c_iflag, menuAttributes.c_iflag);
  console.Key("Down");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_EQ(MenuTest::RightTitle(console), "View Support Information") << console.Dump();
}

}  // namespace
