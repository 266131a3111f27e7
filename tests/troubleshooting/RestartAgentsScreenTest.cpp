// Restarting the management agents: the F11 confirmation, the progress in
// its two colours, the optional live-core capture that runs on its own and
// may outlive the dialog, and the traces on the simulated host.

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <string_view>

#include "TroubleshootingTestSupport.h"

namespace {

using namespace TroubleshootingTest;
using namespace std::chrono_literals;

constexpr char kQuestion[] = "Restart management agents now?";
constexpr char kCapture[] = "Collecting host agent live core information. Done.";
constexpr char kStopping[] = "Stopping management agents.";
constexpr char kStarting[] = "Starting management agents.";

int CoreFiles(const TestConsole& console) {
  int cores = 0;
  for (const auto& entry : std::filesystem::directory_iterator(console.Root() / "var/log")) {
    cores += entry.path().filename().string().rfind("mgmtd-restart", 0) == 0 ? 1 : 0;
  }
  return cores;
}

TEST(RestartAgentsScreenTest, OnlyF11ConfirmsAndEscLogsNothing) {
  TestConsole console(DriverOptions(TulkTest::DemoHostState(), "agents"));
  ASSERT_TRUE(Settled(console, kQuestion));
  EXPECT_TRUE(console.Contains("Restart Management Agents: Confirm"));
  EXPECT_EQ(ForegroundOf(console, "Warning! Restarting the management agents"), 1);
  EXPECT_TRUE(console.Contains("<F11> OK"));
  EXPECT_TRUE(console.Contains("[ ] Collect extra troubleshooting information"));
  console.Key("Enter");
  console.Key("Space");
  ASSERT_TRUE(Settled(console, "[X] Collect extra troubleshooting information"));
  EXPECT_TRUE(console.Contains(kQuestion));
  console.Key("Esc");
  ASSERT_TRUE(console.WaitForText("result: 0"));
  EXPECT_EQ(ToolRuns(console), Lines{});
  EXPECT_EQ(LogLinesWith(console, "agents"), Lines{});
  EXPECT_EQ(TulkTest::SimRecords(console.Root(), "events.jsonl").size(), 0U);
}

TEST(RestartAgentsScreenTest, RestartStopsAndStartsAndClosesOnEnterOnly) {
  TestConsole console(DriverOptions(TulkTest::DemoHostState(), "agents"));
  ASSERT_TRUE(Settled(console, kQuestion));
  console.Key("F11");
  ASSERT_TRUE(Settled(console, "<Enter> OK"));
  EXPECT_TRUE(console.Contains("Stopping management agents. Done."));
  EXPECT_TRUE(console.Contains("Starting management agents. Done."));
  EXPECT_FALSE(console.Contains("Collecting"));
  EXPECT_EQ(ForegroundOf(console, "Starting management agents. Done."), 6);
  EXPECT_EQ(ToolRuns(console), (Lines{"services.sh stop", "services.sh start"}));
  EXPECT_EQ(HostState(console)["services"]["mgmtd"]["running"], true);
  EXPECT_EQ(LogLinesWith(console, "host agents"), Lines{"Restarting host agents"});
  const auto events = TulkTest::SimRecords(console.Root(), "events.jsonl");
  ASSERT_EQ(events.size(), 1U);
  EXPECT_EQ(events[0]["id"], "qob.user.tulk.restarting.hostagents");
  EXPECT_EQ(events[0]["text"], "Restarting host agents");

  console.Key("Esc");
  console.Key("F11");
  console.WaitQuiet(200ms);
  EXPECT_FALSE(console.Contains("result:"));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("result: 1"));
}

TEST(RestartAgentsScreenTest, CaptureIsDoneBeforeTheAgentsStop) {
  Json host = TulkTest::DemoHostState();
  host["commands"]["services.sh stop"] = {{"delayMs", 1500}};
  TestConsole console(DriverOptions(host, "agents"));
  ASSERT_TRUE(Settled(console, kQuestion));
  console.Key("Space");
  console.Key("F11");
  // While the stop still runs: the capture's line is finished (dark grey),
  // the stop is the running step (black).
  ASSERT_TRUE(console.WaitForText(kStopping));
  EXPECT_TRUE(console.Contains(kCapture));
  EXPECT_FALSE(console.Contains("Stopping management agents. Done."));
  EXPECT_EQ(ForegroundOf(console, kCapture), 6);
  EXPECT_EQ(ForegroundOf(console, kStopping), 0);

  ASSERT_TRUE(Settled(console, "<Enter> OK"));
  EXPECT_TRUE(console.Contains(kStarting));
  ASSERT_TRUE(console.WaitForLog("Mgmtd core dump completed"));
  EXPECT_EQ(CoreFiles(console), 1);
  const Lines lines = LogLinesWith(console, "");
  const auto at = [&](const std::string& line) {
    return std::find(lines.begin(), lines.end(), line) - lines.begin();
  };
  EXPECT_LT(at("Restarting host agents"), at("Executing hykbacktrace -c against mgmtd"));
  EXPECT_EQ(ToolRunsStarting(console, "hykbacktrace"),
            Lines{"hykbacktrace -w -n mgmtd -o mgmtd-restart% -d /var/log/"});
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("result: 1"));
}

TEST(RestartAgentsScreenTest, CaptureOutlivesTheDialog) {
  struct Case {
    const char* name;
    bool mgmtdRunning;
    const char* outcome;
  };
  const Case cases[] = {
      {"captured", true, "<14>Mgmtd core dump completed"},
      {"agent down", false, "<11>hykbacktrace failed, probably mgmtd was down"},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    Json host = TulkTest::DemoHostState();
    host["commands"]["hykbacktrace"] = {{"delayMs", 1500}};
    // The agent stays down when the script cannot start it.
    if (!c.mgmtdRunning) {
      host["services"]["mgmtd"]["running"] = false;
      host["commands"]["services.sh start"] = {{"exitCode", 1}};
    }
    TestConsole console(DriverOptions(host, "agents"));
    ASSERT_TRUE(Settled(console, kQuestion));
    console.Key("Space");
    console.Key("F11");
    ASSERT_TRUE(Settled(console, "<Enter> OK"));
    // "Done." for both agents' steps whatever the script did.
    EXPECT_TRUE(console.Contains("Starting management agents. Done."));
    console.Key("Enter");
    ASSERT_TRUE(console.WaitForText("result: 1"));
    ASSERT_TRUE(console.WaitForLog(std::string_view(c.outcome).substr(4)));
    const Lines lines = console.LogLines();
    EXPECT_NE(std::find(lines.begin(), lines.end(), c.outcome), lines.end());
    EXPECT_TRUE(console.Running());
    // The console still answers: the dialog opens again.
    console.Type("o");
    EXPECT_TRUE(console.WaitForText(kQuestion));
  }
}

}  // namespace
