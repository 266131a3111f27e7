#pragma once
// Helpers of the menu's screen tests: the driver program (MenuDriver.cpp)
// on a chosen host, and waits on files the console or the simulated host
// write.

#include <chrono>
#include <filesystem>
#include <functional>
#include <string>

#include <nlohmann/json.hpp>

#include "ScreenTestSupport.h"
#include "TestConsole.h"

namespace MenuTest {

/// Options that run the menu driver with `scene` on `host`.
TulkTest::Options DriverOptions(const nlohmann::json& host = TulkTest::DemoHostState(),
                                const std::string& scene = "menu");

/// Waits until a condition holds (ScreenTestSupport.h).
using TulkTest::WaitUntil;

/// Waits for text to appear or disappear and the screen to settle
/// (ScreenTestSupport.h).
using TulkTest::Gone;
using TulkTest::Settled;

/// The right pane's title (row 1, from the middle of the screen), trimmed.
std::string RightTitle(const TulkTest::TestConsole& console, int cols = 80);

/// Moves the selection down until the right title is `title`.
::testing::AssertionResult SelectEntry(TulkTest::TestConsole& console, const std::string& title,
                                       int cols = 80);

/// Replaces the host state file (ScreenTestSupport.h).
using TulkTest::ReplaceHostState;

/// The whole text of a file (ScreenTestSupport.h).
using TulkTest::ReadText;

/// Runs a shell command line and returns its standard output.
std::string Capture(const std::string& commandLine);

}  // namespace MenuTest
