#pragma once
// Steps of the management network's screen tests: the way into "Configure
// Management Network" through the real login and menu, and moves between
// its dialogs. Each step waits for what it expects to see before it
// returns.

#include <gtest/gtest.h>

#include <string>

#include "ScreenTestSupport.h"

namespace TulkTest {

/// Logs in as root, opens "Configure Management Network" and waits for its
/// window.
::testing::AssertionResult OpenWindow(TestConsole& console);

/// Selects `label`, presses Enter and waits for `title` (the dialog).
::testing::AssertionResult OpenDialog(TestConsole& console, const std::string& label,
                                      const std::string& title);

/// Presses `key` in a dialog and waits until `title` is gone.
::testing::AssertionResult CloseDialog(TestConsole& console, const std::string& key,
                                       const std::string& title);

/// Esc in the window, "y" in the confirmation, then waits for "Network
/// settings changed." and the System Customization menu.
::testing::AssertionResult ApplyChanges(TestConsole& console);

}  // namespace TulkTest
