// "View System Logs": the numbered list and the digit that picks a log
// (the hand-over to the real pager and back: PagerScreenTest).

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <filesystem>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;

const char* const kLogs[] = {"syslog.log", "hykernel.log", "sysboot.log", "mgmtd.log",
                             "hlma.log",   "hagt.log",     "qobd.log"};

// Replaces the pager by a script that records LESSSECURE and its arguments.
TulkTest::Options RecordingPager(int logsPresent) {
  TulkTest::Options options = DriverOptions();
  options.prepareRoot = [logsPresent](const std::filesystem::path& root) {
    for (int i = 0; i < logsPresent; ++i) {
      WriteRootFile(root, std::string("/var/log/") + kLogs[i], "log\n");
    }
    const std::filesystem::path pager = root / "bin/less";
    std::filesystem::remove(pager);
    WriteRootFile(root, "/bin/less",
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
  const std::string line = ReadText(record);
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
  ASSERT_TRUE(Settled(console, "<3> Config"));
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

}  // namespace
