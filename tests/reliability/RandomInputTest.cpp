// Random keys on every screen of the console: raw bytes and whole key
// sequences, in bursts, on the welcome screen, in the login dialog and in
// every menu entry's screens after login. Every burst must be answered (the
// console reports ready again), no console may end other than by a
// documented way (exit 0 with the terminal given back: a power-off of the
// simulated host ends it, for one), and its memory must stay flat.
//
// The log pager is a program of its own in front of the console: when a
// burst left it running, it is quit ("q", Ctrl-C) as an operator would,
// and the console must answer again.

#include <gtest/gtest.h>
#include <signal.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "KeyNames.h"
#include "ProcessHygiene.h"
#include "ReliabilitySupport.h"
#include "ScreenTestSupport.h"

namespace {

using namespace std::chrono_literals;
using Reliability::Figure;
using TulkTest::TestConsole;

#if defined(TULK_TEST_SANITIZED)
constexpr bool kSanitized = true;
#else
constexpr bool kSanitized = false;
#endif

// Random key bytes sent in all, spread evenly over the places.
constexpr long kKeyBytes = 100000;
// The longest burst, in keys.
constexpr int kBurstKeys = 24;
// How soon a burst must be answered. A burst may start real work (a
// network apply, a factory reset, a test with pings), so this bounds work
// and not only drawing; the sanitizer build runs every tool several times
// slower.
constexpr auto kAnswer = kSanitized ? 10s : 2s;
// How much a console's resident memory may grow from its first minute of
// keys to its last. Sanitizer builds keep freed memory in quarantine and
// are not measured.
constexpr long kGrowthKiB = 2048;

// The id of a process named "less" in the console's session, or 0.
pid_t PagerOf(pid_t console) {
  for (pid_t pid : TulkTest::SessionMembers(console)) {
    if (TulkTest::ProcFile(pid, "comm") == "less\n") {
      return pid;
    }
  }
  return 0;
}

struct Figures {
  long bytes = 0;
  long bursts = 0;
  long pagerVisits = 0;
  long documentedEnds = 0;
  long logins = 0;
  std::chrono::nanoseconds slowest{0};
  long rssStart = 0;
  long rssEnd = 0;
  long worstGrowth = 0;
};

class RandomInput {
 public:
  RandomInput(std::string place, Figures& figures) : place_(std::move(place)), figures_(figures) {}

  // Starts a fresh console and brings it to the place.
  ::testing::AssertionResult Arrive() {
    console_ = std::make_unique<TestConsole>(Reliability::ConsoleOptions());
    if (place_ == "welcome") {
      return TulkTest::Settled(*console_, Reliability::kWelcomeText);
    }
    if (place_ == "login") {
      if (auto welcome = TulkTest::Settled(*console_, Reliability::kWelcomeText); !welcome) {
        return welcome;
      }
      console_->Key("F2");
      return TulkTest::Settled(*console_, "Authentication Required");
    }
    ++figures_.logins;
    if (auto menu = Reliability::LogIn(*console_); !menu) {
      return menu;
    }
    if (auto opened = Reliability::OpenEntry(*console_, place_); !opened) {
      return opened;
    }
    return console_->WaitReady(kAnswer);
  }

  // Sends `budget` bytes of random keys. A console that has left for the
  // welcome screen (logged out, or a power-off it survived) is ended and a
  // fresh one brought to the place: random keys may have changed the
  // password or the lockdown mode that the next login depends on.
  void Run(long budget, Reliability::KeyStream& keys) {
    ASSERT_TRUE(Arrive());
    long sent = 0;
    long sinceCheck = 0;
    while (sent < budget) {
      const std::string burst = keys.Burst(kBurstKeys);
      console_->Send(burst);
      const auto start = std::chrono::steady_clock::now();
      sent += static_cast<long>(burst.size());
      ++figures_.bursts;
      ASSERT_NO_FATAL_FAILURE(Answered(start, burst));
      if (rssStart_ == 0 && ++burstsSinceStart_ > 200 && console_->Running()) {
        rssStart_ = Reliability::ResidentKiB(console_->Pid());
      }
      if (++sinceCheck >= 100) {
        sinceCheck = 0;
        if (place_ != "welcome" && console_->Contains(Reliability::kWelcomeText)) {
          ASSERT_NO_FATAL_FAILURE(End());
          ASSERT_TRUE(Arrive());
        }
      }
    }
    figures_.bytes += sent;
    End();
  }

 private:
  // Waits for the console's answer to `burst`; quits a pager the burst left
  // running; restarts a console that ended in a documented way.
  void Answered(std::chrono::steady_clock::time_point start, const std::string& burst) {
    for (int attempt = 0; attempt < 20; ++attempt) {
      if (console_->WaitReady(kAnswer)) {
        if (attempt == 0) {  // not the time a pager stood in front of it
          figures_.slowest = std::max(figures_.slowest, console_->ReadyAt() - start);
        }
        return;
      }
      if (!console_->Running()) {
        const std::optional<int> status = console_->WaitExit();
        ASSERT_EQ(status, 0) << "the console ended after the keys " << TulkTest::VisibleBytes(burst)
                             << "\n"
                             << console_->Dump();
        ASSERT_TRUE(Reliability::TerminalGivenBack(*console_, ""));
        ++figures_.documentedEnds;
        ASSERT_NO_FATAL_FAILURE(End());
        ASSERT_TRUE(Arrive());
        return;
      }
      if (PagerOf(console_->Pid()) != 0) {
        // "q" quits the pager at its prompt; Ctrl-C first leaves whatever
        // the keys started (a search, following the file). The pager drops
        // what was typed ahead of an interrupt: the two go separately.
        figures_.pagerVisits += attempt == 0 ? 1 : 0;
        console_->SendNow(attempt % 2 == 0 ? "q" : "\x03");
        continue;
      }
      FAIL() << "no answer within " << std::chrono::duration<double>(kAnswer).count()
             << " s to the keys " << TulkTest::VisibleBytes(burst) << "\n"
             << console_->Dump();
    }
    FAIL() << "the pager could not be left\n" << console_->Dump();
  }

  // Notes the memory figures of the console and ends it with SIGTERM.
  void End() {
    if (rssStart_ != 0 && console_->Running()) {
      const long end = Reliability::ResidentKiB(console_->Pid());
      figures_.rssStart = std::max(figures_.rssStart, rssStart_);
      figures_.rssEnd = std::max(figures_.rssEnd, end);
      figures_.worstGrowth = std::max(figures_.worstGrowth, end - rssStart_);
      if (!kSanitized) {
        EXPECT_LE(end - rssStart_, kGrowthKiB) << "resident memory grew in " << place_;
      }
    }
    rssStart_ = 0;
    burstsSinceStart_ = 0;
    if (console_->Running()) {
      console_->Signal(SIGTERM);
      EXPECT_EQ(console_->WaitExit(), 0) << "in " << place_;
      EXPECT_TRUE(Reliability::TerminalGivenBack(*console_, ""));
    }
    console_.reset();
  }

  std::string place_;
  Figures& figures_;
  std::unique_ptr<TestConsole> console_;
  long rssStart_ = 0;
  long burstsSinceStart_ = 0;
};

TEST(RandomInput, EveryScreenAnswersEveryKeyAndKeepsItsMemory) {
  std::vector<std::string> places = {"welcome", "login"};
  {
    TestConsole console(Reliability::ConsoleOptions());
    ASSERT_TRUE(Reliability::LogIn(console));
    for (const std::string& title : Reliability::EntryTitles(console)) {
      places.push_back(title);
    }
  }
  ASSERT_GT(places.size(), 8U) << "the menu's entries were not found";

  Reliability::KeyStream keys(Reliability::Seed());
  Figures figures;
  const long perPlace = kKeyBytes * Reliability::Scale() / static_cast<long>(places.size());
  for (const std::string& place : places) {
    SCOPED_TRACE("place: " + place);
    RandomInput run(place, figures);
    run.Run(perPlace, keys);
    if (HasFatalFailure()) {
      break;
    }
  }

  Figure("seed", std::to_string(Reliability::Seed()));
  Figure("places", std::to_string(places.size()));
  Figure("key bytes sent", std::to_string(figures.bytes));
  Figure("bursts", std::to_string(figures.bursts));
  Figure("logins", std::to_string(figures.logins));
  Figure("pager visits", std::to_string(figures.pagerVisits));
  Figure("documented ends (exit 0, terminal given back)", std::to_string(figures.documentedEnds));
  Figure("slowest answer ms",
         std::to_string(
             std::chrono::duration_cast<std::chrono::milliseconds>(figures.slowest).count()));
  Figure("largest RSS after warm-up KiB", std::to_string(figures.rssStart));
  Figure("largest RSS at end KiB", std::to_string(figures.rssEnd));
  Figure("worst RSS growth KiB", std::to_string(figures.worstGrowth));
}

}  // namespace
