#include "platform/sim/SimHost.h"

#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <sstream>

#include "platform/api/HostMgrException.h"
#include "platform/sim/DemoHost.h"
#include "platform/sim/StateSchema.h"

namespace Sim {
namespace {

bool SameStamp(const struct stat& a, const struct stat& b) {
  return a.st_ino == b.st_ino && a.st_dev == b.st_dev && a.st_size == b.st_size &&
         a.st_mtim.tv_sec == b.st_mtim.tv_sec && a.st_mtim.tv_nsec == b.st_mtim.tv_nsec;
}

void RemoveDemoFile() {
  const char* path = std::getenv("TULK_SIM_DEMO_FILE");
  if (path != nullptr && *path != '\0') {
    unlink(path);
  }
}

std::string Environment(const char* name) {
  const char* value = std::getenv(name);
  return value != nullptr ? value : "";
}

// Without a state file the demo host is written to a private file, which
// the environment then names for the simulated tools this process starts.
std::string MaterialiseDemoHost() {
  const std::string tmpdir = Environment("TMPDIR");
  const std::string text = DemoHostState().dump(2) + "\n";
  if (!tmpdir.empty()) {
    std::string fixed = tmpdir + "/host-state.json";
    int fd = open(fixed.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0644);
    if (fd >= 0) {
      close(fd);
      WriteFileAtomically(fixed, text);
      setenv("TULK_HOST_STATE", fixed.c_str(), 1);
      return fixed;
    }
  }
  std::string pattern = (tmpdir.empty() ? std::string("/tmp") : tmpdir) + "/tulk-demo-host-XXXXXX";
  int fd = mkstemp(pattern.data());
  if (fd < 0) {
    throw StateError("cannot create the demo host state in " + pattern + ": " +
                     std::strerror(errno));
  }
  close(fd);
  WriteFileAtomically(pattern, text);
  setenv("TULK_HOST_STATE", pattern.c_str(), 1);
  setenv("TULK_SIM_DEMO_FILE", pattern.c_str(), 1);
  std::atexit(RemoveDemoFile);
  return pattern;
}

// Holds an exclusive flock on the state's lock file for one change.
class StateLock {
 public:
  explicit StateLock(const std::string& statePath) {
    const std::string path = statePath + ".lock";
    fd_ = open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0644);
    if (fd_ < 0) {
      throw HostMgr::Lib::HostMgrException("Cannot lock host state " + path + ": " +
                                           std::strerror(errno));
    }
    while (flock(fd_, LOCK_EX) != 0) {
      if (errno != EINTR) {
        int error = errno;
        close(fd_);
        throw HostMgr::Lib::HostMgrException("Cannot lock host state " + path + ": " +
                                             std::strerror(error));
      }
    }
  }
  ~StateLock() { close(fd_); }
  StateLock(const StateLock&) = delete;
  StateLock& operator=(const StateLock&) = delete;

 private:
  int fd_ = -1;
};

// The snapshot each thread is reading; kept alive until that thread's next
// State() call.
thread_local std::shared_ptr<const void> t_pinned;
thread_local std::uint64_t t_pinnedGeneration = 0;

}  // namespace

SimHost& SimHost::Instance() {
  static SimHost host;
  return host;
}

void SimHost::Load() {
  std::lock_guard lock(mutex_);
  std::string path = Environment("TULK_HOST_STATE");
  if (path.empty()) {
    const std::string rootFile = RootStateFile();
    if (access(rootFile.c_str(), F_OK) == 0) {
      path = rootFile;
      setenv("TULK_HOST_STATE", path.c_str(), 1);
    } else {
      path = MaterialiseDemoHost();
    }
  }
  path_ = path;
  ReadFile();
  loaded_ = true;
}

void SimHost::Reset() {
  std::lock_guard lock(mutex_);
  loaded_ = false;
  path_.clear();
  Publish(nlohmann::json());
}

void SimHost::Publish(nlohmann::json state) {
  auto snapshot = std::make_shared<Snapshot>();
  snapshot->state = std::move(state);
  snapshot->generation = ++generation_;
  snapshot_ = std::move(snapshot);
}

const SimHost::Snapshot& SimHost::Pin() {
  t_pinned = snapshot_;
  t_pinnedGeneration = snapshot_->generation;
  return *snapshot_;
}

void SimHost::EnsureLoaded() {
  if (!loaded_) {
    try {
      Load();
    } catch (const StateError& error) {
      throw HostMgr::Lib::HostMgrException(error.what());
    }
  }
}

void SimHost::ReadFile() {
  std::ifstream in(path_);
  if (!in) {
    throw StateError(path_ + ": cannot open host state: " + std::strerror(errno));
  }
  struct stat stamp {};
  if (stat(path_.c_str(), &stamp) != 0) {
    throw StateError(path_ + ": cannot read host state: " + std::strerror(errno));
  }
  std::stringstream text;
  text << in.rdbuf();
  // Containers nested too deep are dropped while parsing (never built),
  // and the file is then refused as a whole.
  bool tooDeep = false;
  nlohmann::json parsed = nlohmann::json::parse(
      text.str(),
      [&tooDeep](int depth, nlohmann::json::parse_event_t, nlohmann::json&) {
        if (depth > kMaxStateDepth) {
          tooDeep = true;
          return false;
        }
        return true;
      },
      false);
  if (parsed.is_discarded()) {
    throw StateError(path_ + ": malformed host state: not valid JSON");
  }
  if (tooDeep) {
    throw StateError(path_ + ": malformed host state: nesting deeper than " +
                     std::to_string(kMaxStateDepth) + " levels");
  }
  try {
    ValidateState(parsed);
  } catch (const StateError& error) {
    throw StateError(path_ + ": malformed host state: " + error.what());
  }
  Publish(std::move(parsed));
  stamp_ = stamp;
}

bool SimHost::FileChanged() const {
  struct stat now {};
  if (stat(path_.c_str(), &now) != 0) {
    return false;
  }
  return !SameStamp(now, stamp_);
}

const nlohmann::json& SimHost::State() {
  std::lock_guard lock(mutex_);
  EnsureLoaded();
  if (FileChanged()) {
    try {
      ReadFile();
    } catch (const StateError&) {
      // A file replaced by something malformed keeps the last good state.
    }
  }
  return Pin().state;
}

void SimHost::Modify(const std::function<void(nlohmann::json&)>& change) {
  std::lock_guard guard(mutex_);
  EnsureLoaded();
  StateLock lock(path_);
  // Under the lock the file is read again whatever its stamp says: a file
  // system that reuses inode numbers at once and keeps coarse times can
  // give another writer's file the very stamp of this one's last write,
  // and the change would then be applied to a stale copy.
  try {
    ReadFile();
  } catch (const StateError& error) {
    throw HostMgr::Lib::HostMgrException(error.what());
  }
  nlohmann::json next = snapshot_->state;
  change(next);
  RemoveLeftoverTemporaries(path_);
  try {
    WriteFileAtomically(path_, next.dump(2) + "\n");
  } catch (const StateError& error) {
    throw HostMgr::Lib::HostMgrException(error.what());
  }
  Publish(std::move(next));
  stat(path_.c_str(), &stamp_);
}

void SimHost::CheckFault(std::string_view operation) {
  CheckFault(State(), operation);
}

void SimHost::CheckFault(const nlohmann::json& state, std::string_view operation) {
  auto faults = state.find("faults");
  if (faults == state.end() || faults->empty()) {
    return;
  }
  auto fault = faults->find(std::string(operation));
  if (fault == faults->end()) {
    // The short form: the last two "::"-separated parts.
    std::string_view shortName = operation;
    if (auto method = operation.rfind("::"); method != std::string_view::npos && method > 0) {
      if (auto cls = operation.rfind("::", method - 1); cls != std::string_view::npos) {
        shortName = operation.substr(cls + 2);
      }
    }
    fault = faults->find(std::string(shortName));
  }
  if (fault != faults->end()) {
    throw HostMgr::Lib::HostMgrException(fault->is_string() ? fault->get<std::string>()
                                                            : fault->dump());
  }
}

std::uint64_t SimHost::Generation() {
  State();
  return t_pinnedGeneration;
}

std::uint64_t SimHost::PinnedGeneration() {
  return t_pinnedGeneration;
}

void WriteFileAtomically(const std::string& path, const std::string& text) {
  std::string temporary = path + ".tmp.XXXXXX";
  int fd = mkstemp(temporary.data());
  if (fd < 0) {
    throw StateError(path + ": cannot write host state: " + std::strerror(errno));
  }
  const char* data = text.data();
  std::size_t left = text.size();
  while (left > 0) {
    ssize_t written = write(fd, data, left);
    if (written < 0) {
      if (errno == EINTR) {
        continue;
      }
      int error = errno;
      close(fd);
      unlink(temporary.c_str());
      throw StateError(path + ": cannot write host state: " + std::strerror(error));
    }
    data += written;
    left -= static_cast<std::size_t>(written);
  }
  fchmod(fd, 0644);
  bool synced = fsync(fd) == 0;
  int syncError = errno;
  bool closed = close(fd) == 0;
  if (!synced || !closed || rename(temporary.c_str(), path.c_str()) != 0) {
    int error = !synced ? syncError : errno;
    unlink(temporary.c_str());
    throw StateError(path + ": cannot write host state: " + std::strerror(error));
  }
}

void RemoveLeftoverTemporaries(const std::string& path) {
  const std::filesystem::path file(path);
  const std::string prefix = file.filename().string() + ".tmp.";
  std::error_code error;
  std::filesystem::directory_iterator entries(file.parent_path(), error);
  for (; !error && entries != std::filesystem::directory_iterator(); entries.increment(error)) {
    const std::string name = entries->path().filename().string();
    std::error_code ignored;
    if (name.starts_with(prefix) && entries->is_regular_file(ignored)) {
      std::filesystem::remove(entries->path(), ignored);
    }
  }
}

std::string ResolvedScratchRoot() {
  const std::string root = Environment("TULK_ROOT");
  if (root.empty()) {
    return {};
  }
  char* resolved = realpath(root.c_str(), nullptr);
  if (resolved == nullptr) {
    return {};
  }
  std::string result = resolved;
  std::free(resolved);
  return result == "/" ? std::string() : result;
}

std::string RootPath(std::string_view path) {
  std::string root = Environment("TULK_ROOT");
  while (!root.empty() && root.back() == '/') {
    root.pop_back();
  }
  std::string result = root;
  if (path.empty() || path.front() != '/') {
    result += '/';
  }
  result += path;
  return result;
}

std::string RootStateFile() {
  return RootPath("/var/lib/tulk-sim/host-state.json");
}

}  // namespace Sim
