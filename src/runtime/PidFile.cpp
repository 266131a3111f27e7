#include "runtime/PidFile.h"

#include <fcntl.h>
#include <signal.h>
#include <sys/stat.h>
#include <syslog.h>
#include <unistd.h>

#include <cctype>
#include <cerrno>
#include <cstdlib>
#include <limits>
#include <string>

#include "include/Constants.h"
#include "runtime/HostPath.h"
#include "runtime/SystemLog.h"
#include "runtime/WriteAll.h"

namespace Tulk {
namespace {

constexpr std::size_t kMaxPidText = 64;

// The id the current file names, 0 when there is none or it is not a
// regular file.
long ReadPid(const std::string& path) {
  const int fd = open(path.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC);
  if (fd < 0) {
    return 0;
  }
  struct stat status {};
  char text[kMaxPidText + 1] = {};
  ssize_t got = -1;
  if (fstat(fd, &status) == 0 && S_ISREG(status.st_mode)) {
    got = read(fd, text, kMaxPidText);
  }
  close(fd);
  if (got <= 0) {
    return 0;
  }
  text[got] = '\0';
  return ParsePid(text);
}

void ReplaceWithOwnPid(const std::string& path) {
  std::string temporary = path + ".XXXXXX";
  const int fd = mkostemp(temporary.data(), O_CLOEXEC);
  if (fd < 0) {
    return;
  }
  const bool written = fchmod(fd, 0644) == 0 && WriteAll(fd, std::to_string(getpid()));
  const bool closed = close(fd) == 0;
  if (!written || !closed || rename(temporary.c_str(), path.c_str()) != 0) {
    unlink(temporary.c_str());
  }
}

}  // namespace

long ParsePid(const char* text) {
  const char* digits = text;
  while (std::isspace(static_cast<unsigned char>(*digits))) {
    ++digits;
  }
  if (!std::isdigit(static_cast<unsigned char>(*digits))) {
    return 0;
  }
  errno = 0;
  char* end = nullptr;
  const long value = std::strtol(digits, &end, 10);
  if (errno == ERANGE || value <= 0 || value > std::numeric_limits<pid_t>::max()) {
    return 0;
  }
  while (std::isspace(static_cast<unsigned char>(*end))) {
    ++end;
  }
  return *end == '\0' ? value : 0;
}

void WritePidFile() {
  const std::string path = HostPath(kPidFilePath);
  const long pid = ReadPid(path);
  const bool live =
      pid > 0 && pid != getpid() && (kill(static_cast<pid_t>(pid), 0) == 0 || errno == EPERM);
  if (live) {
    Log(LOG_ERR, "Attempt to run multiple TULK instances, not updating %s", kPidFilePath);
    return;
  }
  ReplaceWithOwnPid(path);
}

}  // namespace Tulk
