#pragma once
/// The folder a TestConsole's program lives in, and the environment that
/// points the program at it:
///
///   <temp>/tulk-test-XXXXXX/
///     root/             TULK_ROOT, with the simulated host tools installed
///     syslog.txt        TULK_LOG_FILE
///     host-state.json   TULK_HOST_STATE, when the options give a state
///     pam/              the PAM services, users and policy lines, when the
///                       options give users (PAM_WRAPPER_SERVICE_DIR)
///
/// The folder is also the program's working folder and TMPDIR. It is
/// removed with the object unless TULK_KEEP_TEST_ROOT is set.

#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "Options.h"

namespace TulkTest {

class TestFolder {
 public:
  /// Creates and fills the folder for `options`; `hostTool` is the
  /// simulated host tool that installs itself into the root (empty: none).
  TestFolder(const Options& options, const std::string& hostTool);
  ~TestFolder();
  TestFolder(const TestFolder&) = delete;
  TestFolder& operator=(const TestFolder&) = delete;

  const std::filesystem::path& Path() const { return folder_; }
  std::filesystem::path Root() const { return folder_ / "root"; }
  std::filesystem::path LogPath() const { return folder_ / "syslog.txt"; }
  std::filesystem::path HostStatePath() const { return folder_ / "host-state.json"; }
  std::filesystem::path PamPasswordFile() const { return folder_ / "pam" / "passdb"; }

  /// The program's environment: this process's own, without the console's
  /// variables a developer may have set, then the folder's, then
  /// `harness`, then the options' own settings and removals.
  std::vector<std::string> Environment(const Options& options,
                                       const std::map<std::string, std::string>& harness) const;

 private:
  void WritePamServices(const Options& options) const;

  std::filesystem::path folder_;
};

}  // namespace TulkTest
