// Switching the repair services against the simulated host tools: the
// commands in their order, the init-script fallback, the firewall ruleset
// on SSH's fallback path only, and what is logged.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/RepairServices.h"
#include "include/ProcessFlags.h"
#include "platform/sim/DemoHost.h"

namespace {

using Lines = std::vector<std::string>;
using Tulk::FirewallChange;

// The tool runs, each argv joined by blanks; the init scripts' folder is
// dropped so that the lines do not depend on the scratch root.
Lines ToolRuns() {
  Lines runs;
  for (const nlohmann::json& record : HostTest::Records("commands.jsonl")) {
    std::string line;
    for (const nlohmann::json& word : record["argv"]) {
      line += (line.empty() ? "" : " ") + word.get<std::string>();
    }
    runs.push_back(line);
  }
  return runs;
}

// The warning lines (priority 12: user facility, warning).
Lines Warnings() {
  Lines warnings;
  for (const std::string& line : HostTest::LogLines()) {
    if (line.rfind("<12>", 0) == 0) {
      warnings.push_back(line.substr(4));
    }
  }
  return warnings;
}

class RepairServicesTest : public ::testing::Test {
 protected:
  void SetUp() override {
    HostTest::ClearLog();
    HostTest::ClearRecords();
    state_ = Sim::DemoHostState();
    Tulk::currentUser = "operator";
  }
  void TearDown() override { Tulk::currentUser.clear(); }

  void Write() { HostTest::WriteHostState(state_); }
  nlohmann::json& Service(const char* name) { return state_["services"][name]; }
  nlohmann::json& SshRuleset() { return state_["system"]["firewall"]["sshServer"]; }
  void Fail(const std::string& command, int exitCode = 1) {
    state_["commands"][command] = {{"exitCode", exitCode}};
  }

  nlohmann::json state_;
};

TEST_F(RepairServicesTest, StatusIsRunningExactlyWhenTheScriptExitsWithZero) {
  struct Case {
    nlohmann::json service;
    bool running;
  };
  const Case cases[] = {
      {{{"running", true}}, true},
      {{{"running", false}}, false},
      {{{"running", true}, {"installed", false}}, false},  // the script exits 1
  };
  for (const Case& c : cases) {
    Service("TavShell") = c.service;
    Service("SSH") = c.service;
    Write();
    EXPECT_EQ(Tulk::IsServiceRunning(Tulk::kTaviShellService), c.running) << c.service;
    EXPECT_EQ(Tulk::IsServiceRunning(Tulk::kSshService), c.running) << c.service;
  }
  state_["services"].erase("SSH");
  Write();
  EXPECT_FALSE(Tulk::IsServiceRunning(Tulk::kSshService));
}

TEST_F(RepairServicesTest, SwitchOnThenOffRunsStartEnableStopDisable) {
  state_["users"]["accounts"][1]["oskCmd"] = true;
  Write();
  const Tulk::ServiceSwitch on = Tulk::SwitchService(Tulk::kTaviShellService, false);
  EXPECT_EQ(HostTest::ReadHostState()["services"]["TavShell"],
            (nlohmann::json{{"running", true}, {"enabled", true}}));
  const Tulk::ServiceSwitch off = Tulk::SwitchService(Tulk::kTaviShellService, true);
  EXPECT_EQ(ToolRuns(), (Lines{"osk-cmd -U operator hostsvc/start_tav_shell",
                               "osk-cmd -U operator hostsvc/enable_tav_shell",
                               "osk-cmd -U operator hostsvc/stop_tav_shell",
                               "osk-cmd -U operator hostsvc/disable_tav_shell"}));
  EXPECT_EQ(HostTest::ReadHostState()["services"]["TavShell"],
            (nlohmann::json{{"running", false}, {"enabled", false}}));
  for (const Tulk::ServiceSwitch& outcome : {on, off}) {
    EXPECT_FALSE(outcome.initScriptUsed);
    EXPECT_EQ(outcome.firewall, FirewallChange::kUntouched);
  }
  EXPECT_EQ(Warnings(), Lines{});
}

TEST_F(RepairServicesTest, OperatorRefusedByTheToolRunsAsTheFallbackUser) {
  // The demo host's "operator" may not use the management-API tool.
  Write();
  Tulk::SwitchService(Tulk::kSshService, false);
  EXPECT_EQ(
      ToolRuns(),
      (Lines{"osk-cmd -U operator hostsvc/start_ssh", "osk-cmd -U root hostsvc/start_ssh",
             "osk-cmd -U operator hostsvc/enable_ssh", "osk-cmd -U root hostsvc/enable_ssh"}));
  EXPECT_EQ(HostTest::ReadHostState()["services"]["SSH"]["running"], true);
}

TEST_F(RepairServicesTest, FailedStartOrStopFallsBackToTheInitScript) {
  struct Case {
    const char* name;
    const Tulk::RepairService& service;
    bool on;
    bool managed;
    bool rulesetBefore;
    bool rulesetAfter;
    FirewallChange firewall;
    Lines runs;
  };
  const Case cases[] = {
      {"shell on",
       Tulk::kTaviShellService,
       false,
       true,
       false,
       false,
       FirewallChange::kUntouched,
       {"osk-cmd -U root hostsvc/start_tav_shell", "TavShell start",
        "osk-cmd -U root hostsvc/enable_tav_shell"}},
      {"ssh on",
       Tulk::kSshService,
       false,
       true,
       false,
       true,
       FirewallChange::kSwitched,
       {"osk-cmd -U root hostsvc/start_ssh", "SSH start", "osk-cmd -U root hostsvc/enable_ssh"}},
      {"ssh off",
       Tulk::kSshService,
       true,
       true,
       true,
       false,
       FirewallChange::kSwitched,
       {"osk-cmd -U root hostsvc/stop_ssh", "SSH stop", "osk-cmd -U root hostsvc/disable_ssh"}},
      {"ssh on, ruleset pinned",
       Tulk::kSshService,
       false,
       false,
       false,
       false,
       FirewallChange::kUntouched,
       {"osk-cmd -U root hostsvc/start_ssh", "SSH start", "osk-cmd -U root hostsvc/enable_ssh"}},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    SetUp();
    Tulk::currentUser = "root";
    Fail(std::string("osk-cmd -U root hostsvc/") + (c.on ? "stop_" : "start_") +
         c.service.commandSuffix);
    SshRuleset() = {{"enabled", c.rulesetBefore}, {"managedWithService", c.managed}};
    Service(c.on ? "SSH" : "TavShell")["running"] = c.on;
    Write();
    const Tulk::ServiceSwitch outcome = Tulk::SwitchService(c.service, c.on);
    EXPECT_EQ(ToolRuns(), c.runs);
    EXPECT_TRUE(outcome.initScriptUsed);
    EXPECT_EQ(outcome.initScriptCode, 0);
    EXPECT_EQ(outcome.firewall, c.firewall);
    const nlohmann::json host = HostTest::ReadHostState();
    EXPECT_EQ(host["system"]["firewall"]["sshServer"]["enabled"], c.rulesetAfter);
    EXPECT_EQ(host["services"][&c.service == &Tulk::kSshService ? "SSH" : "TavShell"]["running"],
              !c.on);
    EXPECT_EQ(Warnings(),
              Lines{std::string("Unable to run osk-cmd to start/stop ") + c.service.logName});
  }
}

TEST_F(RepairServicesTest, FirewallFailureIsLoggedAndTheSwitchGoesOn) {
  Tulk::currentUser = "root";
  Fail("osk-cmd -U root hostsvc/start_ssh");
  Fail("osk-cmd -U root hostsvc/enable_ssh", 2);
  state_["faults"]["FirewallRuleset::Enable"] = "Ruleset is locked";
  Write();
  const Tulk::ServiceSwitch outcome = Tulk::SwitchService(Tulk::kSshService, false);
  EXPECT_EQ(outcome.firewall, FirewallChange::kFailed);
  EXPECT_EQ(outcome.enableDisableCode, 2);
  EXPECT_EQ(Warnings(), (Lines{"Unable to run osk-cmd to start/stop ssh",
                               "Failed to update firewall sshServer ruleset status: "
                               "Ruleset is locked",
                               "Unable to run osk-cmd to enable/disable ssh"}));
  EXPECT_EQ(HostTest::ReadHostState()["services"]["SSH"]["running"], true);

  // Without the ruleset the lookup itself fails, the same way.
  HostTest::ClearLog();
  EXPECT_EQ(Tulk::SwitchFirewallRuleset("noSuchRuleset", true), FirewallChange::kFailed);
  EXPECT_EQ(Warnings(), (Lines{"Failed to update firewall noSuchRuleset ruleset status: "
                               "Firewall ruleset noSuchRuleset not found"}));
}

TEST_F(RepairServicesTest, RestartReachesOnlyTheRunningServices) {
  struct Case {
    bool shellRunning;
    bool sshRunning;
    Lines runs;
  };
  const Case cases[] = {
      {false, false, {"TavShell status", "SSH status"}},
      {true, false, {"TavShell status", "TavShell restart", "SSH status"}},
      {true, true, {"TavShell status", "TavShell restart", "SSH status", "SSH restart"}},
  };
  for (const Case& c : cases) {
    SetUp();
    Service("TavShell")["running"] = c.shellRunning;
    Service("SSH")["running"] = c.sshRunning;
    Write();
    EXPECT_EQ(Tulk::RestartRunningRepairServices(), c.shellRunning + c.sshRunning);
    EXPECT_EQ(ToolRuns(), c.runs);
    const nlohmann::json services = HostTest::ReadHostState()["services"];
    EXPECT_EQ(services["TavShell"].value("restarts", 0), c.shellRunning ? 1 : 0);
    EXPECT_EQ(services["SSH"].value("restarts", 0), c.sshRunning ? 1 : 0);
  }
}

}  // namespace
