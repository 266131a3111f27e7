// The troubleshooting menu: service entries as the status scripts report
// them, the toggles' commands, fallbacks and log lines, and the timeouts
// entry that follows both services.

#include <gtest/gtest.h>

#include <utility>

#include "TroubleshootingTestSupport.h"

namespace {

using namespace TulkTest;

constexpr char kTimeouts[] = "Modify Tavi Shell and SSH timeouts";
constexpr int kDarkGrey = 6;

Lines Warnings(const TestConsole& console) {
  Lines warnings;
  for (const std::string& line : console.LogLines()) {
    if (line.rfind("<12>", 0) == 0) {
      warnings.push_back(line.substr(4));
    }
  }
  return warnings;
}

bool TimeoutsGreyed(const TestConsole& console) {
  return ForegroundOf(console, kTimeouts) == kDarkGrey;
}

TEST(ServicesScreenTest, StatusScriptsChooseTheLabels) {
  Json notInstalled = HostWithServices(false, true);
  notInstalled["services"]["SSH"]["installed"] = false;  // status exits 1
  const struct {
    Json host;
    const char* labels[2];
    bool timeoutsGreyed;
  } cases[] = {
      {HostWithServices(true, false), {"Disable Tavi Shell", "Enable SSH"}, true},
      {HostWithServices(false, true), {"Enable Tavi Shell", "Disable SSH"}, true},
      {notInstalled, {"Enable Tavi Shell", "Enable SSH"}, false},
  };
  // One console: each case leaves the window, replaces the host and opens
  // the window again.
  TestConsole console(DriverOptions(cases[0].host, "troubleshooting"));
  bool first = true;
  for (const auto& c : cases) {
    if (!std::exchange(first, false)) {
      console.Key("Esc");
      ASSERT_TRUE(Gone(console, "Restart Management Agents"));
      ReplaceHostState(console, c.host);
      console.Type("o");
    }
    ASSERT_TRUE(Settled(console, "Restart Management Agents"));
    EXPECT_TRUE(console.Contains(c.labels[0]) && console.Contains(c.labels[1])) << console.Dump();
    EXPECT_EQ(TimeoutsGreyed(console), c.timeoutsGreyed) << c.labels[0] << c.labels[1];
  }
}

TEST(ServicesScreenTest, TogglesFlipLabelsAndGreyTheTimeoutsWhileEitherRuns) {
  TestConsole console(DriverOptions(HostWithServices(false, false), "troubleshooting"));
  ASSERT_TRUE(Settled(console, "Restart Management Agents"));
  EXPECT_TRUE(console.Contains("Enable Tavi Shell") && console.Contains("Enable SSH"));
  EXPECT_FALSE(TimeoutsGreyed(console));
  EXPECT_EQ(ForegroundOf(console, "Tavi Shell is Disabled"), 7);
  const struct {
    const char* move;  // before Enter
    const char* label;
    bool timeoutsGreyed;
  } steps[] = {
      {nullptr, "Disable Tavi Shell", true}, {nullptr, "Enable Tavi Shell", false},
      {"Down", "Disable SSH", true},         {"Up", "Disable Tavi Shell", true},
      {nullptr, "Enable Tavi Shell", true},  {"Down", "Enable SSH", false},
  };
  for (const auto& step : steps) {
    if (step.move != nullptr) {
      console.Key(step.move);
    }
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, step.label));
    EXPECT_EQ(TimeoutsGreyed(console), step.timeoutsGreyed) << step.label;
  }
  EXPECT_TRUE(console.Contains("SSH is Disabled"));  // the state line follows the flag

  const std::string osk = "osk-cmd -U root hostsvc/";
  EXPECT_EQ(CommandLines(console, "osk-cmd"),
            (Lines{osk + "start_tav_shell", osk + "enable_tav_shell", osk + "stop_tav_shell",
                   osk + "disable_tav_shell", osk + "start_ssh", osk + "enable_ssh",
                   osk + "start_tav_shell", osk + "enable_tav_shell", osk + "stop_tav_shell",
                   osk + "disable_tav_shell", osk + "stop_ssh", osk + "disable_ssh"}));
  EXPECT_EQ(LogLinesWith(console, "User root"),
            (Lines{"User root enabled Tavi Shell", "User root disabled Tavi Shell",
                   "User root enabled SSH", "User root enabled Tavi Shell",
                   "User root disabled Tavi Shell", "User root disabled SSH"}));
  EXPECT_TRUE(SelectEntry(console, kTimeouts));
}

TEST(ServicesScreenTest, FailingToolFallsBackToTheInitScriptAndSwitchesTheRuleset) {
  const struct {
    bool managed;
    const char* fault;
    bool rulesetOpen;
    const char* warning;
  } cases[] = {
      {true, nullptr, true, nullptr},
      {false, nullptr, false, nullptr},
      {true, "Ruleset is locked", false,
       "Failed to update firewall sshServer ruleset status: Ruleset is locked"},
  };
  for (const auto& c : cases) {
    Json host = HostWithServices(false, false);
    host["commands"]["osk-cmd -U root hostsvc/start_ssh"] = {{"exitCode", 1}};
    host["system"]["firewall"]["sshServer"] = {{"enabled", false},
                                               {"managedWithService", c.managed}};
    if (c.fault != nullptr) {
      host["faults"]["FirewallRuleset::Enable"] = c.fault;
    }
    TestConsole console(DriverOptions(host, "troubleshooting"));
    ASSERT_TRUE(Settled(console, "Restart Management Agents"));
    console.Key("Down");
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "Disable SSH"));
    EXPECT_EQ(CommandLines(console, "SSH start"), Lines{"SSH start"});
    EXPECT_EQ(CommandLines(console, "osk-cmd").back(), "osk-cmd -U root hostsvc/enable_ssh");
    const Json state = ReadHostState(console.HostStatePath());
    EXPECT_EQ(state["services"]["SSH"]["running"], true);
    EXPECT_EQ(state["system"]["firewall"]["sshServer"]["enabled"], c.rulesetOpen);
    Lines warnings = {"Unable to run osk-cmd to start/stop ssh"};
    if (c.warning != nullptr) {
      warnings.push_back(c.warning);
    }
    EXPECT_EQ(Warnings(console), warnings);
  }
}

TEST(ServicesScreenTest, FlagAndLabelFlipEvenWhenEveryCommandFails) {
  Json host = HostWithServices(false, false);
  host["commands"]["osk-cmd"] = {{"exitCode", 1}};
  host["services"]["TavShell"]["installed"] = false;  // the init script fails too
  TestConsole console(DriverOptions(host, "troubleshooting"));
  ASSERT_TRUE(Settled(console, "Restart Management Agents"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Disable Tavi Shell"));
  EXPECT_TRUE(console.Contains("Tavi Shell is Enabled"));
  EXPECT_TRUE(TimeoutsGreyed(console));
  EXPECT_EQ(LogLinesWith(console, "Tavi Shell"),
            (Lines{"Unable to run osk-cmd to start/stop Tavi Shell",
                   "Unable to run osk-cmd to enable/disable Tavi Shell",
                   "User root enabled Tavi Shell"}));
}

}  // namespace
