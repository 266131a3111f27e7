// The tool wrappers and the operations-agent helpers: the command lines the
// host's tools receive and the log lines the console writes.

#include "host/HostTools.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/OpsAgent.h"
#include "include/ProcessFlags.h"

namespace {

using HostTest::Invocations;
using HostTest::Logged;
using Lines = std::vector<std::string>;

class HostToolsTest : public ::testing::Test {
 protected:
  void SetUp() override {
    HostTest::ClearLog();
    HostTest::ClearInvocations();
    Tulk::currentUser = "alice";
  }
  void TearDown() override { Tulk::currentUser.clear(); }
};

TEST_F(HostToolsTest, ConsoleUserFallsBackBeforeAnyLogin) {
  EXPECT_EQ(Tulk::ConsoleUser(), "alice");
  Tulk::currentUser.clear();
  EXPECT_EQ(Tulk::ConsoleUser(), Tulk::kOskFallbackUser);
}

TEST_F(HostToolsTest, TavcliLogsItsOutcomeWithTheOutput) {
  HostTest::WriteRecordingTool("/bin/tavcli", "[ \"$4\" = list ] && exit 0; printf boom; exit 1");
  EXPECT_EQ(Tulk::RunStandardSwitchCommand({"list"}), 0);
  EXPECT_EQ(Tulk::RunStandardSwitchCommand({"remove", "-v", "vSwitch1"}), 1);
  EXPECT_EQ(Invocations(), (Lines{"tavcli network vswitch standard list",
                                  "tavcli network vswitch standard remove -v vSwitch1"}));
  EXPECT_TRUE(Logged("<14>Command \"tavcli network vswitch standard list\" succeeded"));
  EXPECT_TRUE(Logged(
      "<11>Command \"tavcli network vswitch standard remove -v vSwitch1\" failed (rc=1): boom"));
}

TEST_F(HostToolsTest, OskCmdRetriesOnceAsTheFallbackUser) {
  struct Case {
    const char* body;
    int rc;
    Lines invocations;
  };
  const Case cases[] = {
      {"exit 0", 0, {"osk-cmd -U alice hostsvc/x a"}},
      {"exit 1", 1, {"osk-cmd -U alice hostsvc/x a"}},
      {"exit 255", 255, {"osk-cmd -U alice hostsvc/x a", "osk-cmd -U root hostsvc/x a"}},
      {"[ \"$2\" = root ] || exit 255",
       0,
       {"osk-cmd -U alice hostsvc/x a", "osk-cmd -U root hostsvc/x a"}},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.body);
    HostTest::ClearLog();
    HostTest::ClearInvocations();
    HostTest::WriteRecordingTool("/bin/osk-cmd", c.body);
    EXPECT_EQ(Tulk::RunOskCmd({"osk-cmd", "-U", "alice", "hostsvc/x", "a"}), c.rc);
    EXPECT_EQ(Invocations(), c.invocations);
    EXPECT_EQ(Logged("<14>Unable to execute command osk-cmd hostsvc/x a using user alice. Using "
                     "user root"),
              c.invocations.size() == 2);
  }
}

TEST_F(HostToolsTest, OskCmdGetReadsTheValue) {
  HostTest::WriteRecordingTool("/bin/osk-cmd",
                               "case \"$3\" in *enabled) echo ' true';; *) echo false;; esac");
  EXPECT_TRUE(Tulk::OskCmdGetFlag("osksvc/auth/lockdown_is_enabled"));
  EXPECT_FALSE(Tulk::OskCmdGetFlag("osksvc/auth/lockdown_is_possible"));
  EXPECT_TRUE(Logged("<14>osk-cmd invocation: get osksvc/auth/lockdown_is_enabled"));
  EXPECT_EQ(Invocations(), (Lines{"osk-cmd -U alice osksvc/auth/lockdown_is_enabled",
                                  "osk-cmd -U alice osksvc/auth/lockdown_is_possible"}));
}

TEST_F(HostToolsTest, PowerOffTerminatesOnlyWhenNotGraceful) {
  HostTest::WriteRecordingTool("/bin/osk-cmd", "exit 0");
  HostTest::WriteRecordingTool("/bin/powerOffVms", "exit 0");
  for (bool graceful : {true, false}) {
    HostTest::ClearInvocations();
    EXPECT_EQ(Tulk::PowerOffVirtualMachines(graceful), 0);
    EXPECT_EQ(Invocations(), (Lines{"osk-cmd -U alice hostsvc/autostartmanager/autostop",
                                    graceful ? "powerOffVms " : "powerOffVms --terminate"}));
  }
}

TEST_F(HostToolsTest, PowerOffStillRunsWhenAutostopFails) {
  HostTest::WriteRecordingTool("/bin/osk-cmd", "exit 3");
  HostTest::WriteRecordingTool("/bin/powerOffVms", "exit 1");
  EXPECT_EQ(Tulk::PowerOffVirtualMachines(false), 1);
  EXPECT_EQ(Invocations().size(), 2u);
  EXPECT_TRUE(Logged("<11>Command \"powerOffVms --terminate\" failed (rc=1): (stdout=, stderr=)"));
}

TEST_F(HostToolsTest, AdvancedOptionFallsBackToLocalcli) {
  const std::string arguments = "system settings advanced set -o /UserVars/TulkTimeOut -i 900";
  for (int tavcliRc : {0, 1}) {
    HostTest::ClearInvocations();
    HostTest::WriteRecordingTool("/sbin/tavcli", "exit " + std::to_string(tavcliRc),
                                 "TAV_USERNAME$TAV_AUDIT_IP");
    HostTest::WriteRecordingTool("/sbin/localcli", "exit 0", "TAV_USERNAME$TAV_AUDIT_IP");
    EXPECT_TRUE(Tulk::SetAdvancedOption("/UserVars/TulkTimeOut", 900));
    Lines expected = {"tavcli " + arguments, "tavcli alice127.0.0.1"};
    if (tavcliRc != 0) {
      expected.push_back("localcli " + arguments);
      expected.push_back("localcli alice127.0.0.1");
    }
    EXPECT_EQ(Invocations(), expected);
  }
  HostTest::WriteRecordingTool("/sbin/localcli", "exit 1");
  EXPECT_FALSE(Tulk::SetAdvancedOption("/UserVars/TulkTimeOut", 900));
}

TEST_F(HostToolsTest, AdvancedOptionReadFallsBackToTheDefault) {
  HostTest::WriteHostState(R"({"advancedOptions": {"/UserVars/TaviShellTimeOut": 300}})");
  EXPECT_EQ(Tulk::ReadAdvancedOption("/UserVars/TaviShellTimeOut", 0), 300);
  EXPECT_EQ(Tulk::ReadAdvancedOption("/UserVars/TulkTimeOut", 600), 600);
  HostTest::WriteHostState(R"({"advancedOptions": {"/UserVars/TaviShellTimeOut": 300},
      "faults": {"HykCtl::Adv::UserAdvancedOptionImpl::GetUserOption": "locked"}})");
  EXPECT_EQ(Tulk::ReadAdvancedOption("/UserVars/TaviShellTimeOut", 0), 0);
}

class OpsAgentTest : public HostToolsTest {
 protected:
  void TearDown() override {
    std::filesystem::remove(HostTest::Root() / "etc/init.d/zyo-opsagent");
    HostToolsTest::TearDown();
  }
};

TEST_F(OpsAgentTest, AbsentAgentIsNotStartedAndLogsNoFailure) {
  EXPECT_FALSE(Tulk::HasOpsAgentVersion3OrLater());
  EXPECT_FALSE(Tulk::StartOpsAgentIfPresent());
  EXPECT_EQ(HostTest::LogLines(), (Lines{"<14>zyo-opsagent is not present on the system.",
                                         "<14>zyo-opsagent is not present on the system.",
                                         "<14>Skipping zyo-opsagent start."}));
}

TEST_F(OpsAgentTest, StartAndStopThroughTheInitScript) {
  HostTest::WriteRecordingTool("/etc/init.d/zyo-opsagent", "[ \"$1\" != stop ]");
  EXPECT_TRUE(Tulk::StartOpsAgentIfPresent());
  EXPECT_FALSE(Tulk::StopOpsAgent());
  EXPECT_EQ(Invocations(),
            (Lines{"zyo-opsagent status", "zyo-opsagent start", "zyo-opsagent stop"}));
  EXPECT_TRUE(Logged("<14>zyo-opsagent is present on the system."));
  EXPECT_TRUE(Logged("<14>Starting zyo-opsagent."));
  EXPECT_TRUE(Logged("<14>Stopping zyo-opsagent."));
  EXPECT_TRUE(Logged("<11>Failed to stop zyo-opsagent."));

  HostTest::WriteRecordingTool("/etc/init.d/zyo-opsagent", "[ \"$1\" = stop ]");
  EXPECT_TRUE(Tulk::StopOpsAgent());
  EXPECT_FALSE(Tulk::StartOpsAgent());
  EXPECT_TRUE(Logged("<14>zyo-opsagent has been successfully stopped."));
  EXPECT_TRUE(Logged("<11>Failed to start zyo-opsagent."));
}

TEST_F(OpsAgentTest, MajorVersionDecidesTheOverlayCondition) {
  HostTest::WriteRecordingTool("/etc/init.d/zyo-opsagent", "exit 0");
  struct Case {
    const char* printed;
    bool atLeast3;
  };
  for (const Case& c : {Case{"SoftwareVib.Version.string=3.0.1-1", true},
                        Case{"SoftwareVib.Version.string=2.9.9", false},
                        Case{"SoftwareVib.Version.string=10.2", true},
                        Case{"SoftwareVib.Name.string=zyo-opsagent", false},
                        Case{"SoftwareVib.VersionDate.string=4\n"
                             "SoftwareVib.Version.string=2.1",
                             false}}) {
    SCOPED_TRACE(c.printed);
    HostTest::ClearLog();
    // The tool answers only the exact package query.
    HostTest::WriteScript("/bin/tavcli",
                          "[ \"$*\" = '--formatter=keyvalue software vib get -n zyo-opsagent' ] "
                          "|| exit 1\nprintf '%s\\n' \"" +
                              std::string(c.printed) + "\"");
    EXPECT_EQ(Tulk::HasOpsAgentVersion3OrLater(), c.atLeast3);
    EXPECT_TRUE(Logged(std::string("<14>Running: ") + Tulk::OpsAgentVersionCommand()));
    EXPECT_EQ(Logged("<14>zyo-opsagent version >= 3 detected"), c.atLeast3);
  }
}

}  // namespace
