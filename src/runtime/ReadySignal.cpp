#include "runtime/ReadySignal.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <climits>
#include <cstdint>
#include <cstdlib>
#include <ctime>

namespace Tulk {
namespace {

int OpenReadyFd() {
  const char* text = std::getenv("TULK_READY_FD");
  if (text == nullptr || *text == '\0') {
    return -1;
  }
  char* end = nullptr;
  errno = 0;
  const long value = std::strtol(text, &end, 10);
  if (errno != 0 || *end != '\0' || value <= STDERR_FILENO || value > INT_MAX) {
    return -1;
  }
  const int fd = static_cast<int>(value);
  struct stat info {};
  const int flags = fcntl(fd, F_GETFL);
  if (flags < 0 || (flags & O_ACCMODE) == O_RDONLY || fstat(fd, &info) != 0 ||
      !(S_ISFIFO(info.st_mode) || S_ISSOCK(info.st_mode))) {
    return -1;
  }
  if (fcntl(fd, F_SETFL, flags | O_NONBLOCK) != 0 || fcntl(fd, F_SETFD, FD_CLOEXEC) != 0) {
    return -1;
  }
  return fd;
}

// Checked before main() runs, so that the number cannot yet belong to a
// file the console opened itself.
const int g_readyFd = OpenReadyFd();

}  // namespace

int AnnounceReady(pollfd* fds, nfds_t count) {
  if (g_readyFd < 0) {
    return 0;
  }
  timespec now{};
  clock_gettime(CLOCK_MONOTONIC, &now);
  int pending;
  do {
    pending = poll(fds, count, 0);
  } while (pending < 0 && errno == EINTR);
  if (pending != 0) {
    return pending > 0 ? pending : 0;
  }
  const std::int64_t nanos = static_cast<std::int64_t>(now.tv_sec) * 1000000000 + now.tv_nsec;
  ssize_t written;
  do {
    written = write(g_readyFd, &nanos, sizeof nanos);
  } while (written < 0 && errno == EINTR);
  return 0;
}

}  // namespace Tulk
