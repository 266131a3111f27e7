// The simulated network: kernel NICs and their connection points, IP
// configuration and DHCP, switches with uplinks and teaming, portgroups,
// DNS, routing, the factory network and the hosts file.

#include <gtest/gtest.h>

#include <fstream>

#include "SimTestSupport.h"
#include "platform/api/DnsConfigImpl.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/HostsFile.h"
#include "platform/api/HykernelNicInfoImpl.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/PnicImpl.h"
#include "platform/api/PortGroupImpl.h"
#include "platform/api/Portset.h"
#include "platform/api/RoutingInfoImpl.h"
#include "platform/api/VirtualSwitchInfoImpl.h"

namespace {

using namespace HykCtl::Network;
using HostMgr::Lib::HostMgrException;
using HostMgr::Network::IpConfig;
using HostMgr::Network::Ipv4Address;
using HostMgr::Network::Ipv6Address;
using HostMgr::Network::Ipv6Network;
using nlohmann::json;
using SimTest::ScratchHost;

std::unique_ptr<HykNicImpl> Management() {
  NetworkInfoImpl network;
  network.UpdateManagementInterface();
  return network.GetManagementInterface();
}

TEST(KernelNics, ConnectionPointsOfEveryKind) {
  ScratchHost host([](json& s) {
    json& nics = s["network"]["hykernelNics"];
    nics.push_back(
        {{"name", "hyk1"},
         {"mac", "02:6b:4e:00:00:11"},
         {"connection", {{"type", "dvsPort"}, {"switch", "dvs-core"}, {"portId", "17"}}}});
    nics.push_back(
        {{"name", "hyk2"}, {"connection", {{"type", "opaqueNetwork"}, {"name", "overlay-seg-1"}}}});
    nics.push_back({{"name", "hyk3"}});
  });
  std::vector<HykNicImpl> nics = HykernelNicInfoImpl().GetHykernelNics(0);
  ASSERT_EQ(nics.size(), 4u);
  auto hyk0 = nics[0].GetConnectionPoint();
  ASSERT_TRUE(hyk0);
  EXPECT_EQ(hyk0->GetType(), ConnectionPoint::kPortGroup);
  EXPECT_EQ(hyk0->GetName(), "vSwitch0");
  EXPECT_EQ(hyk0->GetPortGroupName(), "Management Network");
  auto hyk1 = nics[1].GetConnectionPoint();
  EXPECT_EQ(hyk1->GetType(), ConnectionPoint::kDvsPort);
  EXPECT_EQ(hyk1->GetName(), "dvs-core");
  EXPECT_EQ(hyk1->GetPortGroupName(), "");
  EXPECT_EQ(nics[2].GetConnectionPoint()->GetType(), ConnectionPoint::kOpaqueNetwork);
  EXPECT_FALSE(nics[3].GetConnectionPoint());
  EXPECT_EQ(nics[0].GetMacAddress().GetStringAddress(), "02:6b:4e:10:20:01");
  EXPECT_EQ(HykernelNicInfoImpl().GetHykernelNics(1).size(), 1u) << "only vSwitch0's NIC";
}

TEST(KernelNics, NoNicsAndNoManagementInterface) {
  ScratchHost host([](json& s) { s["network"]["hykernelNics"] = json::array(); });
  EXPECT_TRUE(HykernelNicInfoImpl().GetHykernelNics().empty());
  EXPECT_EQ(Management(), nullptr);
}

TEST(KernelNics, SnapshotGoesStaleWhenTheHostChanges) {
  ScratchHost host;
  auto nic = Management();
  ASSERT_TRUE(nic);
  EXPECT_FALSE(nic->IsStale());
  json state = host.ReadState();
  state["network"]["hykernelNics"][0]["ipv4"]["address"] = "10.20.30.99";
  host.WriteState(state);
  EXPECT_TRUE(nic->IsStale());
  EXPECT_EQ(nic->GetIpConfig().GetIpv4Address().GetStringAddress(), "10.20.30.41");
  nic->Refresh();
  EXPECT_FALSE(nic->IsStale());
  EXPECT_EQ(nic->GetIpConfig().GetIpv4Address().GetStringAddress(), "10.20.30.99");
}

TEST(KernelNics, DhcpLeaseFollowsTheNetworksServer) {
  ScratchHost host;
  auto nic = Management();
  IpConfig config = nic->GetIpConfig();
  config.SetDhcp(true);
  nic->SetIpConfig(config);
  EXPECT_TRUE(nic->IsDhcpLeaseBound());
  EXPECT_EQ(nic->GetIpConfig().GetIpv4Address().GetStringAddress(), "10.20.30.141");
  nic->RenewDhcpLease();
  EXPECT_EQ(host.ReadState()["network"]["hykernelNics"][0]["dhcpLease"]["renewals"], 1);

  config.SetDhcp(false);
  nic->SetIpConfig(config);
  EXPECT_EQ(nic->GetIpConfig().GetIpv4Address().GetStringAddress(), "10.20.30.41")
      << "the static address comes back";
  EXPECT_THROW(nic->RenewDhcpLease(), HostMgrException);
}

TEST(KernelNics, DhcpWithoutServerWaitsWithZeroAddress) {
  ScratchHost host([](json& s) { s["network"].erase("dhcpOffer"); });
  auto nic = Management();
  IpConfig config = nic->GetIpConfig();
  config.SetDhcp(true);
  nic->SetIpConfig(config);
  EXPECT_FALSE(nic->IsDhcpLeaseBound());
  EXPECT_TRUE(nic->GetIpConfig().GetIpv4Address().IsZero());
  EXPECT_TRUE(nic->GetIpConfig().GetDhcp());
}

TEST(KernelNics, StaticIpv4IsCheckedBeforeItIsWritten) {
  ScratchHost host;
  auto nic = Management();
  IpConfig config = nic->GetIpConfig();
  config.SetIpv4Netmask(Ipv4Address("255.0.255.0"));
  EXPECT_THROW(nic->SetIpConfig(config), HostMgrException);
  config.SetIpv4UseNone(true);
  nic->SetIpConfig(config);
  EXPECT_TRUE(nic->GetIpConfig().GetIpv4UseNone());
}

TEST(KernelNics, StaticIpv6EntriesAreReplacedHostEntriesFollowTheirSource) {
  ScratchHost host;
  auto nic = Management();
  IpConfig config = nic->GetIpConfig();
  config.ClearStaticIpv6Networks();
  config.AddIpv6Network(Ipv6Network::FromString("2001:db8:99::5/64"));
  config.SetRouterAdvertisement(false);
  config.SetDhcpv6(true);
  config.SetIpv6Gateway(Ipv6Address());
  nic->SetIpConfig(config);

  std::vector<std::string> addresses;
  const IpConfig applied = nic->GetIpConfig();
  for (const Ipv6Network& network : applied.GetIpv6Networks()) {
    addresses.push_back(network.ToString() + " " + std::to_string(network.GetAddressType()));
  }
  EXPECT_EQ(addresses,
            (std::vector<std::string>{"fe80::6b:4eff:fe10:2001/64 1", "2001:db8:99::5/64 0"}))
      << "the old static entry and the autoconfigured one are gone";
  EXPECT_TRUE(nic->GetIpConfig().GetIpv6Gateway().IsZero());
}

TEST(KernelNics, ServiceStateMacAndPortgroupChanges) {
  ScratchHost host;
  auto nic = Management();
  EXPECT_TRUE(nic->IsEnabled());
  nic->Disable();
  EXPECT_FALSE(nic->IsEnabled());
  nic->Restart();
  EXPECT_TRUE(nic->IsEnabled());
  nic->SetMacAddressFromPnic("hynic1");
  EXPECT_EQ(nic->GetMacAddress().GetStringAddress(), "02:6b:4e:10:20:02");
  nic->ConnectToPortGroup("VM Network");
  EXPECT_EQ(nic->GetConnectionPoint()->GetName(), "vSwitch1");
  EXPECT_THROW(nic->ConnectToPortGroup("No Such Group"), HostMgrException);
  EXPECT_THROW(HykNicImpl("hyk9"), HostMgrException);
}

TEST(PhysicalNics, DescriptionsMacsAndLinks) {
  ScratchHost host([](json& s) { s["network"]["pnics"][3].erase("pci"); });
  std::vector<std::string> names = NetworkInfoImpl().GetPnics();
  ASSERT_EQ(names, (std::vector<std::string>{"hynic0", "hynic1", "hynic2", "hynic3"}));
  PnicImpl up("hynic0");
  EXPECT_TRUE(up.IsLinkUp());
  EXPECT_EQ(up.GetLinkSpeed(), 10000);
  EXPECT_EQ(up.GetPciDevice().description, "Kestrel Networks KN-X540 10GbE SFP+ Adapter");
  PnicImpl down("hynic3");
  EXPECT_FALSE(down.IsLinkUp());
  EXPECT_EQ(down.GetLinkSpeed(), 0);
  EXPECT_EQ(down.GetPciDevice().description, "");
  EXPECT_EQ(down.GetMacAddress().GetStringAddress(), "02:6b:4e:10:30:02");
}

TEST(Switches, UplinksAndTeamingOfAStandardSwitch) {
  ScratchHost host;
  PortsetImpl vswitch("vSwitch0");
  EXPECT_THROW(vswitch.AddUplink("hynic2"), HostMgrException) << "hynic2 is vSwitch1's";
  vswitch.AddUplink("hynic3");
  EXPECT_EQ(vswitch.GetUplinks(), (std::vector<std::string>{"hynic0", "hynic1", "hynic3"}));
  EXPECT_EQ(vswitch.GetTeamingPolicy().GetUplinkOrder().size(), 2u)
      << "the policy is the caller's to extend";

  auto policy = vswitch.GetTeamingPolicy();
  policy.SetUplinkOrder({"hynic3", "hynic0", "hynic1"});
  policy.SetMaxActiveUplinks(3);
  vswitch.SetTeamingPolicy(policy);
  policy.SetUplinkOrder({"hynic2"});
  EXPECT_THROW(vswitch.SetTeamingPolicy(policy), HostMgrException) << "not an uplink here";

  vswitch.RemoveUplink("hynic0");
  EXPECT_EQ(vswitch.GetTeamingPolicy().GetUplinkOrder(),
            (std::vector<std::string>{"hynic3", "hynic1"}));
  EXPECT_EQ(vswitch.GetTeamingPolicy().GetMaxActiveUplinks(), 3) << "the maximum is the caller's";
  EXPECT_THROW(vswitch.RemoveUplink("hynic0"), HostMgrException);
  EXPECT_EQ(vswitch.GetUsedPorts(), 3) << "two uplinks and hyk0";
}

TEST(Switches, DistributedSwitchRefusesStandardOperationsButGivesUpItsUplinks) {
  ScratchHost host([](json& s) {
    s["network"]["switches"].push_back({{"name", "dvs-core"},
                                        {"type", "distributed"},
                                        {"numPorts", 512},
                                        {"uplinks", {"hynic3"}},
                                        {"portGroups", {"dvpg-mgmt"}}});
  });
  ASSERT_EQ(VirtualSwitchInfoImpl().GetDVSwitches().size(), 1u);
  EXPECT_EQ(VirtualSwitchInfoImpl().GetVirtualSwitches().size(), 2u);
  PortsetImpl dvs("dvs-core");
  EXPECT_TRUE(dvs.IsDistributed());
  EXPECT_EQ(dvs.GetPortGroups(), (std::vector<std::string>{"dvpg-mgmt"}));
  EXPECT_THROW(dvs.AddUplink("hynic3"), HostMgrException);
  EXPECT_THROW(dvs.AddPortGroup("x"), HostMgrException);
  VirtualSwitchInfoImpl().AddVirtualSwitch("vSwitch2", HostMgr::Network::Portset::DEF_NUM_PORTS);
  dvs.MoveUplink("hynic3", "vSwitch2");
  EXPECT_TRUE(dvs.GetUplinks().empty());
  EXPECT_EQ(PortsetImpl("vSwitch2").GetUplinks(), (std::vector<std::string>{"hynic3"}));
}

TEST(Switches, NamesAreUniqueAndFreeNamesCanBeFound) {
  ScratchHost host;
  EXPECT_TRUE(PortsetImpl::IsValidVirtualSwitch("vSwitch1"));
  EXPECT_FALSE(PortsetImpl::IsValidVirtualSwitch("vSwitch2"));
  EXPECT_THROW(VirtualSwitchInfoImpl().AddVirtualSwitch("vSwitch0", 128), HostMgrException);
  EXPECT_THROW(VirtualSwitchInfoImpl().AddVirtualSwitch("vSwitch9", 0), HostMgrException);
  EXPECT_TRUE(PortGroupImpl::IsValidPortGroup("Management Network"));
  EXPECT_FALSE(PortGroupImpl::IsValidPortGroup("Management Network1"));
  PortsetImpl("vSwitch1").AddPortGroup("Management Network1");
  EXPECT_THROW(PortsetImpl("vSwitch0").AddPortGroup("Management Network1"), HostMgrException);
  EXPECT_THROW(VirtualSwitchInfoImpl().RemoveVirtualSwitch("vSwitch1"), HostMgrException)
      << "it still has portgroups";
  EXPECT_THROW(PortsetImpl("vSwitch0").RemovePortGroup("Management Network"), HostMgrException)
      << "hyk0 uses it";
}

TEST(PortGroups, RowValuesVlanAndTeaming) {
  ScratchHost host;
  std::vector<PortGroupImpl> groups = NetworkInfoImpl().GetAllPortGroups(0);
  ASSERT_EQ(groups.size(), 2u);
  EXPECT_EQ(groups[0].GetName(), "Management Network");
  EXPECT_EQ(groups[0].GetVirtualSwitchName(), "vSwitch0");
  EXPECT_EQ(groups[0].GetActiveClients(), 1) << "hyk0";
  EXPECT_EQ(groups[1].GetActiveClients(), 1) << "one virtual machine";
  groups[0].SetVlanId(4095);
  EXPECT_EQ(groups[0].GetVlanId(), 4095);
  EXPECT_THROW(groups[0].SetVlanId(4096), HostMgrException);
  EXPECT_EQ(groups[0].GetTeamingPolicy().GetMaxActiveUplinks(), 2) << "inherited from vSwitch0";
  groups[0].SetTeamingPolicy(HostMgr::Network::NicTeamingPolicy({"hynic1"}, 1));
  EXPECT_EQ(groups[0].GetTeamingPolicy().GetUplinkOrder(), (std::vector<std::string>{"hynic1"}));
  EXPECT_EQ(PortsetImpl("vSwitch0").GetTeamingPolicy().GetMaxActiveUplinks(), 2);
}

TEST(FactoryNetwork, ClearThenAutoConfigureBuildsTheDefaultManagementNetwork) {
  ScratchHost host;
  NetworkInfoImpl network;
  EXPECT_THROW(network.AutoConfigNetwork(), HostMgrException) << "vSwitch0 exists";
  network.DisableNetDumper();
  network.ClearNetworkConfig();
  EXPECT_EQ(Management(), nullptr);
  EXPECT_TRUE(network.GetAllPortGroups().empty());
  network.AutoConfigNetwork();
  auto nic = Management();
  ASSERT_TRUE(nic);
  EXPECT_EQ(nic->GetName(), "hyk0");
  EXPECT_EQ(nic->GetConnectionPoint()->GetPortGroupName(), "Management Network");
  EXPECT_EQ(nic->GetMacAddress().GetStringAddress(), "02:6b:4e:10:20:01");
  EXPECT_TRUE(nic->GetIpConfig().GetDhcp());
  EXPECT_EQ(PortsetImpl("vSwitch0").GetUplinks(), (std::vector<std::string>{"hynic0"}));
  const json state = host.ReadState();
  EXPECT_FALSE(state["network"]["netDumper"]["enabled"]);
  EXPECT_EQ(state["network"]["hykernelNics"][0]["ipv6"]["networks"][0]["address"],
            "fe80::6b:4eff:fe10:2001")
      << "the link-local address derives from the MAC";
}

TEST(Ipv6Switch, TakesEffectAtTheNextBoot) {
  ScratchHost host;
  NetworkInfoImpl network;
  network.SetHykIpv6Enabled(false);
  EXPECT_TRUE(network.IsHykIpv6Enabled());
  EXPECT_EQ(host.Run("sbin/reboot", {}).status, 0);
  EXPECT_FALSE(network.IsHykIpv6Enabled());
}

TEST(Dns, NamesServersAndSearchDomains) {
  ScratchHost host;
  DnsConfigImpl dns;
  dns.Refresh();
  EXPECT_EQ(dns.GetHostname(), "tavi-01");
  EXPECT_THROW(dns.SetHostname("tavi_01"), HostMgrException);
  EXPECT_THROW(dns.SetFqdn("tavi-01."), HostMgrException);
  dns.SetHostname("tavi-02");
  EXPECT_EQ(dns.GetDomain(), "lab.example.net") << "a bare name keeps the domain";

  dns.RemoveAllUserNameServers();
  dns.AddUserNameServer(Ipv4Address("10.1.1.1"));
  dns.AddUserNameServer(Ipv6Address("2001:db8::53"));
  EXPECT_THROW(dns.AddUserNameServer(Ipv4Address()), HostMgrException);
  EXPECT_THROW(dns.AddUserNameServer(Ipv4Address("10.1.1.1")), HostMgrException);
  std::vector<HostMgr::Network::IpAddress> servers = dns.GetNameServers();
  ASSERT_EQ(servers.size(), 2u);
  EXPECT_EQ(servers[1].GetKind(), HostMgr::Network::IpAddress::kIpv6);

  dns.SetSearchDomainsString(dns.GetDomain());
  for (const char* piece : {"a.example.net", "b.example.net", "a.example.net"}) {
    dns.AddUserSearchDomain(piece);
  }
  EXPECT_EQ(dns.GetSearchDomainsString(), "lab.example.net a.example.net b.example.net");
  dns.SetSearchDomainsString("x.net, y.net  z.net");
  EXPECT_EQ(dns.GetSearchDomains().size(), 3u);
  EXPECT_THROW(DnsConfigImpl("otherStack").GetHostname(), HostMgrException);
}

TEST(Dns, ServersComeFromDhcpOnlyWhileTheNicUsesIt) {
  ScratchHost host([](json& s) { s["network"]["hykernelNics"][0]["dnsFromDhcp"] = true; });
  DnsConfigImpl dns;
  EXPECT_EQ(dns.GetNameServers().size(), 2u) << "static IPv4: the user's servers";
  auto nic = Management();
  IpConfig config = nic->GetIpConfig();
  config.SetDhcp(true);
  nic->SetIpConfig(config);
  ASSERT_EQ(dns.GetNameServers().size(), 1u);
  EXPECT_EQ(dns.GetUserNameServers().size(), 2u);
}

TEST(Routing, DefaultGatewaysWithZones) {
  ScratchHost host;
  RoutingInfoImpl routing;
  EXPECT_EQ(routing.GetIpv4DefaultGateway().GetStringAddress(), "10.20.30.1");
  EXPECT_EQ(routing.GetIpv6DefaultGateway().GetScopedStringAddress(), "fe80::1%hyk0");
  routing.SetIpv4DefaultGateway(Ipv4Address());
  EXPECT_TRUE(routing.GetIpv4DefaultGateway().IsZero());
  routing.SetIpv6DefaultGateway(Ipv6Address("2001:db8::1"));
  EXPECT_EQ(routing.GetIpv6DefaultGateway().GetStringAddress(), "2001:db8::1");
}

TEST(HostsFileEdit, RemovesTheHostsLinesAndKeepsTheRest) {
  ScratchHost host;
  const std::string path = (host.Root() / "etc/hosts").string();
  std::ofstream(path) << "# static table\n127.0.0.1\tlocalhost\n"
                         "10.20.30.41\ttavi-01.lab.example.net tavi-01\n"
                         "10.20.30.42 TAVI-01\n10.20.30.50 tavi-010 backup # tavi-01\n";
  HostsFile hosts;
  EXPECT_EQ(hosts.RemoveEntryByHostName("tavi-01.lab.example.net"), 2);
  std::ifstream in(path);
  std::string text((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
  EXPECT_EQ(text, "# static table\n127.0.0.1\tlocalhost\n10.20.30.50 tavi-010 backup # tavi-01\n");
  hosts.AddEntry({"10.20.30.41", {"tavi-01", "tavi"}});
  EXPECT_EQ(hosts.GetEntries().back().names, (std::vector<std::string>{"tavi-01", "tavi"}));
  EXPECT_THROW(HostsFile((host.Root() / "etc/missing").string()).GetEntries(), HostMgrException);
}

}  // namespace
