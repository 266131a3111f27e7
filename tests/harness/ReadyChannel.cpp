#include "ReadyChannel.h"

#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <ctime>
#include <stdexcept>

namespace TulkTest {

ReadyChannel::ReadyChannel() {
  int ends[2];
  if (pipe2(ends, O_CLOEXEC) != 0) {
    throw std::runtime_error("pipe2 failed: " + std::string(std::strerror(errno)));
  }
  read_ = ends[0];
  write_ = ends[1];
  fcntl(read_, F_SETFL, fcntl(read_, F_GETFL) | O_NONBLOCK);
}

ReadyChannel::~ReadyChannel() {
  CloseWriteEnd();
  if (read_ >= 0) {
    close(read_);
  }
}

void ReadyChannel::PassToChild() const {
  if (write_ == kChildFd) {
    fcntl(write_, F_SETFD, 0);
  } else {
    dup2(write_, kChildFd);
  }
}

void ReadyChannel::CloseWriteEnd() {
  if (write_ >= 0) {
    close(write_);
    write_ = -1;
  }
}

void ReadyChannel::Read() {
  char buffer[512];
  while (read_ >= 0) {
    ssize_t got = read(read_, buffer, sizeof buffer);
    if (got < 0 && errno == EINTR) {
      continue;
    }
    if (got == 0) {  // every copy of the write end is closed: the program ended
      close(read_);
      read_ = -1;
    }
    if (got <= 0) {
      return;
    }
    partial_.append(buffer, static_cast<std::size_t>(got));
    std::size_t whole = partial_.size() - partial_.size() % sizeof(std::int64_t);
    for (std::size_t at = 0; at < whole; at += sizeof(std::int64_t)) {
      std::int64_t time = 0;
      std::memcpy(&time, partial_.data() + at, sizeof time);
      newest_ = std::max(newest_, time);
    }
    partial_.erase(0, whole);
  }
}

std::int64_t ReadyChannel::Now() {
  timespec now{};
  clock_gettime(CLOCK_MONOTONIC, &now);
  return static_cast<std::int64_t>(now.tv_sec) * 1000000000 + now.tv_nsec;
}

}  // namespace TulkTest
