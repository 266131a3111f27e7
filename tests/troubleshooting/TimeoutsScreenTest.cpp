// The timeout dialogs: what the fields take, what reaches the host's
// options, which services restart, the log lines and the limit messages;
// and a new console timeout ending the session it was set in.

#include <gtest/gtest.h>

#include <algorithm>
#include <utility>

#include "ScreenTestSupport.h"
#include "TroubleshootingTestSupport.h"

namespace {

using namespace TulkTest;

constexpr char kSet[] = "tavcli system settings advanced set -o /UserVars/";
constexpr char kLimit[] = "Timeout value must be between 0 (disabled)";

// The demo host with the shell running or not and the options availability,
// idle and console in seconds (-1: left out, so unreadable).
Json HostWithTimeouts(int availability, int idle, int console, bool shellRunning = false) {
  Json host = HostWithServices(shellRunning, false);
  host["advancedOptions"] = Json::object();
  const std::pair<const char*, int> options[] = {{"/UserVars/TaviShellTimeOut", availability},
                                                 {"/UserVars/TaviShellInteractiveTimeOut", idle},
                                                 {"/UserVars/TulkTimeOut", console}};
  for (const auto& [option, seconds] : options) {
    if (seconds >= 0) {
      host["advancedOptions"][option] = seconds;
    }
  }
  return host;
}

// Types `fields` into the fields in turn ("<BS>" empties one), presses
// Enter, closes the limit messages and returns how many there were, once
// the dialog titled `title` has closed.
int Submit(TestConsole& console, const std::vector<std::string>& fields, const char* title) {
  for (std::size_t i = 0; i < fields.size(); ++i) {
    console.Key("Down", i > 0 ? 1 : 0);
    if (fields[i] == "<BS>") {
      console.Key("Backspace");
    } else {
      console.Type(fields[i]);
    }
  }
  console.Key("Enter");
  int messages = 0;
  const auto next = [&] { return console.Contains(kLimit) || !console.Contains(title); };
  while (console.WaitUntil(next, "a message or the closed dialog") && console.Contains(kLimit)) {
    ++messages;
    console.Key("Enter");
    Gone(console, kLimit);
  }
  Gone(console, title);
  return messages;
}

// What the cases of one console did so far: the options written, the log
// lines holding `logged` and the shell's restarts.
struct Seen {
  Lines writes;
  Lines logged;
  std::size_t shellRestarts = 0;
};

Seen SeenSoFar(const TestConsole& console, const std::string& logged) {
  Seen seen;
  for (const std::string& run : CommandLines(console, kSet)) {
    seen.writes.push_back(run.substr(sizeof kSet - 1));
  }
  seen.logged = LogLinesWith(console, logged);
  seen.shellRestarts = CommandLines(console, "TavShell restart").size();
  return seen;
}

// The lines of `now` after the first `before` ones.
Lines Since(const Lines& before, const Lines& now) {
  return Lines(now.begin() + static_cast<std::ptrdiff_t>(std::min(before.size(), now.size())),
               now.end());
}

TEST(TimeoutsScreenTest, ShellTimeoutsReachTheHost) {
  const struct {
    Json host;
    std::vector<std::string> typed;
    int messages;
    Lines writes;
    Lines logged;
    std::size_t shellRestarts;
  } cases[] = {
      {HostWithTimeouts(1800, 0, 600, true),
       {"0"},
       0,
       {"TaviShellTimeOut -i 0"},
       {"Disabled Shell timeout"},
       1},
      {HostWithTimeouts(0, 0, 600, true),
       {"", "15"},
       0,
       {"TaviShellInteractiveTimeOut -i 900"},
       {"Modified shell interactive timeout to 15 minutes"},
       0},
      {HostWithTimeouts(0, 600, 600),
       {"1440", "1441"},
       1,
       {"TaviShellTimeOut -i 86400"},
       {"Modified Shell timeout to 1440 minutes"},
       0},
      {HostWithTimeouts(0, 0, 600), {"1441", "99999"}, 2, {}, {}, 0},
      {HostWithTimeouts(600, 600, 600), {"<BS>", "<BS>"}, 0, {}, {}, 0},
      // Minutes compared with the minutes shown: 90 s is left alone.
      {HostWithTimeouts(90, 60, 600, true), {}, 0, {}, {}, 0},
      // No sixth digit, no letters; the unreadable idle option shows 0.
      {HostWithTimeouts(0, -1, 600),
       {"0000a11", "x"},
       0,
       {"TaviShellTimeOut -i 60"},
       {"Modified Shell timeout to 1 minutes"},
       0},
  };
  // One console: each case replaces the host and opens the dialog again.
  TestConsole console(DriverOptions(cases[0].host, "shell-timeouts"));
  bool first = true;
  for (const auto& c : cases) {
    SCOPED_TRACE(c.host["advancedOptions"].dump());
    if (!std::exchange(first, false)) {
      ReplaceHostState(console, c.host);
      console.Type("o");
    }
    const Seen before = SeenSoFar(console, "timeout");
    ASSERT_TRUE(Settled(console, "Availability timeout"));
    EXPECT_EQ(Submit(console, c.typed, "Availability timeout"), c.messages);
    ASSERT_TRUE(console.WaitForText("result: 1"));
    const Seen after = SeenSoFar(console, "timeout");
    EXPECT_EQ(Since(before.writes, after.writes), c.writes);
    EXPECT_EQ(Since(before.logged, after.logged), c.logged);
    EXPECT_EQ(after.shellRestarts - before.shellRestarts, c.shellRestarts);
  }
  EXPECT_EQ(CommandLines(console, "SSH restart"), Lines{});
}

TEST(TimeoutsScreenTest, ConsoleTimeoutComparesStoredSeconds) {
  const struct {
    int stored;
    const char* typed;
    const char* shown;
    int messages;
    Lines writes;
    Lines logged;
  } cases[] = {
      {-1, "", "[ 10    ]", 0, {}, {}},
      {90, "", "[ 1     ]", 0, {"TulkTimeOut -i 60"}, {"Modified Tulk timeout to 1 minutes"}},
      {600, "0", "[ 10    ]", 0, {"TulkTimeOut -i 0"}, {"Disabled Tulk timeout"}},
      {600, "1441", "[ 10    ]", 1, {}, {}},
      {600, "<BS>", "[ 10    ]", 0, {}, {}},
  };
  // One console: each case replaces the host and opens the dialog again.
  TestConsole console(DriverOptions(HostWithTimeouts(0, 0, cases[0].stored), "tulk-timeout"));
  bool first = true;
  for (const auto& c : cases) {
    SCOPED_TRACE(c.stored);
    if (!std::exchange(first, false)) {
      ReplaceHostState(console, HostWithTimeouts(0, 0, c.stored));
      console.Type("o");
    }
    const Seen before = SeenSoFar(console, "Tulk timeout");
    ASSERT_TRUE(Settled(console, "TULK idle timeout"));
    EXPECT_TRUE(console.Contains(c.shown)) << console.Dump();
    EXPECT_EQ(Submit(console, {c.typed}, "TULK idle timeout"), c.messages);
    ASSERT_TRUE(console.WaitForText("result: 1"));
    const Seen after = SeenSoFar(console, "Tulk timeout");
    EXPECT_EQ(Since(before.writes, after.writes), c.writes);
    EXPECT_EQ(Since(before.logged, after.logged), c.logged);
  }
}

// Through the real console and its menus. The old timeout is a day; the
// new minute ends the session without a new login.
TEST(TimeoutsScreenTest, NewConsoleTimeoutEndsTheSessionItWasSetIn) {
  TulkTest::Options options = ConsoleOptions(HostWithTimeouts(0, 0, 86400));
  options.timeScale = 30;  // a console minute takes two seconds
  TestConsole console(options);
  ASSERT_TRUE(LogIn(console));
  ASSERT_TRUE(Settled(console, "System Customization"));
  ASSERT_TRUE(SelectEntry(console, "Troubleshooting Options"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Troubleshooting Mode Options"));
  ASSERT_TRUE(SelectEntry(console, "Modify TULK idle timeout"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "[ 1440  ]"));
  console.Type("1");
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForLog("Modified Tulk timeout to 1 minutes"));
  EXPECT_TRUE(console.WaitForLog("User root logged out due to time out", std::chrono::seconds(30)));
}

}  // namespace
