#pragma once
/// The simulated host: the whole host state in one JSON document.
///
/// The state comes from the file named by TULK_HOST_STATE, or, when that
/// is unset, from the built-in demo host (DemoHost.h), which is written to a
/// private file so that the simulated host tools started by the console act
/// on the same state. The format is documented in docs/simulated-host.md.
///
/// Every change is written back at once and atomically (temporary file,
/// fsync, rename): a change made in one run is seen by the next, and a crash
/// never leaves a half-written file. The file is re-read whenever another
/// process (a simulated tool) replaced it.
///
/// Fault injection: the state's "faults" object maps an operation name
/// (such as "HykCtl::Network::NetworkInfoImpl::GetPnics") to a message; that
/// operation then throws HostMgr::Lib::HostMgrException with the message.

#include <sys/stat.h>

#include <nlohmann/json.hpp>
#include <stdexcept>
#include <string>
#include <string_view>

namespace Sim {

/// A state file that cannot be read or parsed.
class StateError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

class SimHost {
 public:
  /// The process-wide simulated host (loaded on first use).
  static SimHost& Instance();

  /// Loads the state now. Throws StateError for a missing or malformed
  /// file; the file is never overwritten then.
  void Load();

  /// The current state, re-read first when the file was replaced.
  nlohmann::json& State();

  /// Writes the state back atomically.
  void Save();

  /// Throws HostMgr::Lib::HostMgrException when `operation` has a fault.
  void CheckFault(std::string_view operation);

  /// The state file's path.
  const std::string& Path() const { return path_; }

 private:
  SimHost() = default;
  void ReadFile();
  bool FileChanged() const;

  std::string path_;
  nlohmann::json state_;
  bool loaded_ = false;
  struct stat stamp_ {};
};

/// Validates a parsed state document; throws StateError naming the first
/// problem.
void ValidateState(const nlohmann::json& state);

/// Writes `text` to `path` atomically (temporary file in the same folder,
/// fsync, rename). Throws StateError on failure.
void WriteFileAtomically(const std::string& path, const std::string& text);

}  // namespace Sim
