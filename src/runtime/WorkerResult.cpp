#include "runtime/WorkerResult.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>

#include "runtime/SystemLog.h"

namespace Tulk {

std::shared_ptr<WorkerResult> WorkerResult::Create() {
  std::shared_ptr<WorkerResult> result(new WorkerResult());
  int fds[2];
  if (pipe2(fds, O_CLOEXEC | O_NONBLOCK) == 0) {
    result->readFd_ = fds[0];
    result->writeFd_ = fds[1];
  } else {
    LogErrno("pipe2() failed");
  }
  return result;
}

WorkerResult::~WorkerResult() {
  if (readFd_ >= 0) {
    close(readFd_);
  }
  if (writeFd_ >= 0) {
    close(writeFd_);
  }
}

void WorkerResult::Set(int value) noexcept {
  value_.store(value == kRunning ? kRunning - 1 : value, std::memory_order_release);
  if (writeFd_ < 0) {
    return;
  }
  const char byte = 1;
  ssize_t written;
  do {
    written = write(writeFd_, &byte, 1);
  } while (written < 0 && errno == EINTR);
}

}  // namespace Tulk
