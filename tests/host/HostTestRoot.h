#pragma once
// A scratch host root for the host-layer tests.
//
// HostRoot() is read once per process, so each test binary uses one root
// for all its tests: the global environment creates it before the first
// test (TULK_ROOT, TULK_LOG_FILE, TULK_HOST_STATE), links a few real
// programs into its bin folder (the child's PATH is confined to it) and
// removes it afterwards. Tests reset the log copy and write their own tool
// scripts and host state.

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

namespace HostTest {

class HostTestRoot : public ::testing::Environment {
 public:
  void SetUp() override;
  void TearDown() override;
};

/// The root folder.
const std::filesystem::path& Root();

/// Lines of the system-log copy ("<N>message"), oldest first.
std::vector<std::string> LogLines();

/// Empties the system-log copy.
void ClearLog();

/// True when some log line equals `line`.
bool Logged(const std::string& line);

/// Writes an executable shell script at `hostPath` under the root.
void WriteScript(const std::string& hostPath, const std::string& body);

/// Writes a tool at `hostPath` that appends "<name> <arguments>" and, when
/// `recordVariable` is given, "<name> $<variable>" to the invocation log,
/// then runs `body`.
void WriteRecordingTool(const std::string& hostPath, const std::string& body,
                        const std::string& recordVariable = "");

/// Lines of the invocation log of the recording tools; ClearInvocations()
/// empties it.
std::vector<std::string> Invocations();
void ClearInvocations();

/// Replaces the simulated host's state file (atomically, so the running
/// process re-reads it).
void WriteHostState(const std::string& json);

/// Reads a whole file; empty when it is missing.
std::string ReadFile(const std::filesystem::path& path);

}  // namespace HostTest
