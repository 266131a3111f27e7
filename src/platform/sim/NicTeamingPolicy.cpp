#include "platform/api/NicTeamingPolicy.h"

#include <algorithm>

namespace HostMgr::Network {

std::vector<std::string> NicTeamingPolicy::GetActiveUplinks() const {
  const std::size_t count =
      std::min(uplinkOrder_.size(), static_cast<std::size_t>(std::max(maxActiveUplinks_, 0)));
  return {uplinkOrder_.begin(), uplinkOrder_.begin() + static_cast<std::ptrdiff_t>(count)};
}

std::vector<std::string> NicTeamingPolicy::GetStandbyUplinks() const {
  const std::size_t count =
      std::min(uplinkOrder_.size(), static_cast<std::size_t>(std::max(maxActiveUplinks_, 0)));
  return {uplinkOrder_.begin() + static_cast<std::ptrdiff_t>(count), uplinkOrder_.end()};
}

}  // namespace HostMgr::Network
