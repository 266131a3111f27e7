#include "screens/WelcomeSummary.h"

#include <algorithm>
#include <cctype>
#include <cstdio>

#include "host/NetworkInventory.h"
#include "render/StringFactory.h"
#include "render/TextId.h"

namespace Tulk {
namespace {

// roundf() for the non-negative values of the memory line, without pulling
// the maths library into the console for one call: the sum is exact in
// double precision and truncation is floor for non-negative values.
float RoundHalfUp(float value) {
  // NOLINTNEXTLINE(bugprone-incorrect-roundings): the values are never negative
  return static_cast<float>(static_cast<std::uint64_t>(static_cast<double>(value) + 0.5));
}

constexpr std::uint32_t kAddressHeading = TextId::kToManageThisHost;
constexpr std::uint32_t kDhcpWarning = TextId::kDhcpWarning;
constexpr std::uint32_t kAuditWarning = TextId::kAuditModeWarning;
constexpr std::uint32_t kQualifierDhcp = TextId::kDhcp;
constexpr std::uint32_t kQualifierStatic = TextId::kStatic;
constexpr std::uint32_t kQualifierAutoconf = TextId::kAutoconf;
constexpr std::uint32_t kQualifierWaiting = TextId::kWaitingForDhcp;

std::string Qualifier(StringFactory& strings, std::uint32_t id) {
  return std::string("(") + strings.GetString(id) + ")";
}

}  // namespace

std::string WelcomeSummary::NormaliseSpace(std::string_view text) {
  std::string result;
  bool pendingBlank = false;
  for (char c : text) {
    if (std::isspace(static_cast<unsigned char>(c)) != 0) {
      pendingBlank = !result.empty();
      continue;
    }
    if (pendingBlank) {
      result += ' ';
      pendingBlank = false;
    }
    result += c;
  }
  return result;
}

std::string WelcomeSummary::HardwareLine(std::string_view vendor, std::string_view product) {
  const std::string normalVendor = NormaliseSpace(vendor);
  std::string normalProduct = NormaliseSpace(product);
  if (normalProduct.rfind(normalVendor, 0) == 0) {
    return normalProduct;
  }
  return normalVendor + " " + normalProduct;
}

std::string WelcomeSummary::ProcessorLine(int packages, std::string_view model) {
  if (packages < 2) {
    return NormaliseSpace(model);
  }
  return std::to_string(packages) + " x " + NormaliseSpace(model);
}

std::string WelcomeSummary::MemoryLine(std::uint64_t bytes) {
  static constexpr char kUnits[] = "MGTP";
  std::size_t unit = 0;
  std::uint64_t divisor = 1048576;
  while (unit + 1 < sizeof kUnits - 1 && bytes / 1024 >= divisor) {
    ++unit;
    divisor *= 1024;
  }
  const float tenths = RoundHalfUp(static_cast<float>(bytes) * 10.0f / static_cast<float>(divisor));
  // "%g" is the stream's default format for a float: 16, 1.5, 15.9.
  char line[48];
  std::snprintf(line, sizeof line, "%g %ciB Memory", static_cast<double>(tenths / 10.0f),
                kUnits[unit]);
  return line;
}

std::string WelcomeSummary::Ipv6Lines(const std::vector<Ipv6Entry>& entries,
                                      StringFactory& strings) {
  std::vector<std::string> lines;
  std::size_t taken = 0;
  while (taken < entries.size() && (taken < kMaxIpv6Lines || entries.size() == 5)) {
    const Ipv6Entry& entry = entries[taken++];
    std::string line = "https://[" + entry.address + "]/ ";
    switch (entry.type) {
      case 0:
        line += Qualifier(strings, kQualifierStatic);
        break;
      case 9:
        line += Qualifier(strings, kQualifierDhcp);
        break;
      case 7:
        line += Qualifier(strings, kQualifierAutoconf);
        break;
      default:
        break;
    }
    lines.push_back(line + "\n");
  }
  std::sort(lines.begin(), lines.end());
  std::string text;
  for (const std::string& line : lines) {
    text += line;
  }
  if (taken == kMaxIpv6Lines && taken < entries.size()) {
    text += "...\n";
  }
  return text;
}

std::string WelcomeSummary::AddressBlock(const WelcomeFacts& facts, StringFactory& strings) {
  if (!facts.hasPhysicalNics) {
    return kNoAdapterText;
  }
  std::string text = strings.GetString(kAddressHeading);
  if (!facts.hostname.empty() && facts.hostname != "localhost") {
    text += "\nhttps://" + facts.hostname + "/ ";
  }
  if (!facts.ipv4None) {
    std::uint32_t qualifier = kQualifierStatic;
    if (facts.dhcp) {
      qualifier = facts.ipv4Address == "0.0.0.0" ? kQualifierWaiting : kQualifierDhcp;
    }
    text += "\nhttps://" + facts.ipv4Address + "/ " + Qualifier(strings, qualifier);
  }
  if (facts.kernelIpv6Enabled) {
    text += "\n" + Ipv6Lines(facts.ipv6, strings);
  }
  return text;
}

std::string WelcomeSummary::Warning(const WelcomeFacts& facts, StringFactory& strings) {
  if (facts.auditMode) {
    return strings.GetString(kAuditWarning);
  }
  if (facts.dhcp && facts.ipv4Address == "0.0.0.0") {
    return strings.GetString(kDhcpWarning);
  }
  return {};
}

std::string WelcomeSummary::ProcessorAndMemory(const WelcomeFacts& facts) {
  return ProcessorLine(facts.cpuPackages, facts.cpuModel) + "\n" +
         (facts.memoryBytes == 0 ? std::string(kNotAvailable) : MemoryLine(facts.memoryBytes));
}

std::string WelcomeSummary::Footer(StringFactory& strings) {
  return std::string("<F2> {color:dark-grey}") + strings.GetString(TextId::kWelcomeCustomizeKey) +
         "{/color}{align:right}<F12> {color:dark-grey}" +
         strings.GetString(TextId::kWelcomeShutdownKey) + "{/color}{/align}";
}

}  // namespace Tulk
