// Pure logic of the management network: suffix splitting, the dialogs'
// checks, what counts as a change, and the adapter list's rows.

#include <gtest/gtest.h>

#include "network/AdapterInfoDialog.h"
#include "network/AdaptersDialog.h"
#include "network/NetworkChanges.h"
#include "network/NetworkValidation.h"
#include "network/SearchSuffixes.h"
#include "platform/api/Ipv6Network.h"
#include "render/TextId.h"

namespace Tulk {
namespace {

using HostMgr::Network::Ipv4Address;
using HostMgr::Network::Ipv6Address;
using HostMgr::Network::Ipv6Network;
using Names = std::vector<std::string>;

TEST(SearchSuffixesTest, SplitAtBlanksAndCommasInAnyMix) {
  struct Case {
    const char* text;
    Names names;
  };
  const Case cases[] = {
      {"", {}},
      {" , ,\t", {}},
      {"lab.example.net", {"lab.example.net"}},
      {"a.example, b.example  c.example", {"a.example", "b.example", "c.example"}},
      {"a.example,b.example,,c.example,", {"a.example", "b.example", "c.example"}},
      {"\ta.example\nb.example", {"a.example", "b.example"}},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(SplitSuffixes(c.text), c.names) << '"' << c.text << '"';
  }
  EXPECT_EQ(JoinSuffixes({"a.example", "b.example"}), "a.example, b.example");
  EXPECT_EQ(JoinSuffixes({}), "");
}

TEST(NetworkValidationTest, StaticIpv4IsCheckedAddressMaskGateway) {
  struct Case {
    const char* address;
    const char* netmask;
    const char* gateway;
    std::optional<Ipv4Field> invalid;
  };
  const Case cases[] = {
      {"10.0.0.5", "255.255.255.0", "10.0.0.1", std::nullopt},
      {"10.0.0.5", "255.255.255.255", "10.0.0.1", std::nullopt},
      {"10.0.0", "255.255.255.0", "10.0.0.1", Ipv4Field::kAddress},
      {"", "255.255.255.0", "10.0.0.1", Ipv4Field::kAddress},
      {"10.0.0.256", "junk", "", Ipv4Field::kAddress},               // the first failure only
      {"10.0.0.5", "255.0.255.0", "10.0.0.1", Ipv4Field::kNetmask},  // an address, not a mask
      {"10.0.0.5", "0.0.0.0", "10.0.0.1", Ipv4Field::kNetmask},
      {"10.0.0.5", "255.255.255.0", "", Ipv4Field::kGateway},  // empty is invalid when static
      {"10.0.0.5", "255.255.255.0", "10.0.0.01", Ipv4Field::kGateway},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(FirstInvalidIpv4(c.address, c.netmask, c.gateway), c.invalid)
        << c.address << " " << c.netmask << " " << c.gateway;
  }
}

TEST(NetworkValidationTest, StaticIpv6InputsFromTheFirstDownThenGateway) {
  using Kind = Ipv6Problem::Kind;
  struct Case {
    std::array<std::string, kStaticIpv6Inputs> addresses;
    const char* gateway;
    std::optional<std::pair<std::size_t, Kind>> problem;
  };
  const Case cases[] = {
      {{"2001:db8::5/64", "", ""}, "", std::nullopt},
      {{"", "", ""}, "fe80::1%hyk0", std::nullopt},  // the gateway may carry a zone
      {{"fe80::5/64", "", ""}, "", std::pair{0, Kind::kLinkLocal}},
      {{"febf::5/64", "", ""}, "", std::pair{0, Kind::kLinkLocal}},  // still fe80::/10
      {{"fec0::5/64", "", ""}, "", std::nullopt},
      {{"2001:db8::5", "", ""}, "", std::pair{0, Kind::kInvalidAddress}},  // no prefix
      {{"2001:db8::5/129", "", ""}, "", std::pair{0, Kind::kInvalidAddress}},
      {{"2001:db8::5/64", "", "fe80::9/64"}, "", std::pair{2, Kind::kLinkLocal}},
      {{"2001:db8::5/64", "bad/64", "fe80::9/64"}, "", std::pair{1, Kind::kInvalidAddress}},
      {{"2001:db8::5/64", "", ""}, "2001:db8::1/64", std::pair{3, Kind::kInvalidGateway}},
      {{"2001:db8::5/64", "", ""}, "10.0.0.1", std::pair{3, Kind::kInvalidGateway}},
  };
  for (const Case& c : cases) {
    const std::optional<Ipv6Problem> problem = FirstInvalidIpv6(c.addresses, c.gateway);
    ASSERT_EQ(problem.has_value(), c.problem.has_value()) << c.addresses[0] << " " << c.gateway;
    if (problem) {
      EXPECT_EQ(problem->field, c.problem->first) << c.addresses[0];
      EXPECT_EQ(problem->kind, c.problem->second) << c.addresses[0];
    }
  }
}

TEST(NetworkValidationTest, NameServersAndTheSecondServersLabel) {
  EXPECT_TRUE(IsDnsServerText(""));
  EXPECT_TRUE(IsDnsServerText("10.20.30.2"));
  EXPECT_TRUE(IsDnsServerText("2001:DB8::53"));
  EXPECT_FALSE(IsDnsServerText("10.20.30"));
  EXPECT_FALSE(IsDnsServerText("dns.example"));
  EXPECT_EQ(CanonicalServerText("2001:DB8:0::0053"), "2001:db8::53");
  EXPECT_EQ(CanonicalServerText(""), "");

  struct Case {
    const char* primary;
    const char* second;
    std::uint32_t pane;
    std::uint32_t input;
  };
  const Case cases[] = {
      {"10.0.0.1", "2001:db8::53", TextId::kIpv6DnsLabel, TextId::kIpv6DnsLabel},
      {"10.0.0.1", "10.0.0.2", TextId::kAlternateDnsLabel, TextId::kAlternateDnsLabel},
      {"2001:db8::1", "2001:db8::53", TextId::kAlternateDnsLabel, TextId::kAlternateDnsLabel},
      {"", "2001:db8::53", TextId::kAlternateDnsLabel, TextId::kAlternateDnsLabel},
      // While typing: below three characters the label always goes back.
      {"10.0.0.1", "20:", TextId::kAlternateDnsLabel, TextId::kIpv6DnsLabel},
      {"10.0.0.1", "2:", TextId::kAlternateDnsLabel, TextId::kAlternateDnsLabel},
      {"10.0.0.1", "200", TextId::kAlternateDnsLabel, TextId::kAlternateDnsLabel},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(SecondServerLabel(c.primary, c.second), c.pane) << c.primary << " " << c.second;
    EXPECT_EQ(SecondServerInputLabel(c.primary, c.second), c.input) << c.primary << " " << c.second;
  }
}

ManagementSettings Sample() {
  ManagementSettings settings;
  settings.nic = "hyk0";
  settings.ipv6Enabled = true;
  settings.ip.SetIpv4Address(Ipv4Address("10.20.30.41"));
  settings.ip.SetIpv4Netmask(Ipv4Address("255.255.255.0"));
  settings.ip.SetIpv4Gateway(Ipv4Address("10.20.30.1"));
  settings.ip.SetIpv6Enabled(true);
  settings.ip.SetRouterAdvertisement(true);
  settings.ip.AddIpv6Network(Ipv6Network::FromString("2001:db8::41/64"));
  settings.ip.SetIpv6Gateway(Ipv6Address("fe80::1%hyk0"));
  settings.adapters = {"hynic0", "hynic1"};
  settings.hostname = "tavi-01";
  settings.primaryDns = "10.20.30.2";
  settings.suffixes = "lab.example.net, example.net";
  return settings;
}

TEST(NetworkChangesTest, OnlyWhatTheApplyWouldWriteCounts) {
  struct Case {
    const char* what;
    std::function<void(ManagementSettings&)> edit;
    bool differs;
  };
  const Case cases[] = {
      {"nothing", [](ManagementSettings&) {}, false},
      {"adapter order",
       [](ManagementSettings& s) {
         s.adapters = {"hynic1", "hynic0"};
       },
       true},
      {"vlan", [](ManagementSettings& s) { s.vlanId = 20; }, true},
      {"adapters on a distributed switch",
       [](ManagementSettings& s) {
         s.distributedSwitch = true;
         s.adapters.clear();
         s.vlanId = 7;
       },
       false},
      {"static address",
       [](ManagementSettings& s) { s.ip.SetIpv4Address(Ipv4Address("10.20.30.42")); }, true},
      {"to DHCP", [](ManagementSettings& s) { s.ip.SetDhcp(true); }, true},
      {"to none", [](ManagementSettings& s) { s.ip.SetIpv4UseNone(true); }, true},
      {"DHCPv6", [](ManagementSettings& s) { s.ip.SetDhcpv6(true); }, true},
      {"IPv6 gateway zone",
       [](ManagementSettings& s) { s.ip.SetIpv6Gateway(Ipv6Address("fe80::1")); }, true},
      {"IPv6 details while IPv6 is to be off",
       [](ManagementSettings& s) {
         s.ipv6Enabled = false;
         s.ip.SetDhcpv6(true);
         s.ip.ClearStaticIpv6Networks();
       },
       false},
      {"same static IPv6 entry typed again",
       [](ManagementSettings& s) {
         s.ip.ClearStaticIpv6Networks();
         s.ip.AddIpv6Network(Ipv6Network::FromString("2001:db8:0::41/64"));
       },
       false},
      {"primary server", [](ManagementSettings& s) { s.primaryDns = "10.20.30.9"; }, true},
      {"host name", [](ManagementSettings& s) { s.hostname = "tavi-02"; }, true},
      {"DNS from DHCP", [](ManagementSettings& s) { s.ip.SetDnsFromDhcp(true); }, true},
      {"suffix separators",
       [](ManagementSettings& s) { s.suffixes = "lab.example.net  example.net"; }, false},
      {"suffix order", [](ManagementSettings& s) { s.suffixes = "example.net lab.example.net"; },
       true},
  };
  const ManagementSettings entry = Sample();
  for (const Case& c : cases) {
    ManagementSettings pending = entry;
    c.edit(pending);
    EXPECT_EQ(SettingsDiffer(entry, pending), c.differs) << c.what;
  }

  // A DHCP host: the IPv4 dialog confirmed without an edit clears the
  // gateway, which a DHCP configuration does not use.
  ManagementSettings dhcp = entry;
  dhcp.ip.SetDhcp(true);
  ManagementSettings confirmed = dhcp;
  confirmed.ip.SetIpv4Gateway(Ipv4Address());
  EXPECT_FALSE(SettingsDiffer(dhcp, confirmed));

  // With DNS from DHCP the manual values are not written.
  ManagementSettings automatic = entry;
  automatic.ip.SetDnsFromDhcp(true);
  ManagementSettings retyped = automatic;
  retyped.primaryDns = "10.9.9.9";
  EXPECT_FALSE(SettingsDiffer(automatic, retyped));
}

TEST(AdapterRowsTest, LongLabelsAreCutSoThatTheMacStaysWhole) {
  PnicRow pnic{"hynic0", "Kestrel Networks KN-X540 10GbE SFP+ Adapter", "02:6b:4e:10:20:01",
               "Connected", "vSwitch0"};
  EXPECT_EQ(AdaptersDialog::Caption(pnic),
            "{align:padding:13}hynic0{/align}{align:padding:30}Kestre... "
            "(02:6b:4e:10:20:01){/align}Connected");
  pnic.hardwareLabel = "N/A";
  pnic.linkState = "Disconnected";
  EXPECT_EQ(AdaptersDialog::Caption(pnic),
            "{align:padding:13}hynic0{/align}{align:padding:30}N/A (02:6b:4e:10:20:01){/align}"
            "Disconnected");
  pnic.switchName.clear();
  EXPECT_EQ(AdapterInfoDialog::Details(pnic),
            "Device Name: hynic0\nHardware Label: N/A\nMAC Address: 02:6b:4e:10:20:01\n"
            "Status: Disconnected\nVirtual Switch: None");
}

}  // namespace
}  // namespace Tulk
