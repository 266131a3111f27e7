// The tool wrappers against the simulated host tools: what the tools were
// asked (their invocation log), what changed on the host, what was logged.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/HostTools.h"
#include "host/OpsAgent.h"
#include "include/Constants.h"
#include "include/ProcessFlags.h"

namespace {

using HostTest::Logged;
using Lines = std::vector<std::string>;

// "<argv joined> -> <exit code>" per tool run.
Lines ToolRuns() {
  Lines runs;
  for (const nlohmann::json& record : HostTest::Records("commands.jsonl")) {
    std::string line;
    for (const nlohmann::json& word : record["argv"]) {
      line += (line.empty() ? "" : " ") + word.get<std::string>();
    }
    runs.push_back(line + " -> " + record["exitCode"].dump());
  }
  return runs;
}

class SimulatedToolsTest : public HostTest::HostStateTest {
 protected:
  void SetUp() override {
    HostStateTest::SetUp();
    Tulk::currentUser = "root";
  }
  void TearDown() override { Tulk::currentUser.clear(); }

  // Makes every run of a tool command (by its leading words) end with
  // `exitCode`, printing `output`.
  void Override(const std::string& command, int exitCode, const std::string& output = "") {
    state_["commands"][command] = {{"exitCode", exitCode}, {"stdout", output}};
    Apply();
  }
};

TEST_F(SimulatedToolsTest, PowerOffTerminatesOnlyWhenNotGraceful) {
  EXPECT_EQ(Tulk::PowerOffVirtualMachines(true), 0);
  EXPECT_EQ(Tulk::PowerOffVirtualMachines(false), 0);
  EXPECT_EQ(ToolRuns(),
            (Lines{"osk-cmd -U root hostsvc/autostartmanager/autostop -> 0", "powerOffVms -> 0",
                   "osk-cmd -U root hostsvc/autostartmanager/autostop -> 0",
                   "powerOffVms --terminate -> 0"}));
  EXPECT_EQ(HostTest::ReadHostState()["vms"][0]["state"], "poweredOff");
}

TEST_F(SimulatedToolsTest, OskCmdFallsBackToRootAndRunsAtMostTwice) {
  Tulk::currentUser = "operator";  // not allowed to use the tool
  EXPECT_EQ(Tulk::RunOskCommand("internalsvc/refresh"), 0);
  EXPECT_TRUE(
      Logged("<14>Unable to execute command osk-cmd internalsvc/refresh using user "
             "operator. Using user root"));
  EXPECT_EQ(HostTest::ReadHostState()["services"]["mgmtd"]["refreshes"], 1);

  Override("osk-cmd", 255);
  EXPECT_EQ(Tulk::RunOskCommand("hostsvc/start_ssh"), 255);
  EXPECT_EQ(ToolRuns(), (Lines{"osk-cmd -U operator internalsvc/refresh -> 255",
                               "osk-cmd -U root internalsvc/refresh -> 0",
                               "osk-cmd -U operator hostsvc/start_ssh -> 255",
                               "osk-cmd -U root hostsvc/start_ssh -> 255"}));
}

TEST_F(SimulatedToolsTest, LockdownFlagsThroughTheGetForm) {
  EXPECT_FALSE(Tulk::OskCmdGetFlag("osksvc/auth/lockdown_is_enabled"));
  EXPECT_TRUE(Tulk::OskCmdGetFlag("osksvc/auth/lockdown_is_possible"));
  EXPECT_TRUE(Logged("<14>osk-cmd invocation: get osksvc/auth/lockdown_is_enabled"));
}

TEST_F(SimulatedToolsTest, TavcliLogsItsOutcome) {
  EXPECT_EQ(Tulk::RunStandardSwitchCommand({"add", "-v", "vSwitch7"}), 0);
  EXPECT_EQ(HostTest::ReadHostState()["network"]["switches"].back()["name"], "vSwitch7");
  EXPECT_TRUE(Logged("<14>Command \"tavcli network vswitch standard add -v vSwitch7\" succeeded"));

  Override("tavcli network vswitch standard remove", 1, "busy");
  EXPECT_EQ(Tulk::RunStandardSwitchCommand({"remove", "-v", "vSwitch7"}), 1);
  EXPECT_TRUE(Logged(
      "<11>Command \"tavcli network vswitch standard remove -v vSwitch7\" failed (rc=1): busy"));
}

TEST_F(SimulatedToolsTest, AdvancedOptionIsSetThroughTavcliOrElseLocalcli) {
  EXPECT_TRUE(Tulk::SetAdvancedOption(Tulk::kTulkTimeOutOption, 900));
  EXPECT_EQ(Tulk::ReadAdvancedOption(Tulk::kTulkTimeOutOption, 600), 900);

  Override("tavcli system settings advanced set", 1);
  EXPECT_TRUE(Tulk::SetAdvancedOption(Tulk::kShellTimeOutOption, 120));
  EXPECT_EQ(Tulk::ReadAdvancedOption(Tulk::kShellTimeOutOption, 0), 120);
  Lines runs = ToolRuns();
  ASSERT_EQ(runs.size(), 3u);
  EXPECT_EQ(runs[2],
            "localcli system settings advanced set -o /UserVars/TaviShellTimeOut -i 120 -> 0");

  Override("localcli", 1);
  EXPECT_FALSE(Tulk::SetAdvancedOption(Tulk::kShellTimeOutOption, 60));
  // Unreadable option: the caller's default.
  EXPECT_EQ(Tulk::ReadAdvancedOption("/UserVars/NoSuchOption", 600), 600);
}

TEST_F(SimulatedToolsTest, OverlayAgentPresenceAndVersion) {
  struct Case {
    const char* version;
    bool installed;
    bool expected;
  };
  for (auto c : {Case{"3.2.1-0.24519031", true, true}, Case{"10.0", true, true},
                 Case{"2.9.0-1", true, false}, Case{"3.2.1", false, false}}) {
    state_["packages"]["zyo-opsagent"]["version"] = c.version;
    state_["services"]["zyo-opsagent"]["installed"] = c.installed;
    Apply();
    HostTest::ClearLog();
    EXPECT_EQ(Tulk::HasOpsAgentVersion3OrLater(), c.expected) << c.version;
    EXPECT_EQ(Logged("<14>zyo-opsagent version >= 3 detected"), c.expected);
  }
  EXPECT_TRUE(Logged("<14>zyo-opsagent is not present on the system."));

  EXPECT_FALSE(Tulk::StartOpsAgentIfPresent());
  EXPECT_TRUE(Logged("<14>Skipping zyo-opsagent start."));
}

TEST_F(SimulatedToolsTest, OverlayAgentStopAndStart) {
  EXPECT_TRUE(Tulk::StopOpsAgent());
  EXPECT_FALSE(Tulk::IsOpsAgentPresent());  // installed but stopped
  EXPECT_TRUE(Tulk::StartOpsAgent());
  EXPECT_TRUE(Logged("<14>zyo-opsagent has been successfully stopped."));

  Override("zyo-opsagent", 1);
  EXPECT_FALSE(Tulk::StartOpsAgent());
  EXPECT_FALSE(Tulk::StopOpsAgent());
  EXPECT_TRUE(Logged("<11>Failed to start zyo-opsagent."));
  EXPECT_TRUE(Logged("<11>Failed to stop zyo-opsagent."));
}

}  // namespace
