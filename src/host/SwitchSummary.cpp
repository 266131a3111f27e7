#include "host/SwitchSummary.h"

namespace Tulk {

std::string FormatSwitchSummary(const SwitchSummary& summary) {
  return "Number of ports: " + std::to_string(summary.numPorts) +
         "\nUsed ports: " + std::to_string(summary.usedPorts) +
         "\nConfigured ports: " + std::to_string(summary.configuredPorts) +
         "\nUplinks: " + JoinNames(summary.uplinks) +
         "\nPort groups: " + JoinNames(summary.portGroups);
}

std::string JoinNames(const std::vector<std::string>& names) {
  if (names.empty()) {
    return "None";
  }
  std::string text;
  for (const std::string& name : names) {
    text += name;
    text += ',';
  }
  text.pop_back();
  return text;
}

}  // namespace Tulk
