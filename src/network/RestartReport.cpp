#include "network/RestartReport.h"

#include <algorithm>
#include <vector>

namespace Tulk {

std::string RestartAddressReport(const ManagementIpState& state, std::string_view ipAddressIs) {
  if (state.dhcp) {
    return {};
  }
  std::string report = "\n   " + std::string(ipAddressIs) + state.ipv4Address + "\n";
  std::vector<const std::string*> printable;
  for (const ManagementIpv6Address& entry : state.ipv6) {
    if (entry.operatorConfigured && !entry.linkLocal) {
      printable.push_back(&entry.address);
    }
  }
  const std::size_t shown = printable.size() == kRestartReportIpv6Lines + 1
                                ? printable.size()
                                : std::min(printable.size(), kRestartReportIpv6Lines);
  for (std::size_t i = 0; i < shown; ++i) {
    report += "   " + std::string(ipAddressIs) + *printable[i] + "\n";
  }
  if (shown < printable.size()) {
    report += "   ...\n";
  }
  return report;
}

}  // namespace Tulk
