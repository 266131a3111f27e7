#pragma once
/// What a VLAN id typed by the operator means: no VLAN (empty), a VLAN
/// (1 to 4094), every VLAN (4095, the trunk id), or no valid id at all.
/// Shared by every screen that asks for a VLAN id.

#include <cstdint>
#include <string_view>

namespace Tulk {

struct VlanInput {
  enum class Kind { kNone, kVlan, kAllVlans, kInvalid };

  Kind kind = Kind::kNone;
  /// The id: 0 for kNone and kInvalid, 1 to 4095 otherwise.
  std::uint16_t id = 0;

  /// Reads `text` as a decimal number: empty is kNone, 1 to 4094 kVlan,
  /// 4095 kAllVlans; 0, anything above 4095 and anything that is not made
  /// of digits only is kInvalid.
  static VlanInput Parse(std::string_view text);
};

}  // namespace Tulk
