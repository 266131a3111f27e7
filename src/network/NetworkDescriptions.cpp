#include "network/NetworkDescriptions.h"

#include <algorithm>

#include "host/NetworkInventory.h"
#include "network/NetworkValidation.h"
#include "network/SearchSuffixes.h"
#include "render/StringFactory.h"
#include "render/TextId.h"

namespace Tulk {
namespace {

using HostMgr::Network::IpConfig;

constexpr char kWhite[] = "{color:white}";
constexpr char kGreyFrom[] = "{/color}{color:light-grey}";
constexpr char kEnd[] = "{/color}";

std::string OrNotSet(const std::string& value, StringFactory& strings) {
  return value.empty() ? strings.GetString(TextId::kNotSet) : value;
}

std::string AddressOrNotSet(const HostMgr::Network::IpAddress& address, StringFactory& strings) {
  return address.IsZero() ? strings.GetString(TextId::kNotSet) : address.GetStringAddress();
}

std::string Field(StringFactory& strings, std::uint32_t label, const std::string& value) {
  return std::string(strings.GetString(label)) + ": " + value + "\n";
}

std::string Automatic(StringFactory& strings, std::uint32_t kind) {
  return std::string(strings.GetString(TextId::kAutomatic)) + " (" + strings.GetString(kind) + ")";
}

}  // namespace

std::string DescribeAdapters(const std::vector<std::string>& adapters,
                             const std::vector<PnicRow>& pnics, StringFactory& strings) {
  std::string text = kWhite;
  for (const std::string& name : adapters) {
    auto row = std::find_if(pnics.begin(), pnics.end(),
                            [&](const PnicRow& pnic) { return pnic.name == name; });
    text += name;
    if (row != pnics.end()) {
      text += " (" + (row->hardwareLabel == kNotAvailable ? row->mac : row->hardwareLabel) + ")";
    }
    text += "\n";
  }
  if (adapters.empty()) {
    text += std::string(strings.GetString(TextId::kNoAdapter)) + "\n";
  }
  return text + "\n" + kGreyFrom + strings.GetString(TextId::kAdaptersDescription) + kEnd;
}

std::string DescribeVlan(std::uint16_t vlanId, StringFactory& strings) {
  const std::string id = vlanId == 0 ? strings.GetString(TextId::kNotSet) : std::to_string(vlanId);
  return kWhite + id + "\n\n" + kGreyFrom + strings.GetString(TextId::kVlanDescription) + kEnd;
}

std::string DescribeIpv4(const IpConfig& ip, StringFactory& strings) {
  const std::uint32_t mode = ip.GetDhcp()          ? TextId::kAutomatic
                             : ip.GetIpv4UseNone() ? TextId::kNone
                                                   : TextId::kManual;
  return kWhite + std::string(strings.GetString(mode)) + "\n\n" +
         Field(strings, TextId::kIpv4AddressLabel, AddressOrNotSet(ip.GetIpv4Address(), strings)) +
         Field(strings, TextId::kSubnetMaskLabel, AddressOrNotSet(ip.GetIpv4Netmask(), strings)) +
         Field(strings, TextId::kDefaultGatewayLabel,
               AddressOrNotSet(ip.GetIpv4Gateway(), strings)) +
         "\n" + kGreyFrom + strings.GetString(TextId::kIpv4Description) + kEnd;
}

std::string DescribeIpv6(bool enabled, bool enabledOnEntry, const IpConfig& ip,
                         StringFactory& strings) {
  std::string text = kWhite;
  text += strings.GetString(enabled ? TextId::kIpv6IsEnabled : TextId::kIpv6IsDisabled);
  text += "\n\n";
  if (!enabled || !enabledOnEntry) {
    return text + kGreyFrom +
           strings.GetString(enabled ? TextId::kIpv6AfterReboot : TextId::kIpv6RestartNeeded) +
           kEnd;
  }
  if (ip.GetDhcpv6()) {
    text += Automatic(strings, TextId::kDhcp);
  } else if (ip.GetRouterAdvertisement()) {
    text += Automatic(strings, TextId::kRouterAdvertised);
  } else {
    text += strings.GetString(TextId::kManual);
  }
  text += std::string("\n\n") + strings.GetString(TextId::kIpv6AddressesLabel) + ":\n";
  const auto& networks = ip.GetIpv6Networks();
  for (std::size_t i = 0; i < networks.size() && i < kShownIpv6Addresses; ++i) {
    text += networks[i].ToString() + "\n";
  }
  if (networks.size() > kShownIpv6Addresses) {
    text += "...\n";
  }
  if (networks.empty()) {
    text += std::string(strings.GetString(TextId::kNotSet)) + "\n";
  }
  const auto& gateway = ip.GetIpv6Gateway();
  text +=
      std::string("\n") + strings.GetString(TextId::kDefaultGatewayLabel) + ":\n" +
      (gateway.IsZero() ? strings.GetString(TextId::kNotSet) : gateway.GetScopedStringAddress()) +
      "\n\n";
  return text + kGreyFrom + strings.GetString(TextId::kIpv6Description) + kEnd;
}

std::string DescribeDns(const ManagementSettings& settings, StringFactory& strings) {
  const std::uint32_t mode = settings.ip.GetDnsFromDhcp() ? TextId::kAutomatic : TextId::kManual;
  const std::uint32_t second = SecondServerLabel(settings.primaryDns, settings.alternateDns);
  return kWhite + std::string(strings.GetString(mode)) + "\n\n" +
         strings.GetString(TextId::kPrimaryDnsLabel) + ":\n" +
         OrNotSet(settings.primaryDns, strings) + "\n" + strings.GetString(second) + ":\n" +
         OrNotSet(settings.alternateDns, strings) + "\n\n" +
         strings.GetString(TextId::kHostnameLabel) + "\n" + settings.hostname + "\n\n" + kGreyFrom +
         strings.GetString(TextId::kDnsDescription) + kEnd;
}

std::string DescribeSuffixes(const std::string& suffixes, StringFactory& strings) {
  return kWhite + OrNotSet(JoinSuffixes(SplitSuffixes(suffixes)), strings) + "\n\n" + kGreyFrom +
         strings.GetString(TextId::kSuffixesDescription) + kEnd;
}

}  // namespace Tulk
