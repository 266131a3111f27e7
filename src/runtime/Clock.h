#pragma once
/// The console's clock for dimming and the idle timeout.
///
/// It never steps: console time is the time since boot (CLOCK_BOOTTIME,
/// CLOCK_MONOTONIC where the kernel lacks it), not the wall clock, so that
/// a clock step (NTP, an operator setting the date) neither logs a user out
/// early nor postpones it. Only differences between two readings mean
/// anything. Decisions of this implementation: the time the machine spends
/// suspended counts as idle time (CLOCK_BOOTTIME goes on during a suspend).
///
/// Test seam: when TULK_TIME_SCALE is set to a number N > 0, console time
/// runs N times faster than real time (measured from the first use), so the
/// one-minute dimming takes 60/N real seconds.

#include <sys/time.h>

namespace Tulk {

class Clock {
 public:
  /// The current console time as seconds and microseconds (from an
  /// arbitrary starting point).
  static timeval Now();
  /// Real milliseconds to wait for a console-time span of the given seconds
  /// and microseconds (rounded up so that a wait never ends early).
  static int RealMilliseconds(long seconds, long microseconds);
  /// The scale factor in use (1 without the seam).
  static double Scale();
};

}  // namespace Tulk
