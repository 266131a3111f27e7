#pragma once
// A private simulated host for each test: a temporary folder with a root
// (TULK_ROOT), the tools installed, and a state file (TULK_HOST_STATE)
// holding the demo host or a given document.

#include <filesystem>
#include <functional>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

namespace SimTest {

/// The output and exit status of a finished program.
struct Finished {
  int status = -1;
  std::string out;
  std::string err;
};

class ScratchHost {
 public:
  /// The demo host, changed by `edit` before it is written.
  explicit ScratchHost(const std::function<void(nlohmann::json&)>& edit = {});
  /// A state file holding `text` as it is.
  explicit ScratchHost(const std::string& text);
  ~ScratchHost();
  ScratchHost(const ScratchHost&) = delete;
  ScratchHost& operator=(const ScratchHost&) = delete;

  const std::filesystem::path& Root() const { return root_; }
  const std::filesystem::path& StateFile() const { return state_; }
  /// The state file as it is on disk now.
  nlohmann::json ReadState() const;
  /// Replaces the state file (atomically) as another process would.
  void WriteState(const nlohmann::json& state) const;
  /// The records of "<root>/var/log/tulk-sim/<file>".
  std::vector<nlohmann::json> Records(const std::string& file) const;

  /// Runs the tool `name` (a path under the root such as "bin/osk-cmd")
  /// with `args`, in the test's environment.
  Finished Run(const std::string& path, const std::vector<std::string>& args) const;

 private:
  void Prepare();

  std::filesystem::path folder_;
  std::filesystem::path root_;
  std::filesystem::path state_;
};

/// Starts a program and waits for it, capturing both outputs.
Finished RunProgram(const std::vector<std::string>& argv);

}  // namespace SimTest
