#pragma once
/// The names an operator may give a new standard switch or portgroup.

#include <cstddef>
#include <string_view>

namespace Tulk {

/// The longest standard switch name.
inline constexpr std::size_t kSwitchNameMaxLength = 31;
/// The longest portgroup name.
inline constexpr std::size_t kPortGroupNameMaxLength = 59;

/// 1 to 31 ASCII letters, digits, "-", "_" and ".", starting with a letter
/// or digit ("vSwitch2", "vs-backup_1").
bool IsValidSwitchName(std::string_view name);

/// 1 to 59 printable ASCII characters, neither starting nor ending with a
/// blank ("Management Network2", "VM Network 20").
bool IsValidPortGroupName(std::string_view name);

}  // namespace Tulk
