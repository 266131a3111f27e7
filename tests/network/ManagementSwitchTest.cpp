// The management switch's operations and the read of the management
// network's settings on the simulated host: the teaming policy on add and
// remove, the refusal of other kinds of switch and attachment, and the
// failure line of each operation.

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/ManagementSettings.h"
#include "host/ManagementSwitch.h"

namespace Tulk {
namespace {

using HostTest::Logged;
using nlohmann::json;
using Names = std::vector<std::string>;

class ManagementSwitchTest : public HostTest::HostStateTest {
 protected:
  json& Nic() { return Network()["hykernelNics"][0]; }
  json Teaming(int index) {
    return HostTest::ReadHostState()["network"]["switches"][index]["teaming"];
  }
};

TEST_F(ManagementSwitchTest, TeamingPolicyFollowsAddAndRemove) {
  Network()["switches"][0]["teaming"]["maxActive"] = 1;  // hynic1 on standby
  Apply();
  ASSERT_TRUE(RemoveMgmtUplink("hyk0", "hynic1"));
  // Removing the standby adapter keeps one active.
  EXPECT_EQ(Teaming(0), json({{"uplinkOrder", {"hynic0"}}, {"maxActive", 1}}));
  ASSERT_TRUE(AddMgmtUplink("hyk0", "hynic3"));
  EXPECT_EQ(Teaming(0), json({{"uplinkOrder", {"hynic0", "hynic3"}}, {"maxActive", 2}}));
  ASSERT_TRUE(RemoveMgmtUplink("hyk0", "hynic0"));
  ASSERT_TRUE(RemoveMgmtUplink("hyk0", "hynic3"));
  EXPECT_EQ(Teaming(0), json({{"uplinkOrder", json::array()}, {"maxActive", 0}}));

  // An uplink of another switch moves over; the switch it left shrinks.
  ASSERT_TRUE(AddMgmtUplink("hyk0", "hynic2"));
  const json network = HostTest::ReadHostState()["network"];
  EXPECT_EQ(network["switches"][0]["uplinks"], json({"hynic2"}));
  EXPECT_EQ(network["switches"][1]["uplinks"], json::array());
  EXPECT_EQ(Teaming(1)["maxActive"], 0);

  ASSERT_TRUE(AddMgmtUplink("hyk0", "hynic0"));
  ASSERT_TRUE(SetMgmtUplinkOrder("hyk0", {"hynic0", "hynic9"}));
  EXPECT_EQ(Teaming(0), json({{"uplinkOrder", {"hynic0", "hynic2"}}, {"maxActive", 2}}));
  Names uplinks;
  ASSERT_TRUE(GetMgmtUplinks("hyk0", uplinks));
  EXPECT_EQ(uplinks, (Names{"hynic2", "hynic0"}));  // the switch's own order
}

TEST_F(ManagementSwitchTest, OnlyAStandardSwitchBehindAPortgroupIsServed) {
  struct Case {
    const char* what;
    json connection;
    const char* line;
  };
  const Case cases[] = {
      {"distributed switch",
       {{"type", "dvsPort"}, {"switch", "dvs-lab"}, {"portId", "17"}},
       "<11>Unsupported vSwitch type"},
      {"opaque network",
       {{"type", "opaqueNetwork"}, {"name", "overlay-1"}},
       "<11>Opaque network connectee type not supported"},
      {"nothing", nullptr, "<11>Unsupported connectee type"},
  };
  using Operation = std::function<bool()>;
  std::string name;
  std::uint16_t vlan = 0;
  int count = 0;
  Names uplinks;
  const Operation operations[] = {
      [&] { return GetMgmtSwitchName("hyk0", name); },
      [&] { return GetMgmtVlanId("hyk0", vlan); },
      [&] { return SetMgmtVlanId("hyk0", 5); },
      [&] { return GetMaxActiveUplinks("hyk0", count); },
      [&] { return GetMgmtUplinks("hyk0", uplinks); },
      [&] { return AddMgmtUplink("hyk0", "hynic3"); },
      [&] { return RemoveMgmtUplink("hyk0", "hynic3"); },
      [&] { return SetMgmtUplinkOrder("hyk0", {"hynic3"}); },
  };
  for (const Case& c : cases) {
    SetUp();
    Network()["switches"].push_back(
        {{"name", "dvs-lab"}, {"type", "distributed"}, {"uplinks", {"hynic3"}}});
    if (c.connection.is_null()) {
      Nic().erase("connection");
    } else {
      Nic()["connection"] = c.connection;
    }
    Apply();
    for (std::size_t i = 0; i < std::size(operations); ++i) {
      HostTest::ClearLog();
      EXPECT_FALSE(operations[i]()) << c.what << " operation " << i;
      EXPECT_EQ(HostTest::LogLines(), std::vector<std::string>{c.line}) << c.what << " " << i;
    }
  }
}

TEST_F(ManagementSwitchTest, EachOperationLogsItsFailure) {
  std::string name;
  std::uint16_t vlan = 0;
  int count = 0;
  Names uplinks;
  struct Case {
    const char* operation;
    std::function<bool()> call;
    const char* line;
  };
  const Case cases[] = {
      {"HykNicImpl::GetConnectionPoint", [&] { return GetMgmtSwitchName("hyk0", name); },
       "<11>Getting switch name failed: injected"},
      {"PortGroupImpl::GetVlanId", [&] { return GetMgmtVlanId("hyk0", vlan); },
       "<11>Getting VlanID failed: injected"},
      {"PortGroupImpl::SetVlanId", [&] { return SetMgmtVlanId("hyk0", 5); },
       "<11>Setting VlanID failed: injected"},
      {"PortsetImpl::GetTeamingPolicy", [&] { return GetMaxActiveUplinks("hyk0", count); },
       "<11>Getting max number of active uplinks failed: injected"},
      {"PortsetImpl::GetUplinks", [&] { return GetMgmtUplinks("hyk0", uplinks); },
       "<11>Getting uplinks failed: injected"},
      {"PortsetImpl::AddUplink", [&] { return AddMgmtUplink("hyk0", "hynic3"); },
       "<11>Adding uplink hynic3 failed: injected"},
      {"PortsetImpl::SetTeamingPolicy", [&] { return AddMgmtUplink("hyk0", "hynic3"); },
       "<11>VS: add uplink to teaming policy failed: injected"},
      {"PortsetImpl::RemoveUplink", [&] { return RemoveMgmtUplink("hyk0", "hynic1"); },
       "<11>Removing uplink hynic1 failed: injected"},
      {"PortsetImpl::SetTeamingPolicy", [&] { return RemoveMgmtUplink("hyk0", "hynic1"); },
       "<11>VS: remove uplink from teaming policy failed: injected"},
      {"PortsetImpl::SetTeamingPolicy", [&] { return SetMgmtUplinkOrder("hyk0", {"hynic1"}); },
       "<11>Setting uplink order failed: injected"},
  };
  for (const Case& c : cases) {
    SetUp();
    state_["faults"][c.operation] = "injected";
    Apply();
    HostTest::ClearLog();
    EXPECT_FALSE(c.call()) << c.line;
    EXPECT_EQ(HostTest::LogLines(), std::vector<std::string>{c.line});
  }
}

TEST_F(ManagementSwitchTest, SettingsReadOnEntry) {
  ManagementSettings settings;
  ASSERT_EQ(ReadManagementSettings(settings), SettingsRead::kRead);
  EXPECT_EQ(settings.switchName, "vSwitch0");
  EXPECT_EQ(settings.adapters, (Names{"hynic0", "hynic1"}));
  EXPECT_EQ(settings.alternateDns, "10.20.30.3");
  EXPECT_EQ(settings.suffixes, "lab.example.net, example.net");
  EXPECT_EQ(settings.ip.GetIpv6Gateway().GetScopedStringAddress(), "fe80::1%hyk0");

  struct Case {
    const char* what;
    std::function<void(json&)> edit;
    SettingsRead read;
    const char* line;
  };
  const Case cases[] = {
      {"no management NIC", [](json& s) { s["network"]["managementInterface"] = ""; },
       SettingsRead::kNoInterface, nullptr},
      {"IPv6 flag", [](json& s) { s["faults"]["NetworkInfoImpl::IsHykIpv6Enabled"] = "x"; },
       SettingsRead::kFailed, "<11>Getting IPv6 state failed: x"},
      {"IP configuration", [](json& s) { s["faults"]["HykNicImpl::GetIpConfig"] = "x"; },
       SettingsRead::kFailed, "<11>Getting ip configuration failed: x"},
      {"VLAN", [](json& s) { s["faults"]["PortGroupImpl::GetVlanId"] = "x"; },
       SettingsRead::kFailed, "<11>Getting VlanID failed: x"},
      {"DNS", [](json& s) { s["faults"]["DnsConfigImpl::GetSearchDomains"] = "x"; },
       SettingsRead::kFailed, "<11>Getting DNS configuration failed: x"},
      {"gateways", [](json& s) { s["faults"]["RoutingInfoImpl::GetIpv6DefaultGateway"] = "x"; },
       SettingsRead::kFailed, "<11>Getting default gateways failed: x"},
  };
  for (const Case& c : cases) {
    SetUp();
    c.edit(state_);
    Apply();
    HostTest::ClearLog();
    ManagementSettings read;
    EXPECT_EQ(ReadManagementSettings(read), c.read) << c.what;
    if (c.line != nullptr) {
      EXPECT_TRUE(Logged(c.line)) << c.what;
    }
  }
}

}  // namespace
}  // namespace Tulk
