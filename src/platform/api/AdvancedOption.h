#pragma once
/// The host's advanced options (integer values by path).

#include <cstdint>
#include <string>

namespace HykCtl::Adv {

class UserAdvancedOptionImpl {
 public:
  /// The integer value of the option. Throws HostMgr::Lib::HostMgrException
  /// when the option does not exist or cannot be read.
  std::int64_t GetUserOption(const std::string& path) const;
  /// Whether the option exists.
  bool HasUserOption(const std::string& path) const;
};

}  // namespace HykCtl::Adv
