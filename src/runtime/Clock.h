#pragma once
/// The console's clock for dimming and the idle timeout.
///
/// Test seam: when TULK_TIME_SCALE is set to a number N > 0, console time
/// runs N times faster than real time (measured from the first use), so the
/// one-minute dimming takes 60/N real seconds. Unset, console time is the
/// wall clock, as on a real host.

#include <sys/time.h>

namespace Tulk {

class Clock {
 public:
  /// The current console time as seconds and microseconds.
  static timeval Now();
  /// Real milliseconds to wait for a console-time span of the given seconds
  /// and microseconds (rounded up so that a wait never ends early).
  static int RealMilliseconds(long seconds, long microseconds);
  /// The scale factor in use (1 without the seam).
  static double Scale();
};

}  // namespace Tulk
