#include "runtime/Clock.h"

#include <time.h>

#include <cmath>
#include <cstdlib>

namespace Tulk {
namespace {

double ReadScale() {
  const char* text = std::getenv("TULK_TIME_SCALE");
  if (text == nullptr || *text == '\0') {
    return 1.0;
  }
  char* end = nullptr;
  double scale = std::strtod(text, &end);
  return (end != text && scale > 0.0) ? scale : 1.0;
}

// The time since boot; it never steps.
timeval SteadyNow() {
  timespec now{};
  if (clock_gettime(CLOCK_BOOTTIME, &now) != 0) {
    clock_gettime(CLOCK_MONOTONIC, &now);
  }
  timeval result{};
  result.tv_sec = now.tv_sec;
  result.tv_usec = static_cast<suseconds_t>(now.tv_nsec / 1000);
  return result;
}

double ToSeconds(const timeval& tv) {
  return static_cast<double>(tv.tv_sec) + static_cast<double>(tv.tv_usec) / 1e6;
}

}  // namespace

double Clock::Scale() {
  static const double scale = ReadScale();
  return scale;
}

timeval Clock::Now() {
  const timeval real = SteadyNow();
  if (Scale() == 1.0) {
    return real;
  }
  static const timeval origin = real;
  double elapsed = (ToSeconds(real) - ToSeconds(origin)) * Scale();
  double now = ToSeconds(origin) + elapsed;
  timeval result{};
  result.tv_sec = static_cast<time_t>(now);
  result.tv_usec = static_cast<suseconds_t>((now - static_cast<double>(result.tv_sec)) * 1e6);
  return result;
}

int Clock::RealMilliseconds(long seconds, long microseconds) {
  double millis =
      (static_cast<double>(seconds) * 1000.0 + static_cast<double>(microseconds) / 1000.0) /
      Scale();
  if (millis <= 0.0) {
    return 0;
  }
  return static_cast<int>(std::ceil(millis));
}

}  // namespace Tulk
