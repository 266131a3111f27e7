// The plain network values: parsing and validity rules the dialogs rely
// on, and the IP configuration's mode rules.

#include <gtest/gtest.h>

#include "platform/api/HostMgrException.h"
#include "platform/api/IpConfig.h"
#include "platform/api/Ipv6Network.h"
#include "platform/api/MacAddress.h"
#include "platform/api/NicTeamingPolicy.h"
#include "platform/api/StrPrintf.h"

namespace {

using namespace HostMgr::Network;

TEST(Ipv4Address, ValidityRules) {
  const struct {
    const char* text;
    bool valid;
  } cases[] = {
      {"10.0.0.1", true},     {"255.255.255.255", true}, {"0.0.0.0", true},    {"10.0.1", false},
      {"10.0.0.01", false},   {"256.0.0.1", false},      {"10.0.0.1 ", false}, {"", false},
      {"10.0.0.1/24", false}, {"a.b.c.d", false},        {"::1", false},       {"1.2.3.4.5", false},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(Ipv4Address::IsValidAddress(c.text), c.valid) << c.text;
  }
  EXPECT_THROW(Ipv4Address("10.0.1"), HostMgr::Lib::HostMgrException);
}

TEST(Ipv4Address, NetmaskMustBeContiguousAndNonEmpty) {
  const struct {
    const char* text;
    bool netmask;
  } cases[] = {
      {"255.255.255.0", true},  {"255.255.255.255", true}, {"128.0.0.0", true},
      {"255.255.254.0", true},  {"0.0.0.0", false},        {"255.0.255.0", false},
      {"255.255.255.1", false}, {"0.255.255.255", false},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(Ipv4Address(c.text).IsValidNetmask(), c.netmask) << c.text;
  }
}

TEST(Ipv4Address, ValueAndTextRoundTrip) {
  Ipv4Address address(0x0A141E29u);
  EXPECT_EQ(address.GetStringAddress(), "10.20.30.41");
  EXPECT_EQ(Ipv4Address("10.20.30.41").GetValue(), 0x0A141E29u);
  EXPECT_TRUE(Ipv4Address().IsZero());
  EXPECT_EQ(Ipv4Address().GetStringAddress(), "0.0.0.0");
}

TEST(Ipv6Address, ValidityZoneAndLinkLocal) {
  const struct {
    const char* text;
    bool valid;
    bool linkLocal;
  } cases[] = {
      {"fe80::1", true, true},          {"fe80::1%hyk0", true, true},
      {"febf::1", true, true},          {"fec0::1", true, false},
      {"2001:db8::41", true, false},    {"::", true, false},
      {"::ffff:10.0.0.1", true, false}, {"fe80::1%", false, false},
      {"2001:db8::/64", false, false},  {"2001:db8:::1", false, false},
      {"10.0.0.1", false, false},       {"", false, false},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(Ipv6Address::IsValidAddress(c.text), c.valid) << c.text;
    if (c.valid) {
      EXPECT_EQ(Ipv6Address(c.text).IsLinkLocal(), c.linkLocal) << c.text;
    }
  }
  Ipv6Address scoped("FE80::0001%hyk0");
  EXPECT_EQ(scoped.GetStringAddress(), "fe80::1");
  EXPECT_EQ(scoped.GetScopedStringAddress(), "fe80::1%hyk0");
  EXPECT_FALSE(scoped == Ipv6Address("fe80::1")) << "the zone is part of the address";
}

TEST(IpAddress, ParseKeepsTheFamilyThroughOwnership) {
  auto v4 = IpAddress::Parse("10.20.30.2");
  auto v6 = IpAddress::Parse("2001:db8::2");
  ASSERT_TRUE(v4 && v6);
  EXPECT_EQ(v4->GetKind(), IpAddress::kIpv4);
  EXPECT_EQ(v6->GetKind(), IpAddress::kIpv6);
  EXPECT_EQ(IpAddress::Parse("host.example.net"), nullptr);
  std::unique_ptr<IpAddress> copy = v6->Clone();
  EXPECT_EQ(copy->GetKind(), IpAddress::kIpv6);
  EXPECT_EQ(copy->GetStringAddress(), "2001:db8::2");
  EXPECT_NE(dynamic_cast<Ipv6Address*>(copy.get()), nullptr);
  EXPECT_FALSE(*v4 == *v6);
}

TEST(Ipv6Network, AddressAndPrefixRules) {
  const struct {
    const char* text;
    bool valid;
  } cases[] = {
      {"2001:db8::5/64", true}, {"2001:db8::5/128", true}, {"2001:db8::5/1", true},
      {"2001:db8::5", false},   {"2001:db8::5/0", false},  {"2001:db8::5/129", false},
      {"2001:db8::5/", false},  {"2001:db8::5/6x", false}, {"fe80::5%hyk0/64", false},
      {"10.0.0.1/24", false},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(Ipv6Network::IsValidAddressAndNetmask(c.text), c.valid) << c.text;
  }
  EXPECT_EQ(Ipv6Network::FromString("fe80::5/64").GetScope(), Ipv6Network::kScopeLinkLocal);
  Ipv6Network global = Ipv6Network::FromString("2001:DB8::5/64");
  EXPECT_EQ(global.GetScope(), Ipv6Network::kScopeGlobal);
  EXPECT_EQ(global.GetAddressType(), Ipv6Network::kTypeStatic);
  EXPECT_EQ(global.ToString(), "2001:db8::5/64");
}

TEST(MacAddress, ParseAndPrint) {
  EXPECT_EQ(MacAddress::FromString("02:6B:4E:10:20:01").GetStringAddress(), "02:6b:4e:10:20:01");
  EXPECT_EQ(MacAddress::FromString("02-6b-4e-10-20-01").GetStringAddress(), "02:6b:4e:10:20:01");
  for (const char* bad : {"02:6b:4e:10:20", "02:6b:4e:10:20:0g", "02:6b-4e:10:20:01", ""}) {
    EXPECT_FALSE(MacAddress::IsValidAddress(bad)) << bad;
  }
  EXPECT_TRUE(MacAddress().IsZero());
}

TEST(IpConfig, Ipv4ModesExcludeEachOtherButKeepStaticValues) {
  IpConfig config;
  config.SetIpv4Address(Ipv4Address("10.0.0.5"));
  EXPECT_TRUE(config.IsIpv4Static());
  config.SetDhcp(true);
  config.SetIpv4UseNone(true);
  EXPECT_FALSE(config.GetDhcp()) << "none clears DHCP";
  config.SetDhcp(true);
  EXPECT_FALSE(config.GetIpv4UseNone()) << "DHCP clears none";
  config.SetDhcp(false);
  EXPECT_TRUE(config.IsIpv4Static());
  EXPECT_EQ(config.GetIpv4Address().GetStringAddress(), "10.0.0.5");
}

TEST(IpConfig, Ipv6NetworkListKeepsOneEntryPerAddress) {
  IpConfig config;
  config.AddIpv6Network(Ipv6Network::FromString("2001:db8::5/64"));
  config.AddIpv6Network(Ipv6Network::FromString("2001:db8::5/48"));
  config.AddIpv6Network(Ipv6Network(Ipv6Address("2001:db8::7"), 64, Ipv6Network::kTypeAutoconf));
  EXPECT_EQ(config.GetIpv6Networks().size(), 2u);
  config.ClearStaticIpv6Networks();
  ASSERT_EQ(config.GetIpv6Networks().size(), 1u);
  EXPECT_EQ(config.GetIpv6Networks()[0].GetAddressType(), Ipv6Network::kTypeAutoconf);
  EXPECT_TRUE(config.RemoveIpv6Network(Ipv6Address("2001:db8::7")));
  EXPECT_FALSE(config.RemoveIpv6Network(Ipv6Address("2001:db8::7")));
}

TEST(NicTeamingPolicy, ActiveAndStandbySplitTheOrder) {
  NicTeamingPolicy policy({"hynic0", "hynic1", "hynic2"}, 2);
  EXPECT_EQ(policy.GetActiveUplinks(), (std::vector<std::string>{"hynic0", "hynic1"}));
  EXPECT_EQ(policy.GetStandbyUplinks(), (std::vector<std::string>{"hynic2"}));
  policy.SetMaxActiveUplinks(5);
  EXPECT_EQ(policy.GetActiveUplinks().size(), 3u);
  EXPECT_TRUE(policy.GetStandbyUplinks().empty());
}

TEST(StrPrintf, FormatsBeyondTheSmallBuffer) {
  EXPECT_EQ(HostMgr::Misc::StrPrintf("%lu.%lu %cB", 2ul, 7ul, 'G'), "2.7 GB");
  const std::string wide = HostMgr::Misc::StrPrintf("%0600d", 1);
  EXPECT_EQ(wide.size(), 600u);
  EXPECT_EQ(wide.back(), '1');
}

}  // namespace
