#pragma once
/// The one thing a worker thread shares with the screen that started it: an
/// integer result and a way to wake the screen's key read when it is set.
///
/// The screen makes the result, hands a copy of the shared pointer to the
/// worker and waits with WaitForKeyOrResult() (KeyInput.h), which returns
/// kKeyResultReady as soon as the worker has called Set(). Shared ownership
/// lets the screen leave first (Esc during a network test): the worker
/// finishes on its own and the result goes when the last owner lets go.
///
///   auto result = WorkerResult::Create();
///   std::thread([result] { result->Set(RunCheck()); }).detach();
///   while (WaitForKeyOrResult(this, true, *result) != kKeyResultReady) { ... }
///
/// No lock is used: the worker writes the value once, then one byte to a
/// pipe; the screen reads the value after poll() saw the byte.

#include <atomic>
#include <memory>

namespace Tulk {

class WorkerResult {
 public:
  /// The value while the worker runs.
  static constexpr int kRunning = -1;

  /// A result that reads kRunning, with its wake pipe. When the pipe cannot
  /// be made the result still works, but the key read only notices it at
  /// its next wake-up (a key, a signal, the dimming point).
  static std::shared_ptr<WorkerResult> Create();
  ~WorkerResult();
  WorkerResult(const WorkerResult&) = delete;
  WorkerResult& operator=(const WorkerResult&) = delete;

  /// Called once by the worker: stores `value` (not kRunning) and wakes the
  /// key read. Safe after the screen has gone.
  void Set(int value) noexcept;
  /// The value: kRunning until Set() was called.
  int Get() const noexcept { return value_.load(std::memory_order_acquire); }
  /// Whether Set() was called.
  bool Ready() const noexcept { return Get() != kRunning; }
  /// The descriptor that becomes readable when the result is set (-1 when
  /// there is none).
  int WakeFd() const { return readFd_; }

 private:
  WorkerResult() = default;

  std::atomic<int> value_{kRunning};
  int readFd_ = -1;
  int writeFd_ = -1;
};

}  // namespace Tulk
