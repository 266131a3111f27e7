#pragma once
// Helpers of the management network's screen tests: a console on a chosen
// host with the demo users, the way into "Configure Management Network"
// through the real login and menu, and moves between its entries and
// dialogs. Each helper waits for what it expects to see before it returns.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "ScreenTestSupport.h"
#include "TestConsole.h"

namespace NetworkTest {

/// A console on `host` with root logins allowed.
TulkTest::Options Options(const nlohmann::json& host = TulkTest::DemoHostState());

/// Logs in as root and selects "Configure Management Network" in the
/// System Customization menu.
::testing::AssertionResult OpenMenu(TulkTest::TestConsole& console);

/// OpenMenu, then Enter: waits for the management network window.
::testing::AssertionResult OpenWindow(TulkTest::TestConsole& console);

/// The right half's title (row 1), trimmed.
std::string RightTitle(const TulkTest::TestConsole& console);

/// Moves the selection (down, or up when `up`) until the right title is
/// `label`.
::testing::AssertionResult Select(TulkTest::TestConsole& console, const std::string& label,
                                  bool up = false);

/// Selects `label`, presses Enter and waits for `title` (the dialog).
::testing::AssertionResult OpenDialog(TulkTest::TestConsole& console, const std::string& label,
                                      const std::string& title);

/// Presses `key` in a dialog and waits until `title` is gone.
::testing::AssertionResult CloseDialog(TulkTest::TestConsole& console, const std::string& key,
                                       const std::string& title);

/// Esc in the window, "y" in the confirmation, then waits for "Network
/// settings changed." and the System Customization menu.
::testing::AssertionResult ApplyChanges(TulkTest::TestConsole& console);

/// The host state file now.
nlohmann::json HostState(const TulkTest::TestConsole& console);

/// The system-log lines since the start, without their "<N>" priority.
std::vector<std::string> LogMessages(const TulkTest::TestConsole& console);

/// Whether `line` was logged (exactly, without priority).
bool Logged(const TulkTest::TestConsole& console, const std::string& line);

/// The rows of the right half (columns 42 to 78), trimmed, top to bottom.
std::vector<std::string> RightPane(const TulkTest::TestConsole& console);

}  // namespace NetworkTest
