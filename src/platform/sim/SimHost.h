#pragma once
/// The simulated host: the whole host state in one JSON document.
///
/// Where the state lives, in this order:
/// 1. the file named by TULK_HOST_STATE;
/// 2. the root's own state file, "<TULK_ROOT>/var/lib/tulk-sim/host-state.json",
///    when it exists (scripts/make-demo-root.sh writes it, so that changes
///    persist across runs);
/// 3. the built-in demo host (DemoHost.h), written to a private file:
///    "$TMPDIR/host-state.json" when TMPDIR is set and that file does not
///    exist yet (it is kept: TMPDIR is the caller's scratch folder), else a
///    unique file under TMPDIR or /tmp, removed at exit.
/// In cases 2 and 3 TULK_HOST_STATE is then set to the file, so that the
/// simulated host tools started by the console act on the same state. The
/// format is documented in docs/simulated-host.md.
///
/// Every change is a locked read-modify-write (flock on "<state>.lock"),
/// written back at once and atomically (temporary file, fsync, rename): the
/// console and the tools may change the file concurrently without losing
/// an update, a change is seen by the next run, and a crash never leaves a
/// half-written file. A change always reads the file again under the lock
/// (a stamp can repeat: inode numbers are reused and times are coarse).
/// Reads re-read the file only when it was replaced (device, inode, size
/// and modification time are compared), so a query on an unchanged state
/// costs one stat().
///
/// Threads: the console's worker threads (the network test, the live core
/// capture) run host programs and edit the hosts file while the main
/// thread queries. Every state is an immutable snapshot; State() pins the
/// current one for the calling thread, so a reference it returned stays
/// valid until that thread calls State() again. Reloads and changes are
/// serialised by a mutex.
///
/// Fault injection: the state's "faults" object maps an operation name to
/// a message; that operation then throws HostMgr::Lib::HostMgrException
/// with the message. Operations are named "Namespace::Class::Method" (such
/// as "HykCtl::Network::NetworkInfoImpl::GetPnics"), C functions by their
/// name ("QobUserLib_Init"); the short form "Class::Method" works too.

#include <sys/stat.h>

#include <cstdint>
#include <functional>
#include <memory>
#include <mutex>
#include <nlohmann/json.hpp>
#include <stdexcept>
#include <string>
#include <string_view>

namespace Sim {

/// A state file that cannot be read, parsed or written.
class StateError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

/// The process-wide simulated host.
class SimHost {
 public:
  /// The process-wide simulated host (loaded on first use).
  static SimHost& Instance();

  /// Finds and loads the state now. Throws StateError for a missing or
  /// malformed file; the file is never overwritten then.
  void Load();

  /// Forgets the loaded state; the next use finds and loads it again.
  void Reset();

  /// The current state, re-read first when the file was replaced. A file
  /// replaced by a malformed one keeps the last good state. The reference
  /// stays valid until the calling thread calls State() again.
  const nlohmann::json& State();

  /// Applies `change` as one locked read-modify-write and saves the result.
  /// When `change` throws, nothing is written and the exception passes on.
  /// Failures to read or write the file throw HostMgr::Lib::HostMgrException.
  void Modify(const std::function<void(nlohmann::json&)>& change);

  /// Throws HostMgr::Lib::HostMgrException when `operation` has a fault in
  /// the current state.
  void CheckFault(std::string_view operation);
  /// The same check against a state obtained from State().
  static void CheckFault(const nlohmann::json& state, std::string_view operation);

  /// A number that changes whenever the state changed (re-read or
  /// modified); equal numbers mean an unchanged state.
  std::uint64_t Generation();
  /// The generation of the state State() last returned to this thread.
  static std::uint64_t PinnedGeneration();

  /// The state file's path (empty before Load).
  const std::string& Path() const { return path_; }

 private:
  SimHost() = default;
  void ReadFile();
  bool FileChanged() const;
  void EnsureLoaded();

  // NOLINTNEXTLINE(bugprone-exception-escape): json's own moves and destructor do not throw
  struct Snapshot {
    nlohmann::json state;
    std::uint64_t generation = 0;
  };
  void Publish(nlohmann::json state);
  const Snapshot& Pin();

  std::recursive_mutex mutex_;
  std::string path_;
  std::shared_ptr<const Snapshot> snapshot_;
  bool loaded_ = false;
  std::uint64_t generation_ = 0;
  struct stat stamp_ {};
};

/// Writes `text` to `path` atomically (temporary file "<path>.tmp.XXXXXX"
/// in the same folder, fsync, rename). Throws StateError on failure.
void WriteFileAtomically(const std::string& path, const std::string& text);

/// Removes the temporary files "<path>.tmp.*" that a writer killed in the
/// middle of WriteFileAtomically() left beside `path`. Call it only while
/// holding the lock every writer of `path` takes, so that no live writer's
/// file is removed.
void RemoveLeftoverTemporaries(const std::string& path);

/// The deepest nesting of arrays and objects a host state may have. A state
/// nested deeper is malformed ("nesting deeper than 64 levels"): the
/// writers walk it recursively.
inline constexpr int kMaxStateDepth = 64;

/// TULK_ROOT with every symbolic link, "." and ".." resolved; empty when it
/// is unset or empty, cannot be resolved (it does not exist), or resolves
/// to the machine's own root "/" (such as "/tmp/..", "/proc/self/root" or
/// a link to "/"). The simulated host acts only on a root this returns.
std::string ResolvedScratchRoot();

/// `path` (absolute) under the host root TULK_ROOT ("/" when unset).
std::string RootPath(std::string_view path);

/// The root's own state file, "<TULK_ROOT>/var/lib/tulk-sim/host-state.json".
std::string RootStateFile();

}  // namespace Sim
