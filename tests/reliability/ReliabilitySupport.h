#pragma once
// Helpers of the reliability suite: a console with the demo users and the
// console-login marker, logging in and opening a menu entry, the figures a
// run reports, and what "the terminal was given back" means.
//
// Runs are repeatable: TULK_RELIABILITY_SEED fixes the random seed (the
// seed used is printed with the figures), TULK_RELIABILITY_SCALE multiplies
// the amount of work (scripts/reliability.sh runs longer soaks with it).

#include <gtest/gtest.h>
#include <sys/types.h>

#include <cstdint>
#include <random>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "ScreenTestSupport.h"
#include "TestConsole.h"

namespace Reliability {

/// The welcome screen's footer: shown only on the welcome screen.
inline constexpr char kWelcomeText[] = "Customize System/View Logs";

/// Options of the real console on `host` (with the demo users and the
/// login marker) whose root also holds a one-line "/var/log/syslog.log".
TulkTest::Options ConsoleOptions(const nlohmann::json& host = TulkTest::DemoHostState());

/// Logs in as root from the settled welcome screen; succeeds once the
/// System Customization menu has settled.
::testing::AssertionResult LogIn(TulkTest::TestConsole& console);

/// Selects the full-screen menu's entry `title` and presses Enter (without
/// waiting for what it opens).
::testing::AssertionResult OpenEntry(TulkTest::TestConsole& console, const std::string& title);

/// The menu's entry titles, top to bottom, read by walking the settled
/// menu; the selection is back on the first entry afterwards.
std::vector<std::string> EntryTitles(TulkTest::TestConsole& console);

/// The line of the root's "/var/log/syslog.log".
inline constexpr char kLogLine[] = "a line of the host log";

/// Resident memory of a process in KiB (0 when it cannot be read).
long ResidentKiB(pid_t pid);

/// Checks that an ended console gave the terminal back: cursor shown, line
/// editing, echo and flow control on again, the alternate screen left (the
/// screen no longer shows `shownText`).
::testing::AssertionResult TerminalGivenBack(const TulkTest::TestConsole& console,
                                             const std::string& shownText);

/// The seed of this run (TULK_RELIABILITY_SEED, else from the clock).
std::uint32_t Seed();
/// The work multiplier (TULK_RELIABILITY_SCALE, at least 1).
int Scale();

/// Random key input: raw bytes and whole key sequences of the terminal's
/// key table, mixed. Bytes that the terminal turns into signals (Ctrl-C,
/// Ctrl-\, Ctrl-Z) are left out: the signal tests cover those.
class KeyStream {
 public:
  explicit KeyStream(std::uint32_t seed) : engine_(seed) {}
  /// The next burst of 1 to `most` keys.
  std::string Burst(int most);

 private:
  std::mt19937 engine_;
};

/// Prints one figure line "[ figures ] name: value" (kept in the test log
/// and in the test's XML properties).
void Figure(const std::string& name, const std::string& value);

}  // namespace Reliability
