// The simulated host tools, run as real programs under the test's root,
// seen through the state they change.

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <chrono>

#include "SimTestSupport.h"
#include "platform/api/AdvancedOption.h"

namespace {

using nlohmann::json;
using SimTest::Finished;
using SimTest::ScratchHost;

TEST(HostTools, AdvancedOptionSetIsWhatTheConsoleReads) {
  ScratchHost host;
  HykCtl::Adv::UserAdvancedOptionImpl options;
  EXPECT_EQ(options.GetUserOption("/UserVars/TulkTimeOut"), 600);
  Finished set = host.Run("sbin/tavcli", {"system", "settings", "advanced", "set", "-o",
                                          "/UserVars/TulkTimeOut", "-i", "300"});
  EXPECT_EQ(set.status, 0) << set.err;
  EXPECT_EQ(options.GetUserOption("/UserVars/TulkTimeOut"), 300);
  EXPECT_EQ(host.Run("sbin/localcli", {"system", "settings", "advanced", "set",
                                       "--option=/UserVars/TaviShellTimeOut", "--int-value", "900"})
                .status,
            0);
  EXPECT_EQ(options.GetUserOption("/UserVars/TaviShellTimeOut"), 900);

  Finished bad = host.Run("sbin/tavcli", {"system", "settings", "advanced", "set", "-o",
                                          "/UserVars/TulkTimeOut", "-i", "10m"});
  EXPECT_EQ(bad.status, 1);
  EXPECT_NE(bad.err.find("Invalid value"), std::string::npos) << bad.err;
  EXPECT_EQ(options.GetUserOption("/UserVars/TulkTimeOut"), 300);
  EXPECT_EQ(host.Run("bin/tavcli", {"system", "frobnicate"}).status, 1);
}

TEST(HostTools, PackageQueryInKeyValueForm) {
  ScratchHost host;
  Finished query = host.Run(
      "bin/tavcli", {"--formatter=keyvalue", "software", "vib", "get", "-n", "zyo-opsagent"});
  EXPECT_EQ(query.status, 0);
  EXPECT_NE(query.out.find("\nSoftwarePackage.Version.string=3.2.1-0.24519031\n"),
            std::string::npos)
      << query.out;
  EXPECT_EQ(host.Run("bin/tavcli", {"software", "vib", "get", "-n", "zyo-other"}).status, 1);
}

TEST(HostTools, StandardSwitchCommands) {
  ScratchHost host;
  auto vswitch = [&](std::vector<std::string> args) {
    args.insert(args.begin(), {"network", "vswitch", "standard"});
    return host.Run("bin/tavcli", args);
  };
  EXPECT_EQ(vswitch({"add", "-v", "vSwitch2", "-P", "64"}).status, 0);
  EXPECT_EQ(vswitch({"uplink", "add", "-u", "hynic3", "-v", "vSwitch2"}).status, 0);
  EXPECT_EQ(vswitch({"portgroup", "add", "-p", "Storage", "--vswitch-name=vSwitch2"}).status, 0);
  EXPECT_EQ(vswitch({"portgroup", "set", "-p", "Storage", "--vlan-id", "30"}).status, 0);
  const json added = host.ReadState()["network"];
  EXPECT_EQ(added["switches"][2]["numPorts"], 64);
  EXPECT_EQ(added["switches"][2]["teaming"]["uplinkOrder"], json::array({"hynic3"}));
  EXPECT_EQ(added["switches"][2]["teaming"]["maxActive"], 1);
  EXPECT_EQ(added["portGroups"][2]["vlanId"], 30);

  Finished taken = vswitch({"uplink", "add", "-u", "hynic0", "-v", "vSwitch2"});
  EXPECT_EQ(taken.status, 1);
  EXPECT_NE(taken.err.find("already an uplink of vSwitch0"), std::string::npos) << taken.err;
  EXPECT_EQ(vswitch({"remove", "-v", "vSwitch2"}).status, 1) << "it has a portgroup";
  EXPECT_EQ(vswitch({"portgroup", "remove", "-p", "Storage", "-v", "vSwitch2"}).status, 0);
  EXPECT_EQ(vswitch({"uplink", "remove", "-u", "hynic3", "-v", "vSwitch2"}).status, 0);
  EXPECT_EQ(vswitch({"remove", "-v", "vSwitch2"}).status, 0);
  EXPECT_EQ(vswitch({"add"}).status, 1) << "no switch name";
  Finished list = vswitch({"list"});
  EXPECT_NE(list.out.find("vSwitch0\n   Num Ports: 128\n   Uplinks: hynic0, hynic1\n"),
            std::string::npos)
      << list.out;
}

TEST(HostTools, SshStartedThroughTheApiToolIsSeenByItsScript) {
  ScratchHost host;
  EXPECT_EQ(host.Run("etc/init.d/SSH", {"status"}).status, 3);
  EXPECT_EQ(host.Run("bin/osk-cmd", {"-U", "root", "hostsvc/start_ssh"}).status, 0);
  EXPECT_EQ(host.Run("etc/init.d/SSH", {"status"}).status, 0);
  EXPECT_TRUE(host.ReadState()["system"]["firewall"]["sshServer"]["enabled"])
      << "the ruleset follows the service";
  EXPECT_EQ(host.Run("etc/init.d/SSH", {"stop"}).status, 0);
  EXPECT_EQ(host.Run("etc/init.d/SSH", {"status"}).status, 3);
  Finished usage = host.Run("etc/init.d/TavShell", {"reload"});
  EXPECT_EQ(usage.status, 1);
  EXPECT_NE(usage.err.find("Usage: TavShell"), std::string::npos);
  EXPECT_EQ(
      SimTest::RunProgram({"/bin/sh", (host.Root() / "etc/init.d/TavShell").string(), "restart"})
          .status,
      0)
      << "scripts also run as \"sh <script>\"";
  EXPECT_EQ(host.ReadState()["services"]["TavShell"]["restarts"], 1);
}

TEST(HostTools, LockdownQueriesAndChanges) {
  ScratchHost host([](json& s) { s["lockdown"]["possible"] = false; });
  auto get = [&](const char* what) {
    return host.Run("bin/osk-cmd", {"-U", "root", "get", what}).out;
  };
  EXPECT_EQ(get("osksvc/auth/lockdown_is_enabled"), "false\n");
  EXPECT_EQ(get("osksvc/auth/lockdown_is_possible"), "false\n");
  EXPECT_EQ(host.Run("bin/osk-cmd", {"-U", "root", "osksvc/auth/lockdown_enter"}).status, 1);
  json state = host.ReadState();
  state["lockdown"]["possible"] = true;
  host.WriteState(state);
  EXPECT_EQ(host.Run("bin/osk-cmd", {"-U", "root", "osksvc/auth/lockdown_enter"}).status, 0);
  EXPECT_EQ(get("osksvc/auth/lockdown_is_enabled"), "true\n");
  EXPECT_EQ(host.Run("bin/osk-cmd", {"-U", "root", "osksvc/auth/lockdown_exit"}).status, 0);
  EXPECT_EQ(get("osksvc/auth/lockdown_is_enabled"), "false\n");
}

TEST(HostTools, OskCmdRefusesAUserMarkedUnable) {
  ScratchHost host;
  Finished refused = host.Run("bin/osk-cmd", {"-U", "operator", "hostsvc/start_tav_shell"});
  EXPECT_EQ(refused.status, 255);
  EXPECT_FALSE(host.ReadState()["services"]["TavShell"]["running"]);
  EXPECT_EQ(host.Run("bin/osk-cmd", {"-U", "root", "hostsvc/start_tav_shell"}).status, 0);
  EXPECT_TRUE(host.ReadState()["services"]["TavShell"]["running"]);
  EXPECT_EQ(host.Run("bin/osk-cmd", {"-U", "root", "hostsvc/fly"}).status, 1);
  EXPECT_EQ(host.Run("bin/osk-cmd", {"internalsvc/refresh"}).status, 1) << "no user";
}

TEST(HostTools, PoweringMachinesAndTheHost) {
  ScratchHost host([](json& s) {
    s["vms"].push_back({{"name", "db-03"}, {"state", "running"}, {"autostart", false}});
  });
  EXPECT_EQ(host.Run("bin/osk-cmd", {"-U", "root", "hostsvc/autostartmanager/autostop"}).status, 0);
  json state = host.ReadState();
  EXPECT_EQ(state["vms"][0]["lastPowerOff"], "autostop");
  EXPECT_EQ(state["vms"][2]["state"], "running") << "not an autostart machine";
  EXPECT_EQ(host.Run("sbin/powerOffVms", {"--terminate"}).status, 0);
  state = host.ReadState();
  EXPECT_EQ(state["vms"][2]["state"], "poweredOff");
  EXPECT_EQ(state["vms"][2]["lastPowerOff"], "terminate");

  EXPECT_EQ(host.Run("sbin/reboot", {"-f"}).status, 0);
  state = host.ReadState();
  EXPECT_EQ(state["power"], "rebooting");
  EXPECT_TRUE(state["powerForced"]);
  EXPECT_EQ(host.Run("sbin/poweroff", {}).status, 0);
  EXPECT_EQ(host.ReadState()["power"], "off");
}

TEST(HostTools, ManagementAgentsAndMaintenance) {
  ScratchHost host;
  EXPECT_EQ(host.Run("sbin/services.sh", {"stop"}).status, 0);
  json state = host.ReadState();
  EXPECT_FALSE(state["services"]["mgmtd"]["running"]);
  EXPECT_FALSE(state["services"]["hlma"]["running"]);
  EXPECT_EQ(host.Run("sbin/services.sh", {"start"}).status, 0);
  EXPECT_TRUE(host.ReadState()["services"]["mgmtd"]["running"]);

  state = host.ReadState();
  state["advancedOptions"]["/UserVars/TulkTimeOut"] = 60;
  state["services"]["zyo-opsagent"]["running"] = false;
  host.WriteState(state);
  EXPECT_EQ(host.Run("etc/init.d/zyo-opsagent", {"status"}).status, 3);
  EXPECT_EQ(host.Run("sbin/firmwareConfig.py", {"--reset-only"}).status, 0);
  EXPECT_EQ(host.ReadState()["advancedOptions"]["/UserVars/TulkTimeOut"], 600);
  EXPECT_EQ(host.Run("sbin/backup.sh", {"0"}).status, 0);
  EXPECT_EQ(host.ReadState()["configBackups"], 1);

  state = host.ReadState();
  state["services"]["zyo-opsagent"]["installed"] = false;
  host.WriteState(state);
  EXPECT_EQ(host.Run("etc/init.d/zyo-opsagent", {"status"}).status, 1);
}

TEST(HostTools, PingAnswersByReachabilityAndInterface) {
  ScratchHost host([](json& s) { s["network"]["hykernelNics"][0]["enabled"] = false; });
  EXPECT_EQ(host.Run("bin/hykping", {"-c", "3", "10.20.30.2"}).status, 0);
  EXPECT_EQ(host.Run("bin/hykping", {"-c", "3", "fe80::0001%hyk0"}).status, 0);
  EXPECT_EQ(host.Run("bin/hykping", {"-c", "3", "10.20.30.9"}).status, 1);
  EXPECT_EQ(host.Run("bin/hykping", {"-c", "3", "-I", "hyk0", "10.20.30.2"}).status, 1)
      << "hyk0 is down";
  EXPECT_EQ(host.Run("bin/hykping", {"-c", "3", "-I", "hyk7", "10.20.30.2"}).status, 2);
}

TEST(HostTools, OverridesSetExitCodeOutputAndDelay) {
  ScratchHost host([](json& s) {
    s["commands"]["osk-cmd"] = {{"stdout", "generic\n"}};
    s["commands"]["osk-cmd -U root hostsvc/start_ssh"] = {{"exitCode", 1},
                                                          {"stderr", "agent busy\n"}};
    s["commands"]["hykping * 10.20.30.1"] = {{"exitCode", 1}};
    s["commands"]["services.sh stop"] = {{"delayMs", 300}};
  });
  Finished refused = host.Run("bin/osk-cmd", {"-U", "root", "hostsvc/start_ssh"});
  EXPECT_EQ(refused.status, 1);
  EXPECT_EQ(refused.err, "agent busy\n");
  EXPECT_FALSE(host.ReadState()["services"]["SSH"]["running"])
      << "a failing override has no effect";

  Finished generic = host.Run("bin/osk-cmd", {"-U", "root", "hostsvc/start_tav_shell"});
  EXPECT_EQ(generic.status, 0);
  EXPECT_EQ(generic.out, "generic\n");
  EXPECT_TRUE(host.ReadState()["services"]["TavShell"]["running"]);

  EXPECT_EQ(host.Run("bin/hykping", {"-c", "3", "-I", "hyk0", "10.20.30.1"}).status, 1);
  EXPECT_EQ(host.Run("bin/hykping", {"-c", "3", "-I", "hyk0", "10.20.30.2"}).status, 0);

  const auto start = std::chrono::steady_clock::now();
  EXPECT_EQ(host.Run("sbin/services.sh", {"stop"}).status, 0);
  EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(300));
  EXPECT_EQ(host.Run("sbin/services.sh", {"stopx"}).status, 1) << "prefixes end at a word";

  auto records = host.Records("commands.jsonl");
  ASSERT_GE(records.size(), 4u);
  EXPECT_EQ(records[0]["argv"], json::array({"osk-cmd", "-U", "root", "hostsvc/start_ssh"}));
  EXPECT_EQ(records[0]["exitCode"], 1);
  const auto delayed = records.end() - 3;
  EXPECT_EQ((*delayed)["argv"], json::array({"services.sh", "stop"}));
  EXPECT_TRUE((*delayed)["exitCode"].is_null()) << "recorded before the wait";
  EXPECT_EQ((*(delayed + 1))["exitCode"], 0);
}

TEST(HostTools, InstallLaysOutARootRepeatedly) {
  ScratchHost host;
  const auto root = host.Root();
  Finished again = SimTest::RunProgram({TULK_TEST_HOSTTOOL, "--install", root.string()});
  EXPECT_EQ(again.status, 0) << again.err;
  for (const char* path : {"bin/tavcli",
                           "sbin/tavcli",
                           "sbin/localcli",
                           "bin/osk-cmd",
                           "sbin/powerOffVms",
                           "bin/powerOffVms",
                           "bin/hykping",
                           "sbin/hykbacktrace",
                           "sbin/firmwareConfig.py",
                           "sbin/poweroff",
                           "sbin/reboot",
                           "etc/init.d/TavShell",
                           "etc/init.d/SSH",
                           "etc/init.d/zyo-opsagent",
                           "sbin/services.sh",
                           "sbin/backup.sh",
                           "bin/sh",
                           "bin/less",
                           "bin/openssl",
                           "bin/awk",
                           "usr/lib/brimlo/openssh/bin/ssh-keygen"}) {
    EXPECT_EQ(access((root / path).c_str(), X_OK), 0) << path;
  }
  for (const char* folder : {"var/run", "var/log", "etc/brimlo/ssl", "var/lib/tulk-sim"}) {
    EXPECT_TRUE(std::filesystem::is_directory(root / folder)) << folder;
  }
  const std::filesystem::path linkToRoot = root.parent_path() / "link-to-root";
  std::filesystem::create_directory_symlink("/", linkToRoot);
  for (const std::string& real : {std::string("/"), std::string("/tmp/.."), linkToRoot.string()}) {
    EXPECT_EQ(SimTest::RunProgram({TULK_TEST_HOSTTOOL, "--install", real}).status, 1) << real;
  }
  Finished demo = SimTest::RunProgram({TULK_TEST_HOSTTOOL, "--demo-state"});
  EXPECT_EQ(json::parse(demo.out)["network"]["dns"]["hostname"], "tavi-01");
}

// A tool whose root leads to the machine's own root refuses before it acts
// or records anything.
TEST(HostTools, ToolRefusesARootThatIsTheRealOne) {
  ScratchHost host;
  const std::string scratch = host.Root().string();
  for (const char* root : {"/tmp/..", "/proc/self/root"}) {
    setenv("TULK_ROOT", root, 1);
    Finished run = host.Run("bin/osk-cmd", {"-U", "root", "internalsvc/refresh"});
    EXPECT_EQ(run.status, 1) << root;
    EXPECT_NE(run.err.find("refusing to act on the real root"), std::string::npos) << run.err;
  }
  setenv("TULK_ROOT", scratch.c_str(), 1);
  EXPECT_EQ(host.Run("bin/osk-cmd", {"-U", "root", "internalsvc/refresh"}).status, 0);
}

TEST(HostTools, WithoutAStateFileAToolRefuses) {
  ScratchHost host;
  unsetenv("TULK_HOST_STATE");
  Finished run = host.Run("bin/osk-cmd", {"-U", "root", "internalsvc/refresh"});
  EXPECT_EQ(run.status, 1);
  EXPECT_NE(run.err.find("no host state"), std::string::npos) << run.err;
}

}  // namespace
