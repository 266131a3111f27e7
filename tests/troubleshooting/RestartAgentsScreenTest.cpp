// Restarting the management agents: the F11 confirmation, the progress in
// its two colours, and the live capture that may outlive the dialog.

#include <gtest/gtest.h>

#include <filesystem>

#include "TroubleshootingTestSupport.h"

namespace {

using namespace TulkTest;

constexpr char kQuestion[] = "Restart management agents now?";
constexpr char kCapture[] = "Collecting host agent live core information. Done.";
constexpr char kStopping[] = "Stopping management agents.";

TEST(RestartAgentsScreenTest, OnlyF11RestartsAndOnlyEnterCloses) {
  TestConsole console(DriverOptions(DemoHostState(), "agents"));
  ASSERT_TRUE(Settled(console, kQuestion));
  EXPECT_EQ(ForegroundOf(console, "Warning! Restarting"), 1);  // red
  console.Key("Enter");
  console.Key("Space");
  ASSERT_TRUE(Settled(console, "[X] Collect extra troubleshooting information"));
  console.Key("Esc");
  ASSERT_TRUE(console.WaitForText("result: 0"));
  EXPECT_EQ(CommandLines(console), Lines{});
  EXPECT_EQ(LogLinesWith(console, "agents"), Lines{});

  console.Type("o");
  ASSERT_TRUE(Settled(console, "[ ] Collect extra troubleshooting information"));
  console.Key("F11");
  ASSERT_TRUE(Settled(console, "<Enter> OK"));
  EXPECT_EQ(ForegroundOf(console, "Stopping management agents. Done."), 6);  // dark grey
  EXPECT_TRUE(console.Contains("Starting management agents. Done."));
  EXPECT_FALSE(console.Contains("Collecting"));
  EXPECT_EQ(CommandLines(console), (Lines{"services.sh stop", "services.sh start"}));
  EXPECT_EQ(LogLinesWith(console, "agents"), Lines{"Restarting host agents"});
  const auto events = SimRecords(console.Root(), "events.jsonl");
  ASSERT_EQ(events.size(), 1U);
  EXPECT_EQ(events[0]["id"], "qob.user.tulk.restarting.hostagents");
  console.Key("Esc");
  console.Key("F11");
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("result: 1"));
  EXPECT_EQ(CommandLines(console).size(), 2U);
}

TEST(RestartAgentsScreenTest, CaptureIsDoneBeforeTheStopAndMayOutliveTheDialog) {
  Json host = DemoHostState();
  host["commands"]["services.sh stop"] = {{"delayMs", 1500}};
  host["commands"]["hykbacktrace"] = {{"delayMs", 3000}};
  TestConsole console(DriverOptions(host, "agents"));
  ASSERT_TRUE(Settled(console, kQuestion));
  console.Key("Space");
  console.Key("F11");
  // While the stop runs, the capture's line is done (dark grey) and the
  // stop is the running step (black).
  ASSERT_TRUE(console.WaitForText(kStopping));
  EXPECT_EQ(ForegroundOf(console, kCapture), 6);
  EXPECT_EQ(ForegroundOf(console, kStopping), 0);

  ASSERT_TRUE(Settled(console, "<Enter> OK"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForText("result: 1"));
  ASSERT_TRUE(console.WaitForLog("Mgmtd core dump completed"));
  int cores = 0;
  for (const auto& entry : std::filesystem::directory_iterator(console.Root() / "var/log")) {
    cores += entry.path().filename().string().rfind("mgmtd-restart", 0) == 0 ? 1 : 0;
  }
  EXPECT_EQ(cores, 1);
  EXPECT_EQ(CommandLines(console, "hykbacktrace").back(),
            "hykbacktrace -w -n mgmtd -o mgmtd-restart% -d /var/log/");
  console.Type("o");  // the console still answers
  EXPECT_TRUE(console.WaitForText(kQuestion));
}

}  // namespace
