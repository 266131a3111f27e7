// The two timeout dialogs: what the fields take, what reaches the host's
// advanced options, which services restart, the log lines and the limit
// messages; and a changed console timeout ending the session it was set in.

#include <gtest/gtest.h>

#include "SessionTestSupport.h"
#include "TroubleshootingTestSupport.h"

namespace {

using namespace TroubleshootingTest;
using namespace std::chrono_literals;

constexpr char kSetOption[] = "tavcli system settings advanced set -o ";
constexpr char kLimitText[] = "Timeout value must be between 0 (disabled)";

struct Options {
  std::int64_t availability;
  std::int64_t idle;
  std::int64_t tulk;
};

Json HostWithTimeouts(const Options& seconds, bool shellRunning = false, bool sshRunning = false) {
  Json host = HostWithServices(shellRunning, sshRunning);
  host["advancedOptions"] = {{"/UserVars/TaviShellTimeOut", seconds.availability},
                             {"/UserVars/TaviShellInteractiveTimeOut", seconds.idle},
                             {"/UserVars/TulkTimeOut", seconds.tulk}};
  return host;
}

// What the operator does in a dialog: keys typed into each field, in order
// (an empty text leaves a field untouched, "<BS>" empties it).
void Fill(TestConsole& console, const std::vector<std::string>& fields) {
  for (std::size_t i = 0; i < fields.size(); ++i) {
    if (i > 0) {
      console.Key("Down");
    }
    if (fields[i] == "<BS>") {
      console.Key("Backspace");
    } else {
      console.Type(fields[i]);
    }
  }
  console.WaitQuiet();
}

// Closes the limit messages one by one; returns how many were shown.
int CloseLimitMessages(TestConsole& console) {
  int shown = 0;
  while (!console.Contains("result: ")) {
    if (!WaitUntil(
            console, [&] { return console.Contains(kLimitText) || console.Contains("result: "); },
            "a message or the result")) {
      break;
    }
    if (console.Contains(kLimitText)) {
      EXPECT_TRUE(console.Contains("Invalid timeout value"));
      ++shown;
      console.Key("Enter");
      Gone(console, kLimitText);
    }
  }
  return shown;
}

TEST(TimeoutsScreenTest, ShellTimeoutsReachTheHost) {
  struct Case {
    const char* name;
    Options stored;
    bool shellRunning;
    std::vector<std::string> typed;
    int messages;
    Lines writes;
    Lines logged;
    int shellRestarts;
  };
  const Case cases[] = {
      {"availability off restarts the running shell",
       {1800, 0, 600},
       true,
       {"0"},
       0,
       {"/UserVars/TaviShellTimeOut -i 0"},
       {"Disabled Shell timeout"},
       1},
      {"idle changed restarts nothing",
       {0, 0, 600},
       true,
       {"", "15"},
       0,
       {"/UserVars/TaviShellInteractiveTimeOut -i 900"},
       {"Modified shell interactive timeout to 15 minutes"},
       0},
      {"1440 accepted, 1441 refused",
       {0, 600, 600},
       false,
       {"1440", "1441"},
       1,
       {"/UserVars/TaviShellTimeOut -i 86400"},
       {"Modified Shell timeout to 1440 minutes"},
       0},
      {"two refusals in turn", {0, 0, 600}, false, {"1441", "99999"}, 2, {}, {}, 0},
      {"empty fields change nothing", {600, 600, 600}, false, {"<BS>", "<BS>"}, 0, {}, {}, 0},
      {"unchanged minutes are not rewritten", {90, 60, 600}, true, {}, 0, {}, {}, 0},
      {"a sixth digit and letters are not taken",
       {0, 0, 600},
       false,
       {"0000a11", "x"},
       0,
       {"/UserVars/TaviShellTimeOut -i 60"},
       {"Modified Shell timeout to 1 minutes"},
       0},
      {"idle off",
       {0, 120, 600},
       false,
       {"", "0"},
       0,
       {"/UserVars/TaviShellInteractiveTimeOut -i 0"},
       {"Disabled shell interactive timeout"},
       0},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    TestConsole console(
        DriverOptions(HostWithTimeouts(c.stored, c.shellRunning), "shell-timeouts"));
    ASSERT_TRUE(Settled(console, "Availability timeout"));
    EXPECT_TRUE(console.Contains("Set the timeouts for Tavi Shell access (local and remote)"));
    Fill(console, c.typed);
    console.Key("Enter");
    EXPECT_EQ(CloseLimitMessages(console), c.messages);
    ASSERT_TRUE(console.WaitForText("result: 1"));

    Lines writes;
    for (const std::string& run : ToolRunsStarting(console, kSetOption)) {
      writes.push_back(run.substr(sizeof kSetOption - 1));
    }
    EXPECT_EQ(writes, c.writes);
    EXPECT_EQ(LogLinesWith(console, "timeout"), c.logged);
    const Json services = HostState(console)["services"];
    EXPECT_EQ(services["TavShell"].value("restarts", 0), c.shellRestarts);
    EXPECT_EQ(services["SSH"].value("restarts", 0), 0);
    EXPECT_EQ(Lines(ToolRunsStarting(console, "SSH restart")), Lines{});
  }
}

TEST(TimeoutsScreenTest, ConsoleTimeoutComparesStoredSeconds) {
  struct Case {
    const char* name;
    Json host;
    std::string typed;
    const char* shown;
    int messages;
    Lines writes;
    Lines logged;
  };
  Json unreadable = HostWithTimeouts({0, 0, 0});
  unreadable["advancedOptions"].erase("/UserVars/TulkTimeOut");
  const Case cases[] = {
      {"unreadable shows 10 and keeps it", unreadable, "", "[ 10    ]", 0, {}, {}},
      {"90 s is rewritten as one minute",
       HostWithTimeouts({0, 0, 90}),
       "",
       "[ 1     ]",
       0,
       {"/UserVars/TulkTimeOut -i 60"},
       {"Modified Tulk timeout to 1 minutes"}},
      {"off",
       HostWithTimeouts({0, 0, 600}),
       "0",
       "[ 10    ]",
       0,
       {"/UserVars/TulkTimeOut -i 0"},
       {"Disabled Tulk timeout"}},
      {"1441 refused", HostWithTimeouts({0, 0, 600}), "1441", "[ 10    ]", 1, {}, {}},
      {"empty", HostWithTimeouts({0, 0, 600}), "<BS>", "[ 10    ]", 0, {}, {}},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    TestConsole console(DriverOptions(c.host, "tulk-timeout"));
    ASSERT_TRUE(Settled(console, "TULK idle timeout"));
    EXPECT_TRUE(console.Contains("Set idle timeout for TULK access"));
    EXPECT_TRUE(console.Contains(c.shown)) << console.Dump();
    Fill(console, {c.typed});
    console.Key("Enter");
    EXPECT_EQ(CloseLimitMessages(console), c.messages);
    ASSERT_TRUE(console.WaitForText("result: 1"));
    Lines writes;
    for (const std::string& run : ToolRunsStarting(console, kSetOption)) {
      writes.push_back(run.substr(sizeof kSetOption - 1));
    }
    EXPECT_EQ(writes, c.writes);
    EXPECT_EQ(LogLinesWith(console, "Tulk timeout"), c.logged);
  }
}

TEST(TimeoutsScreenTest, EscChangesNothing) {
  for (const char* scene : {"shell-timeouts", "tulk-timeout"}) {
    SCOPED_TRACE(scene);
    TestConsole console(DriverOptions(HostWithTimeouts({60, 60, 600}), scene));
    ASSERT_TRUE(Settled(console, "<Esc> Cancel"));
    console.Type("5");
    console.Key("Esc");
    ASSERT_TRUE(console.WaitForText("result: 0"));
    EXPECT_EQ(ToolRunsStarting(console, kSetOption), Lines{});
  }
}

// Through the real console: log in, open the troubleshooting menu from the
// System Customization menu, set the console timeout to one minute. The old
// timeout is a day; the new one ends the session without a new login.
TEST(TimeoutsScreenTest, NewConsoleTimeoutEndsTheSessionItWasSetIn) {
  TulkTest::Options options = SessionTest::ConsoleOptions(HostWithTimeouts({0, 0, 86400}));
  options.timeScale = 30;  // one console minute is two seconds
  TestConsole console(options);
  ASSERT_TRUE(SessionTest::LogIn(console));
  ASSERT_TRUE(Settled(console, "System Customization"));
  ASSERT_TRUE(SelectTitle(console, "Troubleshooting Options", 15));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Troubleshooting Mode Options"));
  ASSERT_TRUE(SelectTitle(console, "Modify TULK idle timeout"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "TULK idle timeout"));
  EXPECT_TRUE(console.Contains("[ 1440  ]"));
  console.Type("1");
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForLog("Modified Tulk timeout to 1 minutes"));
  EXPECT_EQ(HostState(console)["advancedOptions"]["/UserVars/TulkTimeOut"], 60);
  EXPECT_TRUE(console.WaitForLog("User root logged out due to time out", 30s));
  EXPECT_TRUE(console.WaitForText("Customize System/View Logs"));
}

}  // namespace
