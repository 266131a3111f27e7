// Hardware, host records, system settings, virtual machines, accounts and
// smart cards, the event and audit files, and running host programs.

#include <gtest/gtest.h>

#include <fstream>

#include "SimTestSupport.h"
#include "platform/api/Authentication.h"
#include "platform/api/BrlAudit.h"
#include "platform/api/CpuInfoImpl.h"
#include "platform/api/HardwareInfoImpl.h"
#include "platform/api/Host.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/HykCtlExec.h"
#include "platform/api/MemoryInfoImpl.h"
#include "platform/api/QobUserLib.h"
#include "platform/api/ResourceInfoImpl.h"
#include "platform/api/SystemInfoImpl.h"
#include "platform/api/SystemInformation.h"

namespace {

using HostMgr::Lib::HostMgrException;
using nlohmann::json;
using SimTest::ScratchHost;

TEST(Hardware, DemoHostIdentity) {
  ScratchHost host;
  HykCtl::Hardware::HardwareInfoImpl hardware;
  EXPECT_EQ(hardware.GetVendorName(), "Kestrel Computing");
  EXPECT_EQ(hardware.GetServiceTag(), "7F3Q91A");
  EXPECT_EQ(hardware.GetBmcVersion(), "5.10.50.00");
  EXPECT_EQ(HykCtl::Hardware::CpuInfoImpl().GetNumCpuPackages(), 2);
  HykCtl::Hardware::MemoryInfoImpl memory;
  EXPECT_EQ(memory.GetTotalPages() * memory.GetPageSize(), 64ull << 30);

  auto records = HostMgr::HostFactory::GetHost();
  const HostMgr::HardwareInfo info = records->GetHardwareInfo();
  EXPECT_EQ(info.biosMajorRelease, 2);
  EXPECT_EQ(info.biosMinorRelease, 14);
  const HostMgr::StorageInfo storage = records->GetStorageInfo();
  ASSERT_NE(storage.FindAdapter("hyhba0"), nullptr);
  EXPECT_EQ(storage.FindAdapter("hyhba0")->version, "2.0.11-1");
  EXPECT_EQ(storage.FindAdapter("hyhba7"), nullptr);
  EXPECT_EQ(records->GetSystemInfo().fullName, "Brimlo Tavi 8.1.0 build-24519031");
}

TEST(SystemInformationNodes, VersionRecordAndBootOption) {
  ScratchHost host([](json& s) {
    s["product"]["name"] = std::string(80, 'n');
    s["system"]["bootOption"] = 1;
  });
  HSI_SystemVersion version{};
  ASSERT_EQ(HSI_Get(HSI_NODE_system_version, &version, sizeof version), 0);
  EXPECT_EQ(std::string(version.productName), std::string(63, 'n')) << "cut, NUL-terminated";
  EXPECT_STREQ(version.build, "24519031");
  EXPECT_NE(HSI_Get(HSI_NODE_system_version, &version, 100), 0) << "too small a buffer";
  unsigned char boot[3] = {9, 9, 9};
  ASSERT_EQ(HSI_Get(HSI_NODE_system_bootOption, boot, sizeof boot), 0);
  EXPECT_EQ(boot[0], 1);
  EXPECT_EQ(boot[1], 0);
}

TEST(SystemInformationNodes, MissingBootOptionIsAFailedRead) {
  ScratchHost host([](json& s) { s["system"].erase("bootOption"); });
  unsigned char boot[3] = {};
  EXPECT_NE(HSI_Get(HSI_NODE_system_bootOption, boot, sizeof boot), 0);
}

TEST(SystemSettings, KeyboardWelcomeAlertsAndFirewall) {
  ScratchHost host;
  HykCtl::System::SystemInfoImpl system;
  EXPECT_EQ(system.GetKeyboardLayout(), "US Default");
  system.SetKeyboardLayout("German");
  EXPECT_EQ(system.GetKeyboardLayout(), "German");
  EXPECT_THROW(system.SetKeyboardLayout("Klingon"), HostMgrException);

  EXPECT_EQ(system.GetWelcomeMessage(), "");
  system.SetWelcomeMessage("Maintenance window until 18:00");
  EXPECT_EQ(system.GetWelcomeMessage(), "Maintenance window until 18:00");
  system.SetSystemAlert("No compatible network adapter found.");
  EXPECT_EQ(system.GetSystemAlerts(),
            (std::vector<std::string>{"No compatible network adapter found."}));

  auto ssh = system.GetFirewallRulesetById("sshServer");
  EXPECT_TRUE(ssh->IsManagedWithService());
  EXPECT_FALSE(ssh->IsEnabled());
  ssh->Enable();
  EXPECT_TRUE(host.ReadState()["system"]["firewall"]["sshServer"]["enabled"]);
  EXPECT_FALSE(system.GetFirewallRulesetById("webAccess")->IsManagedWithService());
  EXPECT_THROW(system.GetFirewallRulesetById("nfsClient"), HostMgrException);
}

TEST(Resources, RunningVirtualMachines) {
  ScratchHost host;
  HykCtl::Resource::ResourceInfoImpl resources;
  EXPECT_TRUE(resources.HasRunningVirtualMachines());
  EXPECT_EQ(resources.GetRunningVirtualMachines(), (std::vector<std::string>{"build-agent-01"}));
  EXPECT_EQ(host.Run("sbin/powerOffVms", {}).status, 0);
  EXPECT_FALSE(resources.HasRunningVirtualMachines());
}

TEST(Accounts, StoreAndSmartCards) {
  ScratchHost host([](json& s) {
    s["smartCards"] = {{{"userId", "jdoe"}, {"valid", true}},
                       {{"userId", "old"}, {"valid", false}}};
  });
  HostMgr::Authentication::StoreUserAccountsToCs();
  EXPECT_EQ(host.ReadState()["users"]["configStoreSaves"], 1);
  auto tokens = HostMgr::Authentication::LookupSmartCardTokens();
  ASSERT_EQ(tokens.size(), 2u);
  EXPECT_EQ(tokens[0].userId, "jdoe");
  EXPECT_FALSE(tokens[1].valid);
}

TEST(Events, MessagesAreFilledAndRecorded) {
  ScratchHost host;
  EXPECT_EQ(QobUserLib_AddQob("@&!*@*@(qob.user.tulk.reboot.host)Rebooting host", nullptr, 0), 1)
      << "not open yet";
  ASSERT_EQ(QobUserLib_Init(), 0);
  const char* interface[] = {"hyk0"};
  EXPECT_EQ(QobUserLib_AddQob("@&!*@*@(qob.user.tulk.network.restart)Restarting %s", interface, 1),
            0);
  EXPECT_EQ(QobUserLib_AddQob("Restarting %s", interface, 1), 2) << "no marker";
  QobUserLib_Close();
  EXPECT_EQ(QobUserLib_AddQob("@&!*@*@(qob.user.tulk.reboot.host)Rebooting host", nullptr, 0), 1);

  auto events = host.Records("events.jsonl");
  ASSERT_EQ(events.size(), 1u);
  EXPECT_EQ(events[0]["id"], "qob.user.tulk.network.restart");
  EXPECT_EQ(events[0]["text"], "Restarting hyk0");
  EXPECT_EQ(events[0]["arguments"], json::array({"hyk0"}));
}

TEST(Audit, RecordsCarryOutcomeAndAttributes) {
  ScratchHost host;
  const BrlAuditPair reason[] = {{"reason", "Password expired"}};
  EXPECT_EQ(BrlAudit_LogList("tulk.login", "tulk", "root", BRL_AUDIT_FAILURE, reason, 1), 0);
  EXPECT_EQ(BrlAudit_LogList("product.issue", "tulk", nullptr, BRL_AUDIT_SUCCESS, nullptr, 0), 0);
  auto records = host.Records("audit.jsonl");
  ASSERT_EQ(records.size(), 2u);
  EXPECT_EQ(records[0]["event"], "tulk.login");
  EXPECT_EQ(records[0]["result"], "failure");
  EXPECT_EQ(records[0]["attributes"]["reason"], "Password expired");
  EXPECT_EQ(records[1]["user"], "");
  EXPECT_TRUE(records[1]["attributes"].empty());
}

TEST(Exec, RunsUnderTheRootWithConfinedPath) {
  ScratchHost host;
  using HykCtl::Util::HykCtl_Exec;
  auto shell = HykCtl_Exec("echo $PATH; exit 3", true, true, true);
  EXPECT_EQ(shell.status, 3);
  EXPECT_EQ(shell.output,
            (host.Root() / "bin").string() + ":" + (host.Root() / "sbin").string() + "\n");

  auto ping = HykCtl_Exec("hykping -c 3 -I hyk0 10.20.30.1", true, true, false);
  EXPECT_EQ(ping.status, 0) << ping.output;
  EXPECT_NE(ping.output.find("3 packets received"), std::string::npos);
  EXPECT_EQ(HykCtl_Exec("hykping 192.0.2.77", false, true, false).output, "");
  EXPECT_EQ(HykCtl_Exec("hykping 192.0.2.77", false, true, false).status, 1);

  EXPECT_THROW(HykCtl_Exec("no-such-program", true, true, false), HostMgrException);
  EXPECT_THROW(HykCtl_Exec("   ", true, true, false), HostMgrException);
  EXPECT_EQ(
      HykCtl_Exec((host.Root() / "sbin/backup.sh").string() + " 0", false, false, false).status, 0);
}

TEST(Exec, BacktraceWritesItsCoreUnderTheRoot) {
  ScratchHost host;
  auto result = HykCtl::Util::HykCtl_Exec(
      (host.Root() / "sbin/hykbacktrace").string() + " -w -n mgmtd -o mgmtd-restart% -d /var/log/",
      true, true, false);
  EXPECT_EQ(result.status, 0) << result.output;
  bool found = false;
  for (const auto& entry : std::filesystem::directory_iterator(host.Root() / "var/log")) {
    found = found || entry.path().filename().string().rfind("mgmtd-restart", 0) == 0;
  }
  EXPECT_TRUE(found);
  EXPECT_EQ(host.Run("sbin/services.sh", {"stop"}).status, 0);
  EXPECT_EQ(HykCtl::Util::HykCtl_Exec(
                (host.Root() / "sbin/hykbacktrace").string() + " -w -n mgmtd -d /var/log/", false,
                true, false)
                .status,
            1)
      << "mgmtd is down";
}

}  // namespace
