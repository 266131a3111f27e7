#pragma once
/// The harness's end of the console's readiness signal (TULK_READY_FD,
/// src/runtime/ReadySignal.h): a pipe whose write end the program inherits,
/// and the newest record read from it.
///
/// Each record is the monotonic time, in nanoseconds, at which the program
/// last found no input pending before it blocked for a key. A record newer
/// than the moment the harness last wrote to the program (a key, a signal)
/// proves that the program has read and handled that input, sent its
/// screen, and waits.

#include <cstdint>
#include <string>

namespace TulkTest {

class ReadyChannel {
 public:
  /// The descriptor number the program finds the write end under.
  static constexpr int kChildFd = 3;

  /// Creates the pipe; both ends are closed on exec in this process.
  ReadyChannel();
  ~ReadyChannel();
  ReadyChannel(const ReadyChannel&) = delete;
  ReadyChannel& operator=(const ReadyChannel&) = delete;

  /// In the child between fork and exec: puts the write end on kChildFd,
  /// open across exec. Only async-signal-safe calls.
  void PassToChild() const;
  /// In the parent after fork: closes its copy of the write end, so that
  /// only the program holds it.
  void CloseWriteEnd();

  /// The read end (non-blocking), for poll(); -1 once every copy of the
  /// write end has been closed and all was read.
  int ReadEnd() const { return read_; }
  /// Reads every record available without waiting.
  void Read();
  /// Monotonic time of the newest record in nanoseconds (0: none yet).
  std::int64_t Newest() const { return newest_; }

  /// The monotonic clock the records use, in nanoseconds.
  static std::int64_t Now();

 private:
  int read_ = -1;
  int write_ = -1;
  std::string partial_;
  std::int64_t newest_ = 0;
};

}  // namespace TulkTest
