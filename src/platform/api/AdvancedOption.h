#pragma once
/// The host's advanced options (integer values by path).

#include <cstdint>
#include <string>

namespace HykCtl::Adv {

/// Reads the host's advanced options. Every operation may throw
/// HostMgr::Lib::HostMgrException.
class UserAdvancedOptionImpl {
 public:
  /// The integer value of the option. Throws HostMgr::Lib::HostMgrException
  /// when the option does not exist or cannot be read.
  std::int64_t GetUserOption(const std::string& path) const;
  /// Whether the option exists.
  bool HasUserOption(const std::string& path) const;
  /// Sets (or creates) the option. The console changes options through
  /// the host's command-line tool; this is the library's own way in.
  void SetUserOption(const std::string& path, std::int64_t value);
};

}  // namespace HykCtl::Adv
