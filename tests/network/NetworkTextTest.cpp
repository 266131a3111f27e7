// The text and choices of the restart report and the network test: which
// addresses the restart lists, which targets the test pre-fills and in which
// order, and how a ping target is written and run.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "host/NetworkTestTargets.h"
#include "network/NetworkTestText.h"
#include "network/RestartReport.h"

namespace {

using namespace Tulk;

constexpr char kIs[] = "IP address is ";

ManagementIpv6Address Static(const std::string& address) {
  return {address, true, false};
}

TEST(RestartReportTest, AddressLines) {
  const ManagementIpv6Address linkLocal{"fe80::1", false, true};
  const ManagementIpv6Address autoconf{"2001:db8::a", false, false};
  const ManagementIpv6Address staticLinkLocal{"fe80::2", true, true};
  struct Case {
    const char* what;
    bool dhcp;
    std::vector<ManagementIpv6Address> ipv6;
    std::string report;
  };
  const std::string v4 = "\n   IP address is 10.0.0.5\n";
  const Case cases[] = {
      {"DHCP: nothing at all", true, {Static("2001:db8::1")}, ""},
      {"no IPv6", false, {}, v4},
      {"derived and link-local addresses are left out",
       false,
       {linkLocal, autoconf, staticLinkLocal, Static("2001:db8::1")},
       v4 + "   IP address is 2001:db8::1\n"},
      {"two",
       false,
       {Static("2001:db8::1"), Static("2001:db8::2")},
       v4 + "   IP address is 2001:db8::1\n   IP address is 2001:db8::2\n"},
      {"exactly three printable are shown whole, whatever else the list holds",
       false,
       {linkLocal, Static("2001:db8::1"), autoconf, Static("2001:db8::2"), Static("2001:db8::3")},
       v4 + "   IP address is 2001:db8::1\n   IP address is 2001:db8::2\n"
            "   IP address is 2001:db8::3\n"},
      {"four: two and the ellipsis",
       false,
       {Static("2001:db8::1"), Static("2001:db8::2"), Static("2001:db8::3"), Static("2001:db8::4")},
       v4 + "   IP address is 2001:db8::1\n   IP address is 2001:db8::2\n   ...\n"},
  };
  for (const Case& c : cases) {
    ManagementIpState state{"hyk0", c.dhcp, "10.0.0.5", c.ipv6};
    EXPECT_EQ(RestartAddressReport(state, kIs), c.report) << c.what;
  }
}

TEST(PingTargetTest, DefaultOrderAndChoice) {
  struct Case {
    const char* what;
    KnownTestAddresses known;
    std::vector<std::string> targets;
  };
  const Case cases[] = {
      {"gateway, then the servers in their order",
       {"10.0.0.1", {{"10.0.0.3", false}, {"10.0.0.2", false}}, true, ""},
       {"10.0.0.1", "10.0.0.3", "10.0.0.2"}},
      {"IPv4 first; only three are taken",
       {"10.0.0.1",
        {{"2001:db8::53", true}, {"10.0.0.2", false}, {"10.0.0.3", false}},
        true,
        "fe80::1"},
       {"10.0.0.1", "10.0.0.2", "10.0.0.3"}},
      {"the IPv6 gateway before the IPv6 servers",
       {"10.0.0.1", {{"2001:db8::53", true}}, true, "fe80::1"},
       {"10.0.0.1", "fe80::1", "2001:db8::53"}},
      {"IPv6 off in the kernel: no IPv6 target",
       {"10.0.0.1", {{"2001:db8::53", true}}, false, "fe80::1"},
       {"10.0.0.1"}},
      {"zero, empty and repeated addresses are passed over",
       {"0.0.0.0", {{"10.0.0.2", false}, {"10.0.0.2", false}, {"", false}}, true, "::"},
       {"10.0.0.2"}},
      {"nothing known", {}, {}},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(OrderPingTargets(c.known), c.targets) << c.what;
  }
  EXPECT_EQ(TestHostName("tavi-01", "lab.example.net"), "tavi-01.lab.example.net");
  EXPECT_EQ(TestHostName("tavi-01", ""), "tavi-01");
}

TEST(PingTargetTest, ZoneCommandAndLine) {
  struct Case {
    const char* typed;
    const char* interfaceName;
    const char* zone;
    const char* command;
  };
  const Case cases[] = {
      {"fe80::1", "hyk0", "%hyk0", "/bin/hykping -c 3 -I hyk0 fe80::1%hyk0"},
      {"FE80::1", "hyk0", "%hyk0", "/bin/hykping -c 3 -I hyk0 FE80::1%hyk0"},
      {"febf::1", "hyk0", "%hyk0", "/bin/hykping -c 3 -I hyk0 febf::1%hyk0"},
      {"fec0::1", "hyk0", "", "/bin/hykping -c 3 -I hyk0 fec0::1"},
      {"fe80::1%vmk9", "hyk0", "", "/bin/hykping -c 3 -I hyk0 fe80::1%vmk9"},
      {"10.0.0.1", "hyk0", "", "/bin/hykping -c 3 -I hyk0 10.0.0.1"},
      {"fe80::1", "", "", "/bin/hykping -c 3 fe80::1"},
      {"10.0.0.1", "", "", "/bin/hykping -c 3 10.0.0.1"},
  };
  for (const Case& c : cases) {
    const std::optional<PingTarget> target = ParsePingTarget(c.typed);
    ASSERT_TRUE(target) << c.typed;
    const std::string zone = ZoneSuffix(*target, c.interfaceName);
    EXPECT_EQ(zone, c.zone) << c.typed;
    EXPECT_EQ(PingCommand(c.interfaceName, c.typed + zone), c.command) << c.typed;
  }
  for (const char* bad : {"10.0.0", "10.0.0.256", "hyk0", "fe80::1::2", "::1%"}) {
    EXPECT_FALSE(ParsePingTarget(bad)) << bad;
  }
  EXPECT_EQ(PingingLine("Pinging address", 3, "fe80::1", "%hyk0"),
            "Pinging address #3 (fe80::1%hyk0).");
  EXPECT_EQ(VerdictLine("OK."), "{align:right}OK.{/align}\n");
}

}  // namespace
