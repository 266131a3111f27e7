// A host tool that hangs: the console gives up on it at its time limit,
// takes the failure path, and answers keys and signals again.

#include <gtest/gtest.h>
#include <signal.h>

#include <string>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using namespace std::chrono_literals;

constexpr int kDarkGrey = 6;

TEST(CommandLimitScreenTest, HungManagementQueriesAreKilledAndTheMenuStillOpens) {
  nlohmann::json host = DemoHostState();
  host["lockdown"]["enabled"] = true;
  // Every "get" of the management-API tool sleeps for an hour.
  host["commands"]["osk-cmd -U root get"] = {{"delayMs", 3600000}};
  TulkTest::Options options = DriverOptions(host);
  options.env["TULK_COMMAND_TIME_SCALE"] = "10";
  TestConsole console(options);

  ASSERT_TRUE(console.WaitForText("System Customization", 30s));
  ASSERT_TRUE(console.WaitForText("Configure Lockdown Mode"));
  // The failure path of the queries: lockdown neither on nor possible.
  EXPECT_TRUE(console.WaitUntil(
      [&] { return console.At(MenuRow(console, "Configure Lockdown Mode"), 3).fg == kDarkGrey; },
      "the lockdown entry greyed"));
  EXPECT_TRUE(console.WaitForLog("<12>Killing process because 10 seconds timeout expired"));
  // Each hung run left only the line it writes before it waits: none of
  // them finished (they were killed, not waited out).
  int started = 0;
  for (const nlohmann::json& run : SimRecords(console.Root(), "commands.jsonl")) {
    if (run["argv"].size() > 3 && run["argv"][3] == "get") {
      ++started;
      EXPECT_TRUE(run["exitCode"].is_null()) << run.dump();
    }
  }
  EXPECT_GE(started, 1);

  console.Key("Down");
  EXPECT_TRUE(
      console.WaitUntil([&] { return RightTitle(console) == "Configure Management Network"; },
                        "the menu answering a key"));
  console.Signal(SIGTERM);
  EXPECT_EQ(console.WaitExit(), 0);
}

}  // namespace
