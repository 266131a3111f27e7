#pragma once
/// Reads a running process's resource use from /proc.

#include <sys/types.h>

#include <cstdint>

namespace TulkBench {

struct ProcessUsage {
  /// User plus system CPU time in milliseconds.
  double cpuMillis = 0;
  /// Voluntary plus involuntary context switches over all threads: each is
  /// a wake-up of a thread that was asleep or a preemption.
  std::uint64_t contextSwitches = 0;
  /// Peak resident set size in KiB.
  std::uint64_t peakResidentKiB = 0;
};

/// The usage of `pid` now (zeros when it cannot be read).
ProcessUsage ReadUsage(pid_t pid);

}  // namespace TulkBench
