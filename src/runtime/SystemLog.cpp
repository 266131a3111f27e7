#include "runtime/SystemLog.h"

#include <fcntl.h>
#include <syslog.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

namespace Tulk {
namespace {

constexpr int kLogMask = 127;

// The mask syslog applies; mirrored so that the copy holds the same lines.
std::atomic<int> g_mask{0xff};

void AppendToCopy(int priority, const char* message) {
  const char* path = std::getenv("TULK_LOG_FILE");
  if (path == nullptr || *path == '\0') {
    return;
  }
  if ((priority & LOG_FACMASK) == 0) {
    priority |= LOG_USER;
  }
  std::string line = "<" + std::to_string(priority) + ">" + message + "\n";
  int fd = open(path, O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC, 0644);
  if (fd < 0) {
    return;
  }
  // One write per line: O_APPEND keeps lines of concurrent writers whole.
  ssize_t written = write(fd, line.data(), line.size());
  (void)written;
  close(fd);
}

}  // namespace

void OpenSystemLog() {
  openlog("TULK", LOG_PID, LOG_USER);
  setlogmask(kLogMask);
  g_mask = kLogMask;
}

void LogV(int priority, const char* format, va_list args) {
  char message[1024];
  std::vsnprintf(message, sizeof message, format, args);
  if ((LOG_MASK(LOG_PRI(priority)) & g_mask.load()) == 0) {
    return;
  }
  syslog(priority, "%s", message);
  AppendToCopy(priority, message);
}

void Log(int priority, const char* format, ...) {
  va_list args;
  va_start(args, format);
  LogV(priority, format, args);
  va_end(args);
}

void LogErrno(const char* call) {
  int error = errno;
  char text[128];
  const char* message = strerror_r(error, text, sizeof text);
  Log(LOG_ERR, "%s with errno(%d): %s", call, error, message);
}

}  // namespace Tulk
