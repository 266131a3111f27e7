// Terminal sizes and signals: the console starts and answers keys at every
// size from 1x1 to 300x100, ends cleanly on a resize to any of them, and
// answers each of the nine signals it handles in each place it can be in.

#include <gtest/gtest.h>
#include <signal.h>

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "ReliabilitySupport.h"
#include "ScreenTestSupport.h"

namespace {

using namespace std::chrono_literals;
using TulkTest::TestConsole;

const std::vector<std::pair<int, int>> kSizes = {{1, 1}, {20, 5}, {40, 12}, {80, 24}, {300, 100}};

TEST(Sizes, EverySizeAtStartAnswersKeysAndEndsCleanly) {
  for (const auto& [cols, rows] : kSizes) {
    SCOPED_TRACE(std::to_string(cols) + "x" + std::to_string(rows));
    TulkTest::Options options = Reliability::ConsoleOptions();
    options.cols = cols;
    options.rows = rows;
    TestConsole console(options);
    ASSERT_TRUE(console.WaitReady());
    // The login, a wrong password, its message, and out again.
    for (const char* key : {"F2", "Down", "x", "Enter", "Enter", "Esc", "F12", "Esc"}) {
      if (std::string(key).size() == 1) {
        console.Type(key);
      } else {
        console.Key(key);
      }
      ASSERT_TRUE(console.WaitReady()) << "after " << key;
    }
    console.Signal(SIGTERM);
    EXPECT_EQ(console.WaitExit(), 0);
    EXPECT_TRUE(Reliability::TerminalGivenBack(console, ""));
  }
}

TEST(Sizes, ResizeToEverySizeInADialogEndsCleanly) {
  for (const auto& [cols, rows] : kSizes) {
    SCOPED_TRACE(std::to_string(cols) + "x" + std::to_string(rows));
    TestConsole console(Reliability::ConsoleOptions());
    ASSERT_TRUE(Reliability::LogIn(console));
    ASSERT_TRUE(Reliability::OpenEntry(console, "Configure Password"));
    ASSERT_TRUE(console.WaitReady());
    console.Resize(cols, rows);
    EXPECT_EQ(console.WaitExit(), 0);
    EXPECT_TRUE(Reliability::TerminalGivenBack(console, "System Customization"));
    const std::string line =
        "<14>Resized window to " + std::to_string(cols) + "x" + std::to_string(rows);
    const std::vector<std::string> log = console.LogLines();
    EXPECT_NE(std::find(log.begin(), log.end(), line), log.end()) << line;
  }
}

enum class Place { kWelcome, kLogin, kMenu, kDialog, kPager, kCommand };

const std::map<Place, std::string> kPlaceNames = {
    {Place::kWelcome, "welcome"}, {Place::kLogin, "login"}, {Place::kMenu, "menu"},
    {Place::kDialog, "dialog"},   {Place::kPager, "pager"}, {Place::kCommand, "command"}};

// Brings a fresh console to `place`. In kCommand the console is left inside
// a host tool that hangs until its time limit ends it.
::testing::AssertionResult Reach(TestConsole& console, Place place) {
  switch (place) {
    case Place::kWelcome:
      return TulkTest::Settled(console, Reliability::kWelcomeText);
    case Place::kLogin:
      if (auto welcome = TulkTest::Settled(console, Reliability::kWelcomeText); !welcome) {
        return welcome;
      }
      console.Key("F2");
      return TulkTest::Settled(console, "Authentication Required");
    case Place::kMenu:
      return Reliability::LogIn(console);
    case Place::kDialog:
      if (auto menu = Reliability::LogIn(console); !menu) {
        return menu;
      }
      if (auto opened = Reliability::OpenEntry(console, "Configure Password"); !opened) {
        return opened;
      }
      return TulkTest::Settled(console, "Old Password");
    case Place::kPager:
      if (auto menu = Reliability::LogIn(console); !menu) {
        return menu;
      }
      if (auto opened = TulkTest::SelectEntry(console, "View System Logs"); !opened) {
        return opened;
      }
      console.Type("1");
      return console.WaitForText(Reliability::kLogLine);
    case Place::kCommand: {
      if (auto entered = TulkTest::LogIn(console); !entered) {
        return entered;
      }
      // The menu's first host query hangs: wait until the tool has started.
      return console.WaitUntil(
          [&] {
            for (const nlohmann::json& run :
                 TulkTest::SimRecords(console.Root(), "commands.jsonl")) {
              if (run["argv"].size() > 3 && run["argv"][3] == "get" && run["exitCode"].is_null()) {
                return true;
              }
            }
            return false;
          },
          "the hung host tool started");
    }
  }
  return ::testing::AssertionFailure();
}

// Whether `signal` in `place` ends the console by itself (exit 0), or the
// console goes on.
bool Ends(int signal, Place place) {
  switch (signal) {
    case SIGINT:
    case SIGQUIT:
    case SIGTERM:
    case SIGHUP:
    case SIGPIPE:
      return true;
    case SIGWINCH:  // a resize ends the console (after the pager has ended)
      return true;
    case SIGUSR2:  // ends the console, after the logout when logged in
      return place == Place::kWelcome || place == Place::kLogin;
    default:  // SIGUSR1 reloads, SIGTSTP is dropped
      return false;
  }
}

TEST(Signals, EverySignalInEveryPlace) {
  const std::vector<std::pair<int, std::string>> signals = {
      {SIGINT, "SIGINT"},   {SIGQUIT, "SIGQUIT"},   {SIGTERM, "SIGTERM"},
      {SIGHUP, "SIGHUP"},   {SIGPIPE, "SIGPIPE"},   {SIGUSR1, "SIGUSR1"},
      {SIGUSR2, "SIGUSR2"}, {SIGWINCH, "SIGWINCH"}, {SIGTSTP, "SIGTSTP"}};
  int cases = 0;
  for (const auto& [place, placeName] : kPlaceNames) {
    for (const auto& [signal, signalName] : signals) {
      SCOPED_TRACE(signalName + " in " + placeName);
      nlohmann::json host = TulkTest::DemoHostState();
      if (place == Place::kCommand) {
        host["lockdown"]["enabled"] = true;
        host["commands"]["osk-cmd -U root get"] = {{"delayMs", 3600000}};
      }
      TulkTest::Options options = Reliability::ConsoleOptions(host);
      options.env["TULK_COMMAND_TIME_SCALE"] = "10";
      TestConsole console(options);
      ASSERT_TRUE(Reach(console, place));
      // Straight to the process: in the pager and in a command the console
      // is not waiting for input, and the signal must not wait for it.
      ASSERT_EQ(kill(console.Pid(), signal), 0);
      ++cases;
      if (Ends(signal, place)) {
        if (place == Place::kPager && signal == SIGWINCH) {
          console.SendNow("q");  // a resize waits for the pager to end
        }
        EXPECT_EQ(console.WaitExit(), 0);
        EXPECT_TRUE(Reliability::TerminalGivenBack(console, Reliability::kLogLine));
        continue;
      }
      // It goes on: it answers again (after the pager is quit), and ends
      // cleanly on SIGTERM.
      if (place == Place::kPager) {
        console.SendNow("q");
      }
      EXPECT_TRUE(TulkTest::Settled(console, place == Place::kWelcome || place == Place::kLogin
                                                 ? Reliability::kWelcomeText
                                                 : "System Customization"));
      console.Signal(SIGTERM);
      EXPECT_EQ(console.WaitExit(), 0);
      EXPECT_TRUE(Reliability::TerminalGivenBack(console, "System Customization"));
    }
  }
  Reliability::Figure("signal cases", std::to_string(cases));
}

}  // namespace
