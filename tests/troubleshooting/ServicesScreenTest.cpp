// The troubleshooting menu: the service entries as the host's status
// scripts report them, the toggles with their commands, fallbacks and log
// lines, and the timeouts entry that follows both services.

#include <gtest/gtest.h>

#include "TroubleshootingTestSupport.h"

namespace {

using namespace TroubleshootingTest;
using namespace std::chrono_literals;

constexpr char kTimeouts[] = "Modify Tavi Shell and SSH timeouts";

::testing::AssertionResult MenuShown(TestConsole& console) {
  return Settled(console, "Restart Management Agents");
}

TEST(ServicesScreenTest, StatusScriptsChooseTheLabels) {
  struct Case {
    const char* name;
    Json host;
    const char* shellLabel;
    const char* sshLabel;
    bool timeoutsGreyed;
  };
  Json notInstalled = HostWithServices(false, true);
  notInstalled["services"]["SSH"]["installed"] = false;  // status exits 1
  const Case cases[] = {
      {"both stopped", HostWithServices(false, false), "Enable Tavi Shell", "Enable SSH", false},
      {"shell running", HostWithServices(true, false), "Disable Tavi Shell", "Enable SSH", true},
      {"ssh running", HostWithServices(false, true), "Enable Tavi Shell", "Disable SSH", true},
      {"ssh status fails", notInstalled, "Enable Tavi Shell", "Enable SSH", false},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    TestConsole console(DriverOptions(c.host));
    ASSERT_TRUE(MenuShown(console));
    EXPECT_TRUE(console.Contains("Troubleshooting Mode Options"));
    EXPECT_TRUE(console.Contains(c.shellLabel));
    EXPECT_TRUE(console.Contains(c.sshLabel));
    EXPECT_EQ(Greyed(console, kTimeouts), c.timeoutsGreyed) << console.Dump();
    EXPECT_EQ(ToolRuns(console), (Lines{"TavShell status", "SSH status"}));
  }
}

TEST(ServicesScreenTest, RightHalfAndFootersFollowTheCursor) {
  TestConsole console(DriverOptions(HostWithServices(true, false)));
  ASSERT_TRUE(MenuShown(console));
  EXPECT_EQ(RightTitle(console), "Tavi Shell");
  EXPECT_EQ(ForegroundOf(console, "Tavi Shell is Enabled"), 7);
  EXPECT_EQ(ForegroundOf(console, "Change current state of"), 2);
  // Right after the window is shown: the refresh footers.
  EXPECT_TRUE(console.Contains("<Up/Down> Select"));
  EXPECT_TRUE(console.Contains("<Enter> Change"));
  EXPECT_TRUE(console.Contains("<Esc> Exit"));

  struct Step {
    const char* title;
    const char* description;
    const char* footer;
  };
  // The timeouts entry is greyed (the shell runs): Down passes over it.
  const Step steps[] = {
      {"SSH Support", "SSH is Disabled", "<Enter> Change"},
      {"Modify TULK idle timeout", "Modify the number of idle minutes", "<Enter> Change"},
      {"Restart Management Agents", "The management agents are the", "<Enter> Restart"},
  };
  for (const Step& step : steps) {
    console.Key("Down");
    ASSERT_TRUE(Settled(console, step.description));
    EXPECT_EQ(RightTitle(console), step.title);
    EXPECT_TRUE(console.Contains(step.footer)) << console.Dump();
    EXPECT_TRUE(console.Contains("<Esc> Exit"));
  }
  EXPECT_EQ(ForegroundOf(console, "SSH is Disabled"), -2);

  console.Key("Esc");
  EXPECT_TRUE(console.WaitForText("result: 1"));
}

TEST(ServicesScreenTest, TogglesFlipLabelsAndGreyTheTimeoutsWhileEitherRuns) {
  TestConsole console(DriverOptions(HostWithServices(false, false)));
  ASSERT_TRUE(MenuShown(console));
  ASSERT_FALSE(Greyed(console, kTimeouts));

  struct Step {
    const char* key;  // a move before Enter, or nullptr
    const char* label;
    bool timeoutsGreyed;
  };
  const Step steps[] = {
      {nullptr, "Disable Tavi Shell", true}, {"Down", "Disable SSH", true},
      {"Up", "Enable Tavi Shell", true},     {"Down", "Enable SSH", false},
      {nullptr, "Disable SSH", true},        {nullptr, "Enable SSH", false},
  };
  for (const Step& step : steps) {
    if (step.key != nullptr) {
      console.Key(step.key);
      console.WaitQuiet();
    }
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, step.label));
    EXPECT_EQ(Greyed(console, kTimeouts), step.timeoutsGreyed) << step.label << console.Dump();
  }
  // The description follows the flag; the refresh footer is back.
  EXPECT_TRUE(console.Contains("SSH is Disabled"));
  EXPECT_TRUE(console.Contains("<Up/Down> Select"));

  EXPECT_EQ(
      ToolRunsStarting(console, "osk-cmd"),
      (Lines{"osk-cmd -U root hostsvc/start_tav_shell", "osk-cmd -U root hostsvc/enable_tav_shell",
             "osk-cmd -U root hostsvc/start_ssh", "osk-cmd -U root hostsvc/enable_ssh",
             "osk-cmd -U root hostsvc/stop_tav_shell", "osk-cmd -U root hostsvc/disable_tav_shell",
             "osk-cmd -U root hostsvc/stop_ssh", "osk-cmd -U root hostsvc/disable_ssh",
             "osk-cmd -U root hostsvc/start_ssh", "osk-cmd -U root hostsvc/enable_ssh",
             "osk-cmd -U root hostsvc/stop_ssh", "osk-cmd -U root hostsvc/disable_ssh"}));
  EXPECT_EQ(LogLinesWith(console, "User root"),
            (Lines{"User root enabled Tavi Shell", "User root enabled SSH",
                   "User root disabled Tavi Shell", "User root disabled SSH",
                   "User root enabled SSH", "User root disabled SSH"}));

  // Both stopped again: the timeouts entry can be chosen.
  ASSERT_TRUE(SelectTitle(console, kTimeouts));
  const Json services = HostState(console)["services"];
  EXPECT_EQ(services["TavShell"], (Json{{"running", false}, {"enabled", false}}));
  EXPECT_EQ(services["SSH"], (Json{{"running", false}, {"enabled", false}}));
}

TEST(ServicesScreenTest, FailingToolFallsBackToTheInitScriptAndSwitchesTheRuleset) {
  Json host = HostWithServices(false, false);
  host["commands"]["osk-cmd -U root hostsvc/start_ssh"] = {{"exitCode", 1}};
  host["commands"]["osk-cmd -U root hostsvc/stop_ssh"] = {{"exitCode", 1}};
  host["system"]["firewall"]["sshServer"] = {{"enabled", false}, {"managedWithService", true}};
  TestConsole console(DriverOptions(host));
  ASSERT_TRUE(MenuShown(console));
  console.Key("Down");
  ASSERT_TRUE(Settled(console, "SSH is Disabled"));

  struct Step {
    const char* label;
    bool running;
    bool ruleset;
    Lines runs;
  };
  const Step steps[] = {
      {"Disable SSH",
       true,
       true,
       {"osk-cmd -U root hostsvc/start_ssh", "SSH start", "osk-cmd -U root hostsvc/enable_ssh"}},
      {"Enable SSH",
       false,
       false,
       {"osk-cmd -U root hostsvc/stop_ssh", "SSH stop", "osk-cmd -U root hostsvc/disable_ssh"}},
  };
  std::size_t seen = ToolRuns(console).size();
  for (const Step& step : steps) {
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, step.label));
    const Lines runs = ToolRuns(console);
    EXPECT_EQ(Lines(runs.begin() + static_cast<long>(seen), runs.end()), step.runs);
    seen = runs.size();
    const Json state = HostState(console);
    EXPECT_EQ(state["services"]["SSH"]["running"], step.running);
    EXPECT_EQ(state["system"]["firewall"]["sshServer"]["enabled"], step.ruleset);
  }
  EXPECT_EQ(LogLinesWith(console, "Unable to run osk-cmd"),
            (Lines{"Unable to run osk-cmd to start/stop ssh",
                   "Unable to run osk-cmd to start/stop ssh"}));
}

TEST(ServicesScreenTest, FlagAndLabelFlipEvenWhenEveryCommandFails) {
  Json host = HostWithServices(false, false);
  host["commands"]["osk-cmd"] = {{"exitCode", 1}};
  host["services"]["TavShell"]["installed"] = false;  // the init script fails too
  TestConsole console(DriverOptions(host));
  ASSERT_TRUE(MenuShown(console));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Disable Tavi Shell"));
  EXPECT_TRUE(console.Contains("Tavi Shell is Enabled"));
  EXPECT_TRUE(Greyed(console, kTimeouts));
  EXPECT_EQ(HostState(console)["services"]["TavShell"]["running"], false);
  EXPECT_EQ(LogLinesWith(console, "Tavi Shell"),
            (Lines{"Unable to run osk-cmd to start/stop Tavi Shell",
                   "Unable to run osk-cmd to enable/disable Tavi Shell",
                   "User root enabled Tavi Shell"}));
}

}  // namespace
