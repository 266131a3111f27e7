#pragma once
// A scratch host root for the host-layer tests.
//
// HostRoot() is read once per process, so the test binary uses one root for
// all its tests: the global environment lays it out with the simulated host
// tools (tulk-hosttool --install) before the first test, sets TULK_ROOT,
// TULK_LOG_FILE and TULK_HOST_STATE, and removes it afterwards
// (TULK_KEEP_TEST_ROOT keeps it).

#include <gtest/gtest.h>

#include <filesystem>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

namespace HostTest {

/// The root folder.
const std::filesystem::path& Root();

/// Lines of the system-log copy ("<N>message"), oldest first; ClearLog()
/// empties it.
std::vector<std::string> LogLines();
void ClearLog();
bool Logged(const std::string& line);

/// Writes an executable shell script at `hostPath` under the root.
void WriteScript(const std::string& hostPath, const std::string& body);

/// Replaces the host state file atomically (the process re-reads it), and
/// reads it back.
void WriteHostState(const nlohmann::json& state);
nlohmann::json ReadHostState();

/// The JSON lines of "<root>/var/log/tulk-sim/<file>" (events, audit
/// records, tool invocations); ClearRecords() removes them all.
std::vector<nlohmann::json> Records(const char* file);
void ClearRecords();

/// A test on the demo host: the log and the record files are emptied and
/// the demo host's state written before it; Apply() writes `state_` again
/// after a change.
class HostStateTest : public ::testing::Test {
 protected:
  void SetUp() override;
  void Apply() { WriteHostState(state_); }
  nlohmann::json& Network() { return state_["network"]; }

  nlohmann::json state_;
};

}  // namespace HostTest
