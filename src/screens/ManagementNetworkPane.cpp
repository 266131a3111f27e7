#include "screens/ManagementNetworkPane.h"

#include "render/StringFactory.h"
#include "render/TextId.h"

namespace Tulk {

std::string FormatManagementNetworkView(const ManagementNetworkView& view, StringFactory& strings,
                                        int width) {
  std::string description = strings.GetString(TextId::kManagementNetworkDescription);
  if (!view.found) {
    return description;
  }
  auto label = [&](std::uint32_t id) { return std::string(strings.GetString(id)) + ":\n"; };
  auto value = [width](const std::string& text) {
    const bool fits = static_cast<int>(text.size()) + 2 <= width;
    return std::string(fits ? "  " : "") + "{color:white}" + text + "{/color}\n";
  };
  std::string text = label(TextId::kHostnameLabel) + value(view.hostname) + "\n";
  text +=
      label(TextId::kIpv4AddressLabel) +
      value(view.ipv4Address == "0.0.0.0" ? strings.GetString(TextId::kNotSet) : view.ipv4Address);
  if (view.dhcp) {
    text += std::string(strings.GetString(TextId::kDhcpIdentity)) + "\n";
  }
  if (!view.ipv6Addresses.empty()) {
    text += "\n" + label(TextId::kIpv6AddressesLabel);
    for (const std::string& address : view.ipv6Addresses) {
      text += value(address);
    }
  }
  return text + "\n" + description;
}

}  // namespace Tulk
