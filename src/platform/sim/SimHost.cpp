#include "platform/sim/SimHost.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <sstream>

#include "platform/api/HostMgrException.h"
#include "platform/sim/DemoHost.h"

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

// Without TULK_HOST_STATE the demo host is written to a private file, which
// the environment then names for the simulated tools this process starts.
std::string MaterialiseDemoHost() {
  const char* tmp = std::getenv("TMPDIR");
  std::string folder = (tmp != nullptr && *tmp != '\0') ? tmp : "/tmp";
  std::string pattern = folder + "/tulk-demo-host-XXXXXX";
  int fd = mkstemp(pattern.data());
  if (fd < 0) {
    throw StateError("cannot create the demo host state in " + folder + ": " +
                     std::strerror(errno));
  }
  close(fd);
  WriteFileAtomically(pattern, DemoHostState().dump(2) + "\n");
  setenv("TULK_HOST_STATE", pattern.c_str(), 1);
  setenv("TULK_SIM_DEMO_FILE", pattern.c_str(), 1);
  std::atexit(RemoveDemoFile);
  return pattern;
}

}  // namespace

SimHost& SimHost::Instance() {
  static SimHost host;
  return host;
}

void SimHost::Load() {
  const char* path = std::getenv("TULK_HOST_STATE");
  path_ = (path != nullptr && *path != '\0') ? path : MaterialiseDemoHost();
  ReadFile();
  loaded_ = true;
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
  nlohmann::json parsed = nlohmann::json::parse(text.str(), nullptr, false);
  if (parsed.is_discarded()) {
    throw StateError(path_ + ": malformed host state: not valid JSON");
  }
  try {
    ValidateState(parsed);
  } catch (const StateError& error) {
    throw StateError(path_ + ": malformed host state: " + error.what());
  }
  state_ = std::move(parsed);
  stamp_ = stamp;
}

bool SimHost::FileChanged() const {
  struct stat now {};
  if (stat(path_.c_str(), &now) != 0) {
    return false;
  }
  return !SameStamp(now, stamp_);
}

nlohmann::json& SimHost::State() {
  if (!loaded_) {
    Load();
  } else if (FileChanged()) {
    try {
      ReadFile();
    } catch (const StateError&) {
      // A file replaced by something malformed keeps the last good state.
    }
  }
  return state_;
}

void SimHost::Save() {
  WriteFileAtomically(path_, state_.dump(2) + "\n");
  stat(path_.c_str(), &stamp_);
}

void SimHost::CheckFault(std::string_view operation) {
  const nlohmann::json& state = State();
  auto faults = state.find("faults");
  if (faults == state.end() || !faults->is_object()) {
    return;
  }
  auto fault = faults->find(std::string(operation));
  if (fault != faults->end()) {
    throw HostMgr::Lib::HostMgrException(fault->is_string() ? fault->get<std::string>()
                                                            : fault->dump());
  }
}

void ValidateState(const nlohmann::json& state) {
  if (!state.is_object()) {
    throw StateError("the document must be a JSON object");
  }
  if (auto faults = state.find("faults"); faults != state.end() && !faults->is_object()) {
    throw StateError("\"faults\" must be an object");
  }
  if (auto options = state.find("advancedOptions"); options != state.end()) {
    if (!options->is_object()) {
      throw StateError("\"advancedOptions\" must be an object");
    }
    for (const auto& [name, value] : options->items()) {
      if (!value.is_number_integer()) {
        throw StateError("advanced option \"" + name + "\" must be an integer");
      }
    }
  }
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

}  // namespace Sim
