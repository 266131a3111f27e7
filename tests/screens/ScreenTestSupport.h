#pragma once
/// Helpers shared by the screen tests: the demo host's state to start a
/// custom host from, and the simulated host's record files.
///
///   nlohmann::json host = TulkTest::DemoHostState();
///   host["hardware"]["vendor"] = "Acme";
///   TulkTest::Options options;
///   options.hostState = host.dump();

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <functional>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "TestConsole.h"

namespace TulkTest {

/// The built-in demo host's state (the simulated host's default).
nlohmann::json DemoHostState();

/// The JSON lines of one of the simulated host's record files under
/// "<root>/var/log/tulk-sim/" ("audit.jsonl", "events.jsonl",
/// "commands.jsonl"); empty when the file does not exist.
std::vector<nlohmann::json> SimRecords(const std::filesystem::path& root, const std::string& file);

/// The host state file as it is now.
nlohmann::json ReadHostState(const std::filesystem::path& stateFile);

/// Writes `text` to `path` under `root` (an absolute host path such as
/// "/var/run/brimlo/show-tulk-login"), creating the folders.
void WriteRootFile(const std::filesystem::path& root, const std::string& path,
                   const std::string& text = "");

/// The whole text of a file (empty when missing).
std::string ReadText(const std::filesystem::path& path);

/// Replaces the console's host state file as a whole and atomically, as
/// another process would: the console and the simulated tools then read
/// the new state.
void ReplaceHostState(const TestConsole& console, const nlohmann::json& host);

/// Waits until `condition` holds, pumping the console's output meanwhile;
/// the failure names `what` and dumps the screen.
::testing::AssertionResult WaitUntil(TestConsole& console, const std::function<bool()>& condition,
                                     const std::string& what,
                                     std::chrono::milliseconds timeout = kWait);

/// Waits for `text` to appear (or, for Gone, to disappear) and for the
/// console to have handled everything sent to it (TestConsole::WaitReady());
/// fails when the settled screen no longer (or again) shows `text`.
::testing::AssertionResult Settled(TestConsole& console, const std::string& text);
::testing::AssertionResult Gone(TestConsole& console, const std::string& text);

}  // namespace TulkTest
