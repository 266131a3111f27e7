#pragma once
/// What the console benchmark's scenarios share: the console set up as the
/// demo runs it, waiting for it to settle, reading its screen, and the way
/// into the login dialog and the menu.

#include <chrono>
#include <map>
#include <string>

#include "ScreenCost.h"
#include "TestConsole.h"

namespace TulkBench {

using BenchClock = std::chrono::steady_clock;

/// The demo host with console login allowed. Logins go through the demo's
/// own PAM set-up (scripts/pam-env.sh: pam_wrapper and pam_matrix, users
/// "root"/"tulk" and "operator"/"operator"), prepared in `pamFolder`.
/// `program` names the console binary (empty: this build's).
TulkTest::Options DemoOptions(const std::string& term, const std::string& pamFolder,
                              const std::string& program, double timeScale = 0);

/// Pumps output until nothing arrives for `quiet`; returns the time of the
/// last byte. For a change the console makes of its own (dimming), when no
/// input was sent that a readiness record could answer.
BenchClock::time_point SettleQuiet(TulkTest::TestConsole& console, std::chrono::milliseconds quiet);

/// Waits until the console has handled the input sent and waits for a key
/// (its readiness signal); returns the time it said so. Falls back to
/// SettleQuiet() when the console ended or gave no signal.
BenchClock::time_point Settle(TulkTest::TestConsole& console, std::chrono::milliseconds quiet);

/// The terminal's picture now.
Screen Capture(const TulkTest::TestConsole& console, int rows, int cols);

/// Waits (at most `timeout`) until the screen differs from `from`, then for
/// it to settle. Returns false when it did not change.
bool WaitForChange(TulkTest::TestConsole& console, const Screen& from,
                   std::chrono::milliseconds timeout);

/// From the welcome screen to the login dialog; false when one of them did
/// not show.
bool OpenLogin(TulkTest::TestConsole& console);

/// Logs in as root from the welcome screen; false when the menu did not
/// show.
bool LogIn(TulkTest::TestConsole& console);

/// Sends a key by name ("Down") or, for one character, as typed.
void Press(TulkTest::TestConsole& console, const std::string& key);

}  // namespace TulkBench
