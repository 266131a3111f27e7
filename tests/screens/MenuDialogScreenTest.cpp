// The dialogs the menu opens: lockdown mode, keyboard layout and the reset
// of the system configuration, with their effect on the simulated host.

#include <gtest/gtest.h>
#include <signal.h>
#include <unistd.h>

#include <fstream>
#include <thread>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using Json = nlohmann::json;
using namespace std::chrono_literals;

long CpuTicks(pid_t pid) {
  std::ifstream stat("/proc/" + std::to_string(pid) + "/stat");
  std::string text((std::istreambuf_iterator<char>(stat)), std::istreambuf_iterator<char>());
  std::istringstream fields(text.substr(text.rfind(')') + 2));
  std::string field;
  long ticks = 0;
  for (int i = 3; i <= 15 && fields >> field; ++i) {
    if (i >= 14) {
      ticks += std::stol(field);
    }
  }
  return ticks;
}

// The lockdown toggle's round trip, then a keyboard layout change that
// reaches the host (a local console has the keyboard entry).
TEST(MenuDialogScreenTest, LockdownToggleAndKeyboardLayoutReachTheHost) {
  TulkTest::Options options = DriverOptions();
  options.term = "xterm";
  TestConsole console(options);
  ASSERT_TRUE(SelectEntry(console, "Configure Lockdown Mode"));
  EXPECT_TRUE(console.WaitForText("Disabled"));
  // After the dialog the menu shows from the first entry again; the
  // lockdown entry then tells the new state.
  struct Step {
    bool toggle;
    const char* key;
    const char* before;
    bool expected;
    const char* shown;
  };
  const Step steps[] = {
      {true, "Enter", "[ ] Enable lockdown mode", true, "Enabled"},
      {true, "Esc", "[X] Enable lockdown mode", true, "Enabled"},
      {true, "Enter", "[X] Enable lockdown mode", false, "Disabled"},
  };
  for (const Step& step : steps) {
    ASSERT_TRUE(SelectEntry(console, "Configure Lockdown Mode"));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, step.before));
    EXPECT_TRUE(console.WaitForText("When enabled, lockdown mode prevents users"));
    console.Key("Space");
    console.Key(step.key);
    ASSERT_TRUE(Gone(console, "Enable lockdown mode"));
    EXPECT_EQ(HostState(console)["lockdown"]["enabled"], step.expected);
    EXPECT_TRUE(console.WaitUntil([&] { return RightTitle(console) == "Configure Password"; },
                                  "the first entry"));
    ASSERT_TRUE(SelectEntry(console, "Configure Lockdown Mode"));
    EXPECT_TRUE(console.WaitForText(step.shown));
  }
  EXPECT_TRUE(
      console.WaitForLog("Command \"osk-cmd -U root osksvc/auth/lockdown_exit\" succeeded"));

  ASSERT_TRUE(SelectEntry(console, "Configure Keyboard"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "(o) US Default"));
  EXPECT_TRUE(console.WaitForText("If you are having difficulty using your keyboard"));
  console.Key("Up");
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, "(o) US Default"));
  EXPECT_EQ(HostState(console)["system"]["keyboardLayout"], "US Default");

  ASSERT_TRUE(SelectEntry(console, "Configure Keyboard"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "(o) US Default"));
  console.Key("Down");
  console.Key("Enter");
  ASSERT_TRUE(Gone(console, "If you are having difficulty"));
  EXPECT_TRUE(console.WaitForLog("<14>Keyboard layout changed to US Dvorak"));
  EXPECT_EQ(HostState(console)["system"]["keyboardLayout"], "US Dvorak");
  ASSERT_TRUE(SelectEntry(console, "Configure Keyboard"));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("(o) US Dvorak"));
}

TEST(MenuDialogScreenTest, FailedResetIsReportedAfterTheEventAndLogLine) {
  Json host = DemoHostState();
  host["commands"]["firmwareConfig.py --reset-only"] = {{"exitCode", 1}, {"delayMs", 800}};
  TestConsole console(DriverOptions(host));
  ASSERT_TRUE(SelectEntry(console, "Reset System Configuration"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Reset System Configuration now?"));
  EXPECT_TRUE(console.WaitForText("Reset System Configuration: Confirm"));
  console.Key("Enter");  // only F11 confirms
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("Reset System Configuration now?")) << console.Dump();
  EXPECT_TRUE(LogLinesWith(console, "Restoring factory defaults").empty());

  console.Key("F11");
  ASSERT_TRUE(console.WaitForText("Please wait while the default settings are restored."));
  ASSERT_TRUE(console.WaitUntil([&] { return Ran(console, "firmwareConfig.py --reset-only"); },
                                "the reset"));
  const auto events = SimRecords(console.Root(), "events.jsonl");
  ASSERT_EQ(events.size(), 1U);
  EXPECT_EQ(events[0]["id"], "qob.user.tulk.restore.factory.defaults");
  EXPECT_EQ(events[0]["text"], "Restoring factory defaults");
  EXPECT_TRUE(console.WaitForLog("<14>Restoring factory defaults", 0ms));

  ASSERT_TRUE(Settled(console, "Failed to reset system configuration."));
  EXPECT_TRUE(console.WaitForText("Reset System Configuration: Error"));
  EXPECT_FALSE(Ran(console, "reboot -f"));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForTextGone("Failed to reset"));
}

TEST(MenuDialogScreenTest, SuccessfulResetRestartsOnEnterAndWaitsWithoutCpu) {
  Json host = DemoHostState();
  host["lockdown"]["enabled"] = true;
  TestConsole console(DriverOptions(host, "reset"));
  ASSERT_TRUE(Settled(console, "Reset System Configuration now?"));
  console.Key("F11");
  ASSERT_TRUE(Settled(console, "Default settings are restored."));
  EXPECT_TRUE(console.WaitForText("<Enter> Restart Host"));
  EXPECT_EQ(HostState(console)["lockdown"]["enabled"], false);
  console.Key("Esc");
  console.Key("F11");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_FALSE(Ran(console, "reboot -f"));
  EXPECT_TRUE(console.Contains("Default settings are restored.")) << console.Dump();

  console.Key("Enter");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(Ran(console, "reboot -f"));
  EXPECT_EQ(HostState(console)["power"], "rebooting");
  EXPECT_EQ(HostState(console)["powerForced"], true);
  // Keys are read and dropped while the host goes down; in between the
  // console sleeps (a loop that spins would use a tick every 10 ms).
  console.Key("Esc");
  console.Key("Enter");
  ASSERT_TRUE(console.WaitReady());
  const long before = CpuTicks(console.Pid());
  std::this_thread::sleep_for(300ms);
  EXPECT_LE(CpuTicks(console.Pid()) - before, 2);
  EXPECT_TRUE(console.Running());
  EXPECT_FALSE(console.Contains("result:"));

  console.Signal(SIGTERM);
  EXPECT_EQ(console.WaitExit(), 0);
}

TEST(MenuDialogScreenTest, IdleTimeoutLeavesTheMenuFromAnOpenDialog) {
  Json host = DemoHostState();
  host["advancedOptions"]["/UserVars/TulkTimeOut"] = 60;
  TulkTest::Options options = DriverOptions(host);
  options.timeScale = 30;  // the session ends 2 s after the last key
  TestConsole console(options);
  ASSERT_TRUE(SelectEntry(console, "Configure Lockdown Mode"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForText("Enable lockdown mode"));
  EXPECT_TRUE(console.WaitForText("result: -1"));
}

TEST(MenuDialogScreenTest, ProgressTextIsOnTheScreenWhileTheResetRuns) {
  Json host = DemoHostState();
  // The reset runs long enough for the screen to be read meanwhile.
  host["commands"]["firmwareConfig.py --reset-only"] = {{"exitCode", 1}, {"delayMs", 60000}};
  TestConsole console(DriverOptions(host, "reset"));
  ASSERT_TRUE(Settled(console, "Reset System Configuration now?"));
  console.Key("F11");
  pid_t tool = -1;
  ASSERT_TRUE(console.WaitUntil(
      [&] {
        for (const Json& record : SimRecords(console.Root(), "commands.jsonl")) {
          if (record["argv"].size() > 1 && record["argv"][1] == "--reset-only") {
            tool = record["pid"].get<pid_t>();
          }
        }
        return tool > 0;
      },
      "the reset started"));
  // The console sent what it announces before it started the command.
  console.Pump();
  EXPECT_TRUE(console.Contains("Please wait while the default settings are restored."))
      << console.Dump();
  kill(tool, SIGKILL);
  EXPECT_TRUE(console.WaitForTextGone("Please wait while the default settings"));
}

}  // namespace
