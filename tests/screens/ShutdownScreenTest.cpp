// Shutdown and restart on the real binary: F12 on the welcome screen, the
// check box, the host's commands and what the simulated host records.

#include <algorithm>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using nlohmann::json;

int CountRuns(const TestConsole& console, const std::string& name) {
  const std::vector<std::string> commands = CommandLines(console);
  return static_cast<int>(std::count_if(commands.begin(), commands.end(), [&](const auto& line) {
    return line == name || line.rfind(name + " ", 0) == 0;
  }));
}

::testing::AssertionResult OpenShutdown(TestConsole& console) {
  if (auto login = LogIn(console, "root", kRootPassword, "F12"); !login) {
    return login;
  }
  return Settled(console, "[ ] Forcefully terminate running VMs, if any ...");
}

std::string Power(const TestConsole& console) {
  return ReadHostState(console.HostStatePath()).value("power", "");
}

// Esc leaves without running anything; a shutdown then keeps the machines
// graceful.
TEST(ShutdownScreenTest, EscLeavesThenShutDownKeepsMachinesGraceful) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(OpenShutdown(console));
  EXPECT_TRUE(console.Contains("Remote management software is recommended to safely"));
  EXPECT_TRUE(console.Contains("<F2> Shut Down  <F11> Restart"));
  console.Key("Space");
  ASSERT_TRUE(Settled(console, "[X] Forcefully terminate"));
  console.Key("Enter");
  console.Key("Esc");
  ASSERT_TRUE(Settled(console, "To manage this host"));
  EXPECT_EQ(CountRuns(console, "powerOffVms") + CountRuns(console, "poweroff") +
                CountRuns(console, "reboot"),
            0);
  EXPECT_EQ(Power(console), "on");
  // Shutting down is not a session: no logout is recorded.
  EXPECT_TRUE(RecordsWhere(console, "audit.jsonl", "event", "tulk.logout").empty());

  ASSERT_TRUE(OpenShutdown(console));
  console.Key("F2");
  ASSERT_TRUE(Settled(console, "Shutdown in progress..."));
  EXPECT_TRUE(console.Contains("Shut Down Host"));
  ASSERT_TRUE(console.WaitUntil([&] { return Ran(console, "poweroff"); }, "poweroff"));
  EXPECT_TRUE(Ran(console, "osk-cmd -U root hostsvc/autostartmanager/autostop"));
  EXPECT_TRUE(Ran(console, "powerOffVms"));
  EXPECT_FALSE(Ran(console, "powerOffVms --terminate"));
  EXPECT_EQ(Power(console), "off");
  EXPECT_EQ(CountLog(console, "<14>Shutting down host"), 1);
  EXPECT_EQ(RecordsWhere(console, "events.jsonl", "id", "qob.user.tulk.shutdown.host").size(), 1u);

  // The console waits for the host to go down and ignores keys meanwhile.
  console.Key("Esc");
  console.Key("Enter");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("Shutdown in progress..."));
  EXPECT_TRUE(console.Running());
}

TEST(ShutdownScreenTest, RestartTerminatesMachinesWhenTicked) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(OpenShutdown(console));
  console.Key("Space");
  ASSERT_TRUE(Settled(console, "[X] Forcefully terminate"));
  console.Key("F11");
  ASSERT_TRUE(Settled(console, "Restart in progress..."));
  EXPECT_TRUE(console.Contains("Restart Host"));
  ASSERT_TRUE(console.WaitUntil([&] { return Ran(console, "reboot"); }, "reboot"));
  EXPECT_TRUE(Ran(console, "powerOffVms --terminate"));
  EXPECT_EQ(Power(console), "rebooting");
  EXPECT_EQ(CountLog(console, "<14>Rebooting host"), 1);
  const auto events = RecordsWhere(console, "events.jsonl", "id", "qob.user.tulk.reboot.host");
  ASSERT_EQ(events.size(), 1u);
  EXPECT_EQ(events[0]["text"], "Rebooting host");
}

TEST(ShutdownScreenTest, RestartThatCannotStartReturnsToTheDialog) {
  TulkTest::Options options = ConsoleOptions(
      DemoHostState(), {},
      [](const std::filesystem::path& root) { std::filesystem::remove(root / "bin/sh"); });
  TestConsole console(options);
  ASSERT_TRUE(OpenShutdown(console));
  console.Key("F11");
  ASSERT_TRUE(console.WaitForLog("Rebooting host"));
  ASSERT_TRUE(Gone(console, "Restart in progress..."));
  ASSERT_TRUE(Settled(console, "[ ] Forcefully terminate"));
  console.Key("F11");
  ASSERT_TRUE(
      console.WaitUntil([&] { return CountRuns(console, "powerOffVms") == 2; }, "a second try"));
  ASSERT_TRUE(Settled(console, "[ ] Forcefully terminate"));
  EXPECT_EQ(CountLog(console, "<14>Rebooting host"), 2);
  EXPECT_EQ(Power(console), "on");
}

TEST(ShutdownScreenTest, RestartCommandThatFailsKeepsWaiting) {
  json host = DemoHostState();
  host["commands"]["reboot"] = {{"exitCode", 1}};
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(OpenShutdown(console));
  console.Key("F11");
  ASSERT_TRUE(console.WaitUntil([&] { return Ran(console, "reboot"); }, "reboot"));
  console.Key("Esc");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("Restart in progress..."));
  EXPECT_EQ(Power(console), "on");
}

}  // namespace
