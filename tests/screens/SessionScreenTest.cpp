// Sessions on the real binary: logout, the idle timeout and a deferred
// exit request.

#include <signal.h>

#include "ProcessHygiene.h"
#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using nlohmann::json;

// Esc from the menu logs out; a SIGUSR2 during a later session exits after
// its logout.
TEST(SessionScreenTest, EscFromTheMenuLogsOutAndSigusr2ExitsAfterLogout) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(LogIn(console));
  ASSERT_TRUE(Settled(console, "System Customization"));
  console.Key("Esc");
  ASSERT_TRUE(Settled(console, "To manage this host"));
  ASSERT_TRUE(console.WaitForLog("User root logged out"));
  EXPECT_EQ(CountLog(console, "<14>User root logged out"), 1);
  const auto logouts = RecordsWhere(console, "audit.jsonl", "event", "tulk.logout");
  ASSERT_EQ(logouts.size(), 1u);
  EXPECT_EQ(logouts[0]["user"], "root");
  EXPECT_EQ(logouts[0]["component"], "tulk");
  EXPECT_EQ(logouts[0]["attributes"], json({{"reason", "Session closed"}}));

  // A second session by another user.
  ASSERT_TRUE(LogIn(console, "operator", "operator"));
  ASSERT_TRUE(Settled(console, "System Customization"));
  console.Key("Esc");
  ASSERT_TRUE(console.WaitForLog("User operator logged out"));

  ASSERT_TRUE(LogIn(console));
  ASSERT_TRUE(Settled(console, "System Customization"));
  console.Signal(SIGUSR2);
  console.Key("Down");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Running());
  EXPECT_TRUE(console.Contains("System Customization"));
  console.Key("Esc");
  EXPECT_EQ(console.WaitExit(), 0);
  EXPECT_EQ(CountLog(console, "<14>User root logged out"), 2);
  EXPECT_EQ(RecordsWhere(console, "audit.jsonl", "event", "tulk.logout").size(), 3u);
}

TEST(SessionScreenTest, IdleTimeoutEndsTheSession) {
  json host = DemoHostState();
  host["advancedOptions"]["/UserVars/TulkTimeOut"] = 60;
  TulkTest::Options options = ConsoleOptions(host);
  options.timeScale = 30;  // the minute passes in two seconds
  TestConsole console(options);
  ASSERT_TRUE(LogIn(console));
  ASSERT_TRUE(Settled(console, "System Customization"));
  ASSERT_TRUE(console.WaitForLog("User root logged out due to time out"));
  ASSERT_TRUE(console.WaitUntil(
      [&] {
        return console.Contains("To manage this host") && !console.Contains("System Customization");
      },
      "the welcome screen in place of the menu"));
  EXPECT_EQ(CountLog(console, "<14>User root logged out"), 0);
  const auto logouts = RecordsWhere(console, "audit.jsonl", "event", "tulk.logout");
  ASSERT_EQ(logouts.size(), 1u);
  EXPECT_EQ(logouts[0]["attributes"], json({{"reason", "Time out"}}));

  // The welcome screen itself never times out, and takes keys again.
  console.Key("F2");
  ASSERT_TRUE(Settled(console, "Authentication Required"));
}

TEST(SessionScreenTest, KilledConsoleLeavesNoPamFolderBehind) {
  std::string marker;
  {
    TestConsole console(ConsoleOptions());
    ASSERT_TRUE(LogIn(console));
    ASSERT_TRUE(Settled(console, "System Customization"));
    marker = console.Root().parent_path().string() + "/";
    ASSERT_EQ(PamFoldersOf(marker).size(), 1u);
    console.Signal(SIGKILL);
    ASSERT_EQ(console.WaitExit(), 128 + SIGKILL);
    // Killed, pam_wrapper could not remove its folder itself.
    EXPECT_EQ(PamFoldersOf(marker).size(), 1u);
  }
  EXPECT_TRUE(PamFoldersOf(marker).empty());
}

}  // namespace
