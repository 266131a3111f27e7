// The apply sequence on the simulated host: the order and words of its log
// lines, what reaches the host, and a fault at each step that is logged
// while the sequence goes on.

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/ManagementSettings.h"
#include "network/ApplyNetworkChanges.h"
#include "platform/api/Ipv6Network.h"
#include "platform/sim/DemoHost.h"

namespace Tulk {
namespace {

using HostMgr::Network::Ipv4Address;
using HostMgr::Network::Ipv6Address;
using HostMgr::Network::Ipv6Network;
using Lines = std::vector<std::string>;
using nlohmann::json;

constexpr char kRefreshed[] = "<14>Command \"osk-cmd -U root internalsvc/refresh\" succeeded";

class ApplyNetworkChangesTest : public ::testing::Test {
 protected:
  void SetUp() override { state_ = Sim::DemoHostState(); }

  // The settings of the host as it is now (state_ written first).
  ManagementSettings Read() {
    HostTest::WriteHostState(state_);
    ManagementSettings settings;
    EXPECT_EQ(ReadManagementSettings(settings), SettingsRead::kRead);
    return settings;
  }

  // Runs the sequence with `faults` injected after the read; returns the
  // log lines it wrote.
  Lines Apply(const ManagementSettings& entry, const ManagementSettings& pending,
              const json& faults = json::object()) {
    json state = HostTest::ReadHostState();
    state["faults"] = faults;
    HostTest::WriteHostState(state);
    HostTest::ClearLog();
    errors_.clear();
    ApplyNetworkChanges apply(entry, pending,
                              [this](const std::string& message) { errors_.push_back(message); });
    apply.Run();
    restart_ = apply.RestartRequired();
    return HostTest::LogLines();
  }

  json Host() { return HostTest::ReadHostState(); }
  json& Network() { return state_["network"]; }

  json state_;
  Lines errors_;
  bool restart_ = false;
};

// Every kind of change of the window's six entries at once.
ManagementSettings AllSixChanged(ManagementSettings settings) {
  settings.adapters = {"hynic1", "hynic2", "hynic0"};
  settings.vlanId = 20;
  settings.ip.SetIpv4Address(Ipv4Address("10.20.30.50"));
  settings.ip.SetIpv4Netmask(Ipv4Address("255.255.0.0"));
  settings.ip.SetIpv4Gateway(Ipv4Address("10.20.30.254"));
  settings.ip.SetRouterAdvertisement(false);
  settings.ip.ClearStaticIpv6Networks();
  settings.ip.AddIpv6Network(Ipv6Network::FromString("2001:db8::50/64"));
  settings.ip.SetIpv6Gateway(Ipv6Address("2001:db8::1"));
  settings.primaryDns = "10.20.30.9";
  settings.alternateDns = "2001:db8::53";
  settings.hostname = "tavi-02.lab.example.org";
  settings.suffixes = "a.example, b.example  c.example";
  return settings;
}

TEST_F(ApplyNetworkChangesTest, AllSixKindsOfChangeInOrderAndOnTheHost) {
  const ManagementSettings entry = Read();
  EXPECT_EQ(Apply(entry, AllSixChanged(entry)),
            (Lines{"<14>Setting adapters to hynic1 hynic2 hynic0",
                   "<14>Setting ipv4 configuration to 10.20.30.50 255.255.0.0 on hyk0",
                   "<14>Setting ipv6 configuration", "<14>Setting default gateway to 10.20.30.254",
                   "<14>Setting default ipv6 gateway to 2001:db8::1",
                   "<14>Changed vlan, restarting management interface",
                   "<14>Setting hostname to tavi-02.lab.example.org",
                   "<14>Setting nameservers to 10.20.30.9 2001:db8::53",
                   "<14>Setting suffixes to a.example, b.example, c.example", kRefreshed}));
  EXPECT_TRUE(errors_.empty());

  const json host = Host();
  const json& network = host["network"];
  // hynic2 came over from vSwitch1; the order is the operator's.
  EXPECT_EQ(network["switches"][0]["uplinks"], json({"hynic0", "hynic1", "hynic2"}));
  EXPECT_EQ(network["switches"][0]["teaming"],
            json({{"uplinkOrder", {"hynic1", "hynic2", "hynic0"}}, {"maxActive", 3}}));
  EXPECT_EQ(network["switches"][1]["uplinks"], json::array());
  EXPECT_EQ(network["switches"][1]["teaming"]["maxActive"], 0);
  EXPECT_EQ(network["portGroups"][0]["vlanId"], 20);
  const json& nic = network["hykernelNics"][0];
  EXPECT_EQ(nic["mac"], "02:6b:4e:10:20:02");  // the primary adapter's
  EXPECT_EQ(nic["restarts"], 1);
  EXPECT_EQ(nic["ipv4"], json({{"mode", "static"},
                               {"address", "10.20.30.50"},
                               {"netmask", "255.255.0.0"},
                               {"gateway", "10.20.30.254"}}));
  EXPECT_EQ(nic["ipv6"]["networks"],
            json::parse(R"([{"address":"fe80::6b:4eff:fe10:2001","prefix":64,"type":1,"scope":1},
                            {"address":"2001:db8::50","prefix":64,"type":0,"scope":3}])"));
  EXPECT_EQ(network["routing"],
            json({{"ipv4Gateway", "10.20.30.254"}, {"ipv6Gateway", "2001:db8::1"}}));
  const json& dns = network["dns"];
  EXPECT_EQ(dns["hostname"], "tavi-02");
  EXPECT_EQ(dns["domain"], "lab.example.org");
  EXPECT_EQ(dns["nameServers"], json({"10.20.30.9", "2001:db8::53"}));
  EXPECT_EQ(dns["searchDomains"], json({"lab.example.org", "a.example", "b.example", "c.example"}));
  EXPECT_EQ(dns["saves"], 1);
  EXPECT_EQ(host["services"]["mgmtd"]["refreshes"], 1);
}

TEST_F(ApplyNetworkChangesTest, NothingChangedWritesOnlyWhatIsAlwaysWritten) {
  const ManagementSettings entry = Read();
  const json nicBefore = Host()["network"]["hykernelNics"][0];
  EXPECT_EQ(
      Apply(entry, entry),
      (Lines{"<14>Setting adapters to hynic0 hynic1", "<14>Setting ipv6 configuration",
             "<14>Setting hostname to tavi-01", "<14>Setting nameservers to 10.20.30.2 10.20.30.3",
             "<14>Setting suffixes to lab.example.net, example.net", kRefreshed}));
  const json host = Host();
  EXPECT_EQ(host["network"]["hykernelNics"][0], nicBefore);  // no address written again
  EXPECT_EQ(host["network"]["dns"]["searchDomains"], json({"lab.example.net", "example.net"}));
  EXPECT_FALSE(host["network"].contains("ipv6EnabledNextBoot"));
}

TEST_F(ApplyNetworkChangesTest, Ipv4ModesDecideTheGatewayAndTheLease) {
  struct Case {
    const char* what;
    std::function<void(ManagementSettings&)> edit;
    Lines expected;
    const char* mode;
  };
  const Case cases[] = {
      {"to DHCP",
       [](ManagementSettings& s) { s.ip.SetDhcp(true); },
       {"<14>Switching to DHCP on hyk0", "<14>Renew DHCP lease on hyk0"},
       "dhcp"},
      {"to none",
       [](ManagementSettings& s) {
         s.ip.SetIpv4UseNone(true);
         s.ip.SetIpv4Gateway(Ipv4Address());
       },
       {"<14>Setting ipv4 configuration to none on hyk0", "<14>Setting default gateway to 0.0.0.0"},
       "none"},
      {"new gateway only",
       [](ManagementSettings& s) { s.ip.SetIpv4Gateway(Ipv4Address("10.20.30.254")); },
       {"<14>Setting default gateway to 10.20.30.254"},
       "static"},
  };
  for (const Case& c : cases) {
    SetUp();
    const ManagementSettings entry = Read();
    ManagementSettings pending = entry;
    c.edit(pending);
    Lines lines = Apply(entry, pending);
    Lines ipv4;
    std::copy_if(lines.begin(), lines.end(), std::back_inserter(ipv4), [](const std::string& l) {
      return l.find("ipv4") != std::string::npos || l.find("DHCP") != std::string::npos ||
             l.find("gateway") != std::string::npos;
    });
    EXPECT_EQ(ipv4, c.expected) << c.what;
    EXPECT_EQ(Host()["network"]["hykernelNics"][0]["ipv4"]["mode"], c.mode) << c.what;
  }
  EXPECT_EQ(Host()["network"]["routing"]["ipv4Gateway"], "10.20.30.254");
}

TEST_F(ApplyNetworkChangesTest, DnsFromDhcpOnlyWithAutomaticAddressesSkipsNameAndServers) {
  struct Case {
    bool dhcp;
    bool dhcpv6;
    bool dnsFromDhcp;
    bool written;
  };
  const Case cases[] = {
      {true, false, true, true},    // IPv4 DHCP: kept
      {false, true, true, true},    // DHCPv6 with IPv6 on: kept
      {false, false, true, false},  // static: cleared, name and servers written
      {true, false, false, false},
  };
  for (const Case& c : cases) {
    SetUp();
    const ManagementSettings entry = Read();
    ManagementSettings pending = entry;
    pending.ip.SetDhcp(c.dhcp);
    pending.ip.SetDhcpv6(c.dhcpv6);
    pending.ip.SetDnsFromDhcp(c.dnsFromDhcp);
    const Lines lines = Apply(entry, pending);
    const bool named =
        std::find(lines.begin(), lines.end(), "<14>Setting hostname to tavi-01") != lines.end();
    EXPECT_EQ(Host()["network"]["hykernelNics"][0]["dnsFromDhcp"], c.written)
        << c.dhcp << c.dhcpv6 << c.dnsFromDhcp;
    EXPECT_EQ(named, !c.written) << c.dhcp << c.dhcpv6 << c.dnsFromDhcp;
  }
}

TEST_F(ApplyNetworkChangesTest, HostNamesAndNameServers) {
  struct Case {
    const char* name;
    std::string primary;
    std::string second;
    const char* hostname;
    const char* domain;
    json servers;
  };
  const Case cases[] = {
      {"esx7", "", "", "esx7", "lab.example.net", json::array()},
      {"esx7.corp.example", "0.0.0.0", "10.1.1.1", "esx7", "corp.example", {"10.1.1.1"}},
      {"esx8", "::", "", "esx8", "lab.example.net", json::array()},
  };
  for (const Case& c : cases) {
    SetUp();
    const ManagementSettings entry = Read();
    ManagementSettings pending = entry;
    pending.hostname = c.name;
    pending.primaryDns = c.primary;
    pending.alternateDns = c.second;
    Apply(entry, pending);
    const json dns = Host()["network"]["dns"];
    EXPECT_EQ(dns["hostname"], c.hostname) << c.name;
    EXPECT_EQ(dns["domain"], c.domain) << c.name;
    EXPECT_EQ(dns["nameServers"], c.servers) << c.name;
  }
  EXPECT_TRUE(HostTest::Logged("<14>Setting nameservers to :: "));
}

TEST_F(ApplyNetworkChangesTest, TheIpv6FlagWaitsForTheNextBoot) {
  struct Case {
    bool change;
    json faults;
    bool restart;
  };
  const Case cases[] = {
      {true, json::object(), true},
      {false, json::object(), false},
      // Nothing to restart for when the flag could not be written.
      {true, {{"NetworkInfoImpl::SetHykIpv6Enabled", "x"}}, false},
  };
  for (const Case& c : cases) {
    SetUp();
    const ManagementSettings entry = Read();
    ManagementSettings pending = entry;
    pending.ipv6Enabled = !c.change;
    const Lines lines = Apply(entry, pending, c.faults);
    EXPECT_EQ(restart_, c.restart) << c.change << c.faults;
    EXPECT_EQ(std::count(lines.begin(), lines.end(), "<14>Setting ipv6 configuration"),
              c.change ? 0 : 1);
    const json network = Host()["network"];
    EXPECT_EQ(network["ipv6Enabled"], true);  // until the next boot
    EXPECT_EQ(network.value("ipv6EnabledNextBoot", true), !c.restart);
  }
}

TEST_F(ApplyNetworkChangesTest, DistributedSwitchSkipsAdaptersAndVlan) {
  Network()["switches"].push_back(
      {{"name", "dvs-lab"}, {"type", "distributed"}, {"uplinks", {"hynic3"}}});
  Network()["hykernelNics"][0]["connection"] = {
      {"type", "dvsPort"}, {"switch", "dvs-lab"}, {"portId", "17"}};
  const ManagementSettings entry = Read();
  EXPECT_TRUE(entry.distributedSwitch);
  const Lines lines = Apply(entry, entry);
  EXPECT_EQ(lines.front(), "<14>Setting ipv6 configuration");
  EXPECT_EQ(lines.back(), kRefreshed);
}

TEST_F(ApplyNetworkChangesTest, AFaultAtEachStepIsLoggedAndTheSequenceGoesOn) {
  struct Case {
    const char* operation;
    const char* line;
    std::function<void(ManagementSettings&)> edit;
  };
  const auto none = [](ManagementSettings&) {};
  const Case cases[] = {
      {"PortsetImpl::GetUplinks", "<11>Getting uplinks failed: injected", none},
      {"PortsetImpl::RemoveUplink", "<11>Removing uplink hynic1 failed: injected",
       [](ManagementSettings& s) { s.adapters = {"hynic0"}; }},
      {"PortsetImpl::MoveUplink", "<11>Adding uplink hynic2 failed: injected", none},
      {"PortsetImpl::SetTeamingPolicy", "<11>VS: add uplink to teaming policy failed: injected",
       none},
      {"HykNicImpl::SetMacAddressFromPnic", "<11>Setting mac address of hynic failed: injected",
       none},
      {"PortGroupImpl::SetVlanId", "<11>Setting VlanID failed: injected", none},
      {"HykNicImpl::GetIpConfig", "<11>Setting ip configuration failed: injected", none},
      {"NetworkInfoImpl::SetHykIpv6Enabled", "<11>Setting ipv6 configuration failed: injected",
       [](ManagementSettings& s) { s.ipv6Enabled = false; }},
      {"HykNicImpl::SetIpConfig", "<11>Setting ip/ipv6 configuration failed: injected", none},
      {"HykNicImpl::RenewDhcpLease", "<11>Renew DHCP lease failed: injected",
       [](ManagementSettings& s) { s.ip.SetDhcp(true); }},
      {"RoutingInfoImpl::SetIpv4DefaultGateway", "<11>Setting default gateway failed: injected",
       none},
      {"RoutingInfoImpl::SetIpv6DefaultGateway",
       "<11>Setting default ipv6 gateway failed: injected", none},
      {"HykNicImpl::Restart", "<11>Restarting management interface failed: injected", none},
      {"DnsConfigImpl::SetFqdn", "<11>Setting DNS failed: injected", none},
      {"DnsConfigImpl::AddUserNameServer", "<11>Setting DNS failed: injected", none},
      {"DnsConfigImpl::SaveConfig", "<11>Setting DNS failed: injected", none},
  };
  for (const Case& c : cases) {
    SetUp();
    const ManagementSettings entry = Read();
    ManagementSettings pending = AllSixChanged(entry);
    c.edit(pending);
    const Lines lines = Apply(entry, pending, {{c.operation, "injected"}});
    EXPECT_NE(std::find(lines.begin(), lines.end(), c.line), lines.end())
        << c.operation << "\n"
        << testing::PrintToString(lines);
    EXPECT_EQ(lines.back(), kRefreshed) << c.operation;
    const bool ipv6 = std::string(c.operation).find("SetHykIpv6Enabled") != std::string::npos;
    EXPECT_EQ(errors_, ipv6 ? Lines{"Setting ipv6 configuration failed: injected"} : Lines{})
        << c.operation;
  }
}

}  // namespace
}  // namespace Tulk
