#pragma once
/// The one exception type of the host-control library.

#include <stdexcept>
#include <string>

namespace HostMgr::Lib {

/// Every failure of a host-control operation arrives as this exception;
/// what() gives the library's message.
class HostMgrException : public std::runtime_error {
 public:
  /// An exception whose what() is `message`.
  explicit HostMgrException(const std::string& message) : std::runtime_error(message) {}
};

}  // namespace HostMgr::Lib
