#pragma once
// Helpers of the network and restore screen tests: the driver program on a
// chosen host, and what the console left in its root.

#include <filesystem>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "ScreenTestSupport.h"
#include "TestConsole.h"

namespace DriverTest {

/// The hosts file every test root starts with.
inline constexpr char kHostsFile[] =
    "127.0.0.1\tlocalhost.localdomain localhost\n"
    "10.20.30.41\ttavi-01.lab.example.net tavi-01\n";

/// Options that run the network driver (tests/network/NetworkDriver.cpp)
/// with `scene` ("restart", "test", "restore", "menu") on `host`, with
/// kHostsFile as the root's "/etc/hosts".
TulkTest::Options DriverOptions(const nlohmann::json& host, const std::string& scene);

/// The host state file as it is now.
nlohmann::json HostState(const TulkTest::TestConsole& console);

/// The commands the simulated tools ran, each argv joined by blanks.
std::vector<std::string> Commands(const TulkTest::TestConsole& console);

/// The events posted so far with id `id`.
std::vector<nlohmann::json> Events(const TulkTest::TestConsole& console, const std::string& id);

/// The first screen row holding `text`, or -1.
int RowOf(const TulkTest::TestConsole& console, const std::string& text);

/// The text of `count` cells of `row` from `column`, trailing blanks
/// removed.
std::string Cells(const TulkTest::TestConsole& console, int row, int column, int count);

/// A full-screen menu's right title (row 1 of the right half) and right
/// footer (row LINES - 3 of the right half), on an 80 x 25 screen.
std::string RightTitle(const TulkTest::TestConsole& console);
std::string RightFooter(const TulkTest::TestConsole& console);

/// `text` with every run of blanks made one blank.
std::string Squeezed(const std::string& text);

/// The right half's description (rows 4 to 21), its lines joined by blanks
/// and squeezed, so that a wrapped sentence reads as one.
std::string RightText(const TulkTest::TestConsole& console);

/// The labels of the network restore menu, in order.
extern const std::vector<std::string> kRestoreLabels;

/// Moves a full-screen menu's selection down until its right title is
/// `title`. Each move is complete when the right title shows another of
/// `labels` (the menu's entries).
::testing::AssertionResult SelectEntry(TulkTest::TestConsole& console, const std::string& title,
                                       const std::vector<std::string>& labels = kRestoreLabels);

/// Waits for `text`, then for the screen to settle.
using TulkTest::Gone;
using TulkTest::Settled;
using TulkTest::WaitUntil;

}  // namespace DriverTest
