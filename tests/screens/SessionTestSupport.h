#pragma once
// Helpers of the session screens' tests: a console with PAM users and the
// console-login marker, logging in, and waiting on the simulated host's
// record files.
//
// Logins go through the real PAM library wrapped by pam_wrapper (the
// harness's PAM set-up): pam_matrix with a password file in the test folder,
// and the test policy module (tests/pam) before it.

#include <chrono>
#include <filesystem>
#include <functional>
#include <map>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "ScreenTestSupport.h"
#include "TestConsole.h"

namespace SessionTest {

/// The demo users of the test PAM service.
inline constexpr char kRootPassword[] = "tulk";

/// The PAM set-up of a test root.
struct PamSetup {
  /// Users and their passwords.
  std::map<std::string, std::string> users = {{"root", kRootPassword}, {"operator", "operator"}};
  /// Lines "user:outcome" for the policy module: "expired", "denied",
  /// "chauthtok-fails".
  std::vector<std::string> policy;
};

/// Options for `host` with the PAM set-up `pam` and the console-login
/// marker in the root. `prepare`, when given, runs afterwards.
TulkTest::Options ConsoleOptions(
    const nlohmann::json& host = TulkTest::DemoHostState(), const PamSetup& pam = {},
    std::function<void(const std::filesystem::path&)> prepare = nullptr);

/// The pam_matrix password file of the console's root ("user:password:
/// service" lines; a password changed through PAM lands here).
std::filesystem::path PasswordFile(const TulkTest::TestConsole& console);

/// Waits for the settled welcome screen, opens the login with `key` ("F2"
/// or "F12"), enters `user` (replacing the
/// pre-filled "root" unless it is root) and `password`, and presses Enter.
::testing::AssertionResult LogIn(TulkTest::TestConsole& console, const std::string& user = "root",
                                 const std::string& password = kRootPassword,
                                 const std::string& key = "F2");

/// Waits for text to appear or disappear and the screen to settle
/// (ScreenTestSupport.h).
using TulkTest::Gone;
using TulkTest::Settled;

/// Waits until a condition holds (ScreenTestSupport.h).
using TulkTest::WaitUntil;

/// The records of `file` (audit.jsonl, events.jsonl, commands.jsonl) whose
/// `key` equals `value`.
std::vector<nlohmann::json> RecordsWhere(const TulkTest::TestConsole& console,
                                         const std::string& file, const std::string& key,
                                         const std::string& value);

/// The commands the simulated tools ran, each argv joined by blanks.
std::vector<std::string> CommandLines(const TulkTest::TestConsole& console);

/// How many system-log lines equal `line` ("<14>User root logged in").
int CountLog(const TulkTest::TestConsole& console, const std::string& line);

/// The text of `count` cells from `row`, `column` (box characters count as
/// one cell).
std::string Cells(const TulkTest::TestConsole& console, int row, int column, int count);

/// Waits until the console has handled the keys sent, then checks that the
/// cursor stands on the row of the field labelled `label`.
::testing::AssertionResult CursorOn(TulkTest::TestConsole& console, const std::string& label);

/// The first screen row (of `rows`) holding `text`, or -1.
int RowOf(const TulkTest::TestConsole& console, const std::string& text, int rows = 25);

}  // namespace SessionTest
