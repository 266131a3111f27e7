#pragma once
// Helpers of the troubleshooting screen tests: the driver program
// (TroubleshootingDriver.cpp) on a chosen host, and what the simulated host
// recorded.

#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "ScreenTestSupport.h"
#include "TestConsole.h"

namespace TroubleshootingTest {

using Json = nlohmann::json;
using Lines = std::vector<std::string>;
using TulkTest::Gone;
using TulkTest::Settled;
using TulkTest::TestConsole;
using TulkTest::WaitUntil;

/// Options that run the driver with `scene` ("window", "shell-timeouts",
/// "tulk-timeout", "agents") on `host`.
TulkTest::Options DriverOptions(const Json& host = TulkTest::DemoHostState(),
                                const std::string& scene = "window");

/// The demo host with the shell and SSH running or not.
Json HostWithServices(bool shellRunning, bool sshRunning);

/// The host state file as it is now.
Json HostState(const TestConsole& console);

/// The tool runs so far, each argv joined by blanks.
Lines ToolRuns(const TestConsole& console);

/// The tool runs whose line starts with `prefix`.
Lines ToolRunsStarting(const TestConsole& console, const std::string& prefix);

/// The system-log lines (without their "<N>") holding `text`.
Lines LogLinesWith(const TestConsole& console, const std::string& text);

/// The right pane's title (row 1, from the middle of the screen), trimmed.
std::string RightTitle(const TestConsole& console, int cols = 80);

/// The screen row (of 25) whose text holds `text`, or -1.
int RowOf(const TestConsole& console, const std::string& text);

/// The screen column (cells) where `text` starts on `row`, or -1.
int ColumnOf(const TestConsole& console, int row, const std::string& text);

/// The foreground colour of the first cell of `text` on the screen (-2
/// when it is not shown).
int ForegroundOf(const TestConsole& console, const std::string& text);

/// Whether the menu label `label` is drawn greyed (dark grey).
bool Greyed(const TestConsole& console, const std::string& label);

/// Presses Down until the right title is `title`; fails after `moves`
/// moves or when the selection stops moving.
::testing::AssertionResult SelectTitle(TestConsole& console, const std::string& title,
                                       int moves = 5);

}  // namespace TroubleshootingTest
