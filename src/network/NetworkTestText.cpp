#include "network/NetworkTestText.h"

namespace Tulk {

std::string ZoneSuffix(const PingTarget& target, const std::string& interfaceName) {
  if (!target.linkLocal || target.zoned || interfaceName.empty()) {
    return {};
  }
  return "%" + interfaceName;
}

std::string PingCommand(const std::string& interfaceName, const std::string& address) {
  std::string command = "/bin/hykping -c 3 ";
  if (!interfaceName.empty()) {
    command += "-I " + interfaceName + " ";
  }
  return command + address;
}

std::string PingingLine(std::string_view pinging, int number, const std::string& address,
                        const std::string& zone) {
  return std::string(pinging) + " #" + std::to_string(number) + " (" + address + zone + ").";
}

std::string VerdictLine(std::string_view verdict) {
  return "{align:right}" + std::string(verdict) + "{/align}\n";
}

}  // namespace Tulk
