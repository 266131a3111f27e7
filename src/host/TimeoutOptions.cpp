#include "host/TimeoutOptions.h"

#include <limits>

#include "host/HostTools.h"
#include "include/Constants.h"

namespace Tulk {
namespace {

std::uint32_t ReadSeconds(const char* option, std::uint32_t readDefault) {
  const std::int64_t value = ReadAdvancedOption(option, readDefault);
  if (value < 0 || value > std::numeric_limits<std::uint32_t>::max()) {
    return readDefault;
  }
  return static_cast<std::uint32_t>(value);
}

}  // namespace

TimeoutOptions ReadTimeoutOptions() {
  TimeoutOptions options;
  options.shellAvailabilitySeconds = ReadSeconds(kShellTimeOutOption, 0);
  options.shellIdleSeconds = ReadSeconds(kShellInteractiveTimeOutOption, 0);
  options.tulkIdleSeconds = ReadSeconds(kTulkTimeOutOption, kDefaultTulkTimeOutSeconds);
  return options;
}

TimeoutInput ReadTimeoutInput(std::string_view field) {
  TimeoutInput input;
  if (field.empty()) {
    return input;
  }
  std::uint32_t minutes = 0;
  for (char c : field) {
    if (c < '0' || c > '9' || minutes > kMaxTimeoutMinutes) {
      input.kind = TimeoutInput::Kind::kTooLarge;
      return input;
    }
    minutes = minutes * 10 + static_cast<std::uint32_t>(c - '0');
  }
  if (minutes > kMaxTimeoutMinutes) {
    input.kind = TimeoutInput::Kind::kTooLarge;
    return input;
  }
  input.kind = TimeoutInput::Kind::kValid;
  input.minutes = minutes;
  return input;
}

}  // namespace Tulk
