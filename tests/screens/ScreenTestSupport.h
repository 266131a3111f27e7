#pragma once
/// Helpers shared by every screen test (tests/screens, network, restore,
/// troubleshooting): consoles on a chosen host (the real console with PAM
/// users, or the screen driver opening one screen directly), the common
/// steps (log in, select a menu entry, replace the host state and read it
/// back) and what the console left on the screen, in the log and in the
/// simulated host's record files.
///
/// Logins go through the real PAM library wrapped by pam_wrapper (the
/// harness's PAM set-up): pam_matrix with a password file in the test
/// folder, and the test policy module (tests/pam) before it.
///
///   nlohmann::json host = TulkTest::DemoHostState();
///   host["hardware"]["vendor"] = "Acme";
///   TulkTest::TestConsole console(TulkTest::ConsoleOptions(host));
///   ASSERT_TRUE(TulkTest::LogIn(console));

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <functional>
#include <map>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "TestConsole.h"

namespace TulkTest {

using Json = nlohmann::json;

/// The built-in demo host's state (the simulated host's default).
Json DemoHostState();

// ---- consoles -------------------------------------------------------------

/// The root password of the test PAM service.
inline constexpr char kRootPassword[] = "tulk";

/// The PAM set-up of a test root.
struct PamSetup {
  /// Users and their passwords.
  std::map<std::string, std::string> users = {{"root", kRootPassword}, {"operator", "operator"}};
  /// Lines "user:outcome" for the policy module: "expired", "denied",
  /// "chauthtok-fails".
  std::vector<std::string> policy;
};

/// Options of the real console on `host` with the PAM set-up `pam` and the
/// console-login marker in the root. `prepare`, when given, runs afterwards.
Options ConsoleOptions(const Json& host = DemoHostState(), const PamSetup& pam = {},
                       std::function<void(const std::filesystem::path&)> prepare = nullptr);

/// The hosts file every driver root starts with.
inline constexpr char kHostsFile[] =
    "127.0.0.1\tlocalhost.localdomain localhost\n"
    "10.20.30.41\ttavi-01.lab.example.net tavi-01\n";

/// Options of the screen driver (ScreenDriver.cpp) opening `scene` on
/// `host` for a logged-in root, with kHostsFile as the root's "/etc/hosts".
Options DriverOptions(const Json& host = DemoHostState(), const std::string& scene = "menu");

// ---- common steps ---------------------------------------------------------

/// Waits for the settled welcome screen, opens the login with `key` ("F2"
/// or "F12"), moves past the keyboard label when the dialog shows one,
/// enters `user` (replacing the pre-filled "root" unless it is root) and
/// `password`, and presses Enter.
::testing::AssertionResult LogIn(TestConsole& console, const std::string& user = "root",
                                 const std::string& password = kRootPassword,
                                 const std::string& key = "F2");

/// Moves a full-screen menu's selection (down, or up when `up`; the other
/// way at the end of a menu that does not wrap) until its right title shows
/// `title` (a long title up to the last word that fits).
::testing::AssertionResult SelectEntry(TestConsole& console, const std::string& title,
                                       int cols = 80, bool up = false);

/// LogIn, then selects `title` in the System Customization menu.
::testing::AssertionResult OpenMenuEntry(TestConsole& console, const std::string& title);

/// Replaces the console's host state file as a whole and atomically, as
/// another process would: the console and the simulated tools then read
/// the new state.
void ReplaceHostState(const TestConsole& console, const Json& host);

/// The host state file as it is now.
Json ReadHostState(const std::filesystem::path& stateFile);
Json HostState(const TestConsole& console);

/// Writes `text` to `path` under `root` (an absolute host path such as
/// "/var/run/brimlo/show-tulk-login"), creating the folders.
void WriteRootFile(const std::filesystem::path& root, const std::string& path,
                   const std::string& text = "");

/// The whole text of a file (empty when missing).
std::string ReadText(const std::filesystem::path& path);

/// Runs a shell command line and returns its standard output.
std::string Capture(const std::string& commandLine);

// ---- waits ----------------------------------------------------------------

/// Waits for `text` to appear (or, for Gone, to disappear) and for the
/// console to have handled everything sent to it (TestConsole::WaitReady());
/// fails when the settled screen no longer (or again) shows `text`.
::testing::AssertionResult Settled(TestConsole& console, const std::string& text);
::testing::AssertionResult Gone(TestConsole& console, const std::string& text);

/// Waits until the console has handled the keys sent, then checks that the
/// cursor stands on the row of the field labelled `label`.
::testing::AssertionResult CursorOn(TestConsole& console, const std::string& label);

// ---- records and log ------------------------------------------------------

/// The JSON lines of one of the simulated host's record files under
/// "<root>/var/log/tulk-sim/" ("audit.jsonl", "events.jsonl",
/// "commands.jsonl"); empty when the file does not exist.
std::vector<Json> SimRecords(const std::filesystem::path& root, const std::string& file);

/// The records of `file` whose `key` equals `value`.
std::vector<Json> RecordsWhere(const TestConsole& console, const std::string& file,
                               const std::string& key, const std::string& value);

/// The events posted so far with id `id`.
std::vector<Json> Events(const TestConsole& console, const std::string& id);

/// The commands the simulated tools ran whose argv, joined by blanks,
/// starts with `prefix`.
std::vector<std::string> CommandLines(const TestConsole& console, const std::string& prefix = "");

/// Whether the simulated tools ran exactly `line`.
bool Ran(const TestConsole& console, const std::string& line);

/// The system-log lines since the start, without their "<N>" priority.
std::vector<std::string> LogMessages(const TestConsole& console);

/// Whether `line` was logged (exactly, without priority).
bool Logged(const TestConsole& console, const std::string& line);

/// The system-log lines holding `text`, without their "<N>".
std::vector<std::string> LogLinesWith(const TestConsole& console, const std::string& text);

/// How many system-log lines equal `line` ("<14>User root logged in").
int CountLog(const TestConsole& console, const std::string& line);

// ---- the screen -----------------------------------------------------------

/// The text of `count` cells from `row`, `column` (box characters count as
/// one cell).
std::string Cells(const TestConsole& console, int row, int column, int count);

/// The first screen row (of `rows`) holding `text`, or -1.
int RowOf(const TestConsole& console, const std::string& text, int rows = 25);

/// The first row holding `label` in the left half (a menu's entries), or -1.
int MenuRow(const TestConsole& console, const std::string& label);

/// The foreground colour of the first cell of `text` (-2: not shown).
int ForegroundOf(const TestConsole& console, const std::string& text);

/// `text` with every run of blanks made one blank, trailing blanks removed.
std::string Squeezed(const std::string& text);

/// A full-screen menu's right title (row 1 of the right half), trimmed.
std::string RightTitle(const TestConsole& console, int cols = 80);

/// The right footer (row 22 of the right half) of an 80 x 25 menu, trimmed.
std::string RightFooter(const TestConsole& console);

/// The rows of the right half (rows 4 to 21), each trimmed.
std::vector<std::string> RightPane(const TestConsole& console);

/// RightPane joined by blanks and squeezed, so that a wrapped sentence
/// reads as one.
std::string RightText(const TestConsole& console);

}  // namespace TulkTest
