#pragma once
/// The texts of the welcome screen's standard summary, built from the
/// host's facts (WelcomeFacts.h). Pure functions: no terminal, no host.

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "host/WelcomeFacts.h"

namespace Tulk {

class StringFactory;

class WelcomeSummary {
 public:
  /// The address block's text when the host has no physical NIC.
  static constexpr char kNoAdapterText[] =
      "No compatible network adapter found. Please consult the product's Hardware "
      "Compatibility Guide (HCG) for a list of supported adapters.";
  /// The system alert raised, once per process, for a host without
  /// physical NICs.
  static constexpr char kNoAdapterAlert[] = "No compatible network adapter found.";
  /// The most IPv6 addresses listed (but see Ipv6Lines()).
  static constexpr std::size_t kMaxIpv6Lines = 4;

  /// Runs of white space become one blank; leading and trailing white
  /// space is dropped.
  static std::string NormaliseSpace(std::string_view text);

  /// Vendor and product, each normalised: the product alone when it begins
  /// with the vendor's name ("Acme" and "Acme Server 9"), otherwise vendor,
  /// blank, product ("Acme Inc. Acme Server 9"). An empty vendor gives the
  /// product alone.
  static std::string HardwareLine(std::string_view vendor, std::string_view product);

  /// The normalised model name; with 2 or more packages prefixed by the
  /// count and " x ".
  static std::string ProcessorLine(int packages, std::string_view model);

  /// "16 GiB Memory": the largest unit of M, G, T and P (1 MiB, x1024 each,
  /// at most up to P) that the size reaches at least 1024 times over the
  /// previous one, the value to one decimal rounded to nearest in single
  /// precision and written as a stream writes a float ("16", "1.5",
  /// "15.9").
  static std::string MemoryLine(std::uint64_t bytes);

  /// The IPv6 lines of the address block, each "https://[address]/ " with
  /// a qualifier by type ("(STATIC)" 0, "(DHCP)" 9, "(AUTOCONF)" 7, none
  /// otherwise) and a newline. At most four addresses are taken, in the
  /// host's order, except that a list of exactly five is taken whole; the
  /// taken lines are sorted by plain string order, and "...\n" follows
  /// when four were taken and more remain.
  static std::string Ipv6Lines(const std::vector<Ipv6Entry>& entries, StringFactory& strings);

  /// The address block: the heading (141); the host name line unless the
  /// name is empty or "localhost"; the IPv4 line with its qualifier unless
  /// IPv4 is off; then, when the kernel has IPv6 enabled, a newline and the
  /// IPv6 lines. A host without physical NICs gets kNoAdapterText instead.
  static std::string AddressBlock(const WelcomeFacts& facts, StringFactory& strings);

  /// The warning area: the audit-mode warning (143) in audit mode, else the
  /// DHCP-failure warning (142) while DHCP has no address, else empty.
  static std::string Warning(const WelcomeFacts& facts, StringFactory& strings);

  /// The processor line, a newline and the memory line ("N/A" when the
  /// memory size is unknown, 0).
  static std::string ProcessorAndMemory(const WelcomeFacts& facts);

  /// The footer: "<F2> Customize System/View Logs" left, "<F12> Shut
  /// Down/Restart" right.
  static std::string Footer(StringFactory& strings);
};

}  // namespace Tulk
