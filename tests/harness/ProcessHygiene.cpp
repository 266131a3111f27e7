#include "ProcessHygiene.h"

#include <fcntl.h>
#include <signal.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <sstream>

namespace TulkTest {
namespace {

namespace fs = std::filesystem;

constexpr char kPamFolderParent[] = "/tmp";
constexpr char kPamFolderPrefix[] = "pam.";

// The file's bytes, or as many as could be read: a /proc file of a process
// that ends meanwhile fails its read (ESRCH), which the stream library would
// turn into an exception.
std::string ReadAll(const fs::path& path) {
  std::string text;
  const int fd = open(path.c_str(), O_RDONLY | O_CLOEXEC);
  if (fd < 0) {
    return text;
  }
  char buffer[4096];
  for (;;) {
    const ssize_t got = read(fd, buffer, sizeof buffer);
    if (got <= 0) {
      break;
    }
    text.append(buffer, static_cast<std::size_t>(got));
  }
  close(fd);
  return text;
}

// The session id of a process from /proc/<pid>/stat, or -1.
pid_t SessionOf(const fs::path& process) {
  const std::string stat = ReadAll(process / "stat");
  const std::size_t close = stat.rfind(')');
  if (close == std::string::npos) {
    return -1;
  }
  // After the command: state, parent, process group, session.
  std::istringstream fields(stat.substr(close + 1));
  std::string state;
  long parent = 0;
  long group = 0;
  long session = -1;
  fields >> state >> parent >> group >> session;
  return fields ? static_cast<pid_t>(session) : -1;
}

std::vector<fs::path> PamFolders() {
  std::vector<fs::path> folders;
  std::error_code error;
  for (fs::directory_iterator it(kPamFolderParent, error), end; !error && it != end;
       it.increment(error)) {
    if (it->path().filename().string().rfind(kPamFolderPrefix, 0) == 0) {
      folders.push_back(it->path());
    }
  }
  return folders;
}

bool Mentions(const fs::path& folder, const std::string& marker) {
  std::error_code error;
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
    if (ReadAll(it->path()).find(marker) != std::string::npos) {
      return true;
    }
  }
  return false;
}

bool OwnedBy(const fs::path& folder, const std::vector<pid_t>& pids) {
  const std::string text = ReadAll(folder / "pid");
  if (text.empty() || text.size() > 10 ||
      text.find_first_not_of("0123456789\n") != std::string::npos) {
    return false;
  }
  const pid_t pid = static_cast<pid_t>(std::stoll(text));
  return std::find(pids.begin(), pids.end(), pid) != pids.end();
}

}  // namespace

std::vector<pid_t> SessionMembers(pid_t leader) {
  std::vector<pid_t> members;
  std::error_code error;
  for (fs::directory_iterator it("/proc", error), end; !error && it != end; it.increment(error)) {
    const std::string name = it->path().filename().string();
    if (name.size() > 10 || name.find_first_not_of("0123456789") != std::string::npos) {
      continue;
    }
    const pid_t pid = static_cast<pid_t>(std::stoll(name));
    if (pid != leader && SessionOf(it->path()) == leader) {
      members.push_back(pid);
    }
  }
  return members;
}

std::vector<pid_t> SignalSession(pid_t leader, int signal) {
  std::vector<pid_t> members = SessionMembers(leader);
  for (pid_t pid : members) {
    kill(pid, signal);
  }
  return members;
}

std::string ProcFile(pid_t pid, const std::string& name) {
  return ReadAll(fs::path("/proc") / std::to_string(pid) / name);
}

void RemovePamFolders(const std::string& marker, const std::vector<pid_t>& pids) {
  for (const fs::path& folder : PamFolders()) {
    if (Mentions(folder, marker) || OwnedBy(folder, pids)) {
      std::error_code ignored;
      fs::remove_all(folder, ignored);
    }
  }
}

std::vector<std::string> PamFoldersOf(const std::string& marker) {
  std::vector<std::string> found;
  for (const fs::path& folder : PamFolders()) {
    if (Mentions(folder, marker)) {
      found.push_back(folder.string());
    }
  }
  return found;
}

}  // namespace TulkTest
