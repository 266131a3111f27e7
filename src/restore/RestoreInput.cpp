#include "restore/RestoreInput.h"

#include <algorithm>

namespace Tulk {
namespace {

bool IsAlnum(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9');
}

}  // namespace

bool IsValidSwitchName(std::string_view name) {
  if (name.empty() || name.size() > kSwitchNameMaxLength || !IsAlnum(name.front())) {
    return false;
  }
  return std::all_of(name.begin(), name.end(),
                     [](char c) { return IsAlnum(c) || c == '-' || c == '_' || c == '.'; });
}

bool IsValidPortGroupName(std::string_view name) {
  if (name.empty() || name.size() > kPortGroupNameMaxLength || name.front() == ' ' ||
      name.back() == ' ') {
    return false;
  }
  return std::all_of(name.begin(), name.end(), [](char c) { return c >= 0x20 && c <= 0x7e; });
}

}  // namespace Tulk
