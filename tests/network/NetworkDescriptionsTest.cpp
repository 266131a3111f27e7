// The right half of the management network window, entry by entry, with
// the catalogue's texts.

#include <gtest/gtest.h>

#include "network/NetworkDescriptions.h"
#include "platform/api/Ipv6Network.h"
#include "render/StringFactory.h"
#include "render/TextId.h"

namespace Tulk {
namespace {

using HostMgr::Network::IpConfig;
using HostMgr::Network::Ipv4Address;
using HostMgr::Network::Ipv6Address;
using HostMgr::Network::Ipv6Network;

class NetworkDescriptionsTest : public ::testing::Test {
 protected:
  StringFactory& strings_ = *GetStringFactory("en_US");
  std::string Text(std::uint32_t id) { return strings_.GetString(id); }
  std::string Grey(std::uint32_t id) {
    return "{/color}{color:light-grey}" + Text(id) + "{/color}";
  }
};

TEST_F(NetworkDescriptionsTest, AdaptersNameTheirLabelOrMac) {
  const std::vector<PnicRow> pnics = {
      {"hynic0", "Kestrel Networks KN-X540", "02:6b:4e:10:20:01", "Connected", "vSwitch0"},
      {"hynic2", "N/A", "02:6b:4e:10:30:01", "Disconnected", ""},
  };
  EXPECT_EQ(DescribeAdapters({"hynic2", "hynic0", "hynic9"}, pnics, strings_),
            "{color:white}hynic2 (02:6b:4e:10:30:01)\nhynic0 (Kestrel Networks KN-X540)\n"
            "hynic9\n\n" +
                Grey(TextId::kAdaptersDescription));
  EXPECT_EQ(DescribeAdapters({}, pnics, strings_),
            "{color:white}No adapter\n\n" + Grey(TextId::kAdaptersDescription));
}

TEST_F(NetworkDescriptionsTest, VlanAndSuffixesShowNotSetWhenEmpty) {
  EXPECT_EQ(DescribeVlan(0, strings_), "{color:white}Not set\n\n" + Grey(TextId::kVlanDescription));
  EXPECT_EQ(DescribeVlan(4095, strings_), "{color:white}4095\n\n" + Grey(TextId::kVlanDescription));
  EXPECT_EQ(DescribeSuffixes("", strings_),
            "{color:white}Not set\n\n" + Grey(TextId::kSuffixesDescription));
  EXPECT_EQ(
      DescribeSuffixes("a.example  b.example,c.example", strings_),
      "{color:white}a.example, b.example, c.example\n\n" + Grey(TextId::kSuffixesDescription));
}

TEST_F(NetworkDescriptionsTest, Ipv4ModeAndAddresses) {
  struct Case {
    bool dhcp;
    bool none;
    const char* gateway;
    const char* expected;
  };
  const Case cases[] = {
      {false, false, "10.0.0.1",
       "{color:white}Manual\n\nIPv4 Address: 10.0.0.5\nSubnet Mask: 255.255.255.0\n"
       "Default Gateway: 10.0.0.1\n\n"},
      {true, false, "0.0.0.0",
       "{color:white}Automatic\n\nIPv4 Address: 10.0.0.5\nSubnet Mask: 255.255.255.0\n"
       "Default Gateway: Not set\n\n"},
      {false, true, "0.0.0.0",
       "{color:white}None\n\nIPv4 Address: 10.0.0.5\nSubnet Mask: 255.255.255.0\n"
       "Default Gateway: Not set\n\n"},
  };
  for (const Case& c : cases) {
    IpConfig ip;
    ip.SetIpv4Address(Ipv4Address("10.0.0.5"));
    ip.SetIpv4Netmask(Ipv4Address("255.255.255.0"));
    ip.SetIpv4Gateway(Ipv4Address(c.gateway));
    ip.SetDhcp(c.dhcp);
    if (c.none) {
      ip.SetIpv4UseNone(true);
    }
    EXPECT_EQ(DescribeIpv4(ip, strings_), c.expected + Grey(TextId::kIpv4Description));
  }
}

TEST_F(NetworkDescriptionsTest, Ipv6ShowsTheRestartWhileTheFlagIsPending) {
  IpConfig ip;
  EXPECT_EQ(DescribeIpv6(false, true, ip, strings_),
            "{color:white}IPv6 is disabled.\n\n" + Grey(TextId::kIpv6RestartNeeded));
  EXPECT_EQ(DescribeIpv6(false, false, ip, strings_),
            "{color:white}IPv6 is disabled.\n\n" + Grey(TextId::kIpv6RestartNeeded));
  EXPECT_EQ(DescribeIpv6(true, false, ip, strings_),
            "{color:white}IPv6 is enabled.\n\n" + Grey(TextId::kIpv6AfterReboot));
}

TEST_F(NetworkDescriptionsTest, Ipv6ModesAddressesAndGateway) {
  IpConfig ip;
  EXPECT_EQ(DescribeIpv6(true, true, ip, strings_),
            "{color:white}IPv6 is enabled.\n\nManual\n\nIPv6 Addresses:\nNot set\n\n"
            "Default Gateway:\nNot set\n\n" +
                Grey(TextId::kIpv6Description));

  ip.SetRouterAdvertisement(true);
  for (int i = 1; i <= 5; ++i) {
    ip.AddIpv6Network(Ipv6Network::FromString("2001:db8::" + std::to_string(i) + "/64"));
  }
  ip.SetIpv6Gateway(Ipv6Address("fe80::1%hyk0"));
  EXPECT_EQ(DescribeIpv6(true, true, ip, strings_),
            "{color:white}IPv6 is enabled.\n\nAutomatic (Router advertised)\n\nIPv6 Addresses:\n"
            "2001:db8::1/64\n2001:db8::2/64\n2001:db8::3/64\n2001:db8::4/64\n...\n\n"
            "Default Gateway:\nfe80::1%hyk0\n\n" +
                Grey(TextId::kIpv6Description));

  ip.SetDhcpv6(true);
  EXPECT_NE(DescribeIpv6(true, true, ip, strings_).find("\n\nAutomatic (DHCP)\n\n"),
            std::string::npos);
}

TEST_F(NetworkDescriptionsTest, DnsLabelsTheSecondServerByItsKind) {
  ManagementSettings settings;
  settings.primaryDns = "10.20.30.2";
  settings.alternateDns = "2001:db8::53";
  settings.hostname = "tavi-01";
  EXPECT_EQ(DescribeDns(settings, strings_),
            "{color:white}Manual\n\nPrimary DNS Server:\n10.20.30.2\nIPv6 DNS Server:\n"
            "2001:db8::53\n\nHostname\ntavi-01\n\n" +
                Grey(TextId::kDnsDescription));
  settings.primaryDns.clear();
  settings.alternateDns.clear();
  settings.ip.SetDnsFromDhcp(true);
  EXPECT_EQ(DescribeDns(settings, strings_),
            "{color:white}Automatic\n\nPrimary DNS Server:\nNot set\nAlternate DNS Server:\n"
            "Not set\n\nHostname\ntavi-01\n\n" +
                Grey(TextId::kDnsDescription));
}

}  // namespace
}  // namespace Tulk
