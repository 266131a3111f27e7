#include "host/VlanInput.h"

namespace Tulk {

VlanInput VlanInput::Parse(std::string_view text) {
  if (text.empty()) {
    return {Kind::kNone, 0};
  }
  unsigned long value = 0;
  for (char c : text) {
    if (c < '0' || c > '9') {
      return {Kind::kInvalid, 0};
    }
    value = value * 10 + static_cast<unsigned long>(c - '0');
    if (value > 4095) {
      return {Kind::kInvalid, 0};
    }
  }
  if (value == 0) {
    return {Kind::kInvalid, 0};
  }
  const auto id = static_cast<std::uint16_t>(value);
  return {value == 4095 ? Kind::kAllVlans : Kind::kVlan, id};
}

}  // namespace Tulk
