// The simulated host's state file: persistence, re-reading, validation,
// fault injection and concurrent changes.

#include <gtest/gtest.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <atomic>
#include <filesystem>
#include <fstream>
#include <functional>
#include <sstream>
#include <thread>

#include "SimTestSupport.h"
#include "platform/api/AdvancedOption.h"
#include "platform/api/Authentication.h"
#include "platform/api/BrlAudit.h"
#include "platform/api/DnsConfigImpl.h"
#include "platform/api/Host.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/HykCtlExec.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/PnicImpl.h"
#include "platform/api/PortGroupImpl.h"
#include "platform/api/PortsetImpl.h"
#include "platform/api/Preference.h"
#include "platform/api/QobUserLib.h"
#include "platform/api/SystemInformation.h"
#include "platform/sim/DemoHost.h"
#include "platform/sim/SimHost.h"
#include "platform/sim/StateSchema.h"

extern char** environ;

namespace {

using HostMgr::Lib::HostMgrException;
using nlohmann::json;
using SimTest::ScratchHost;

std::string FileText(const std::filesystem::path& path) {
  std::ifstream in(path);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

TEST(StateStore, ChangesPersistAcrossRuns) {
  ScratchHost host;
  HykCtl::Adv::UserAdvancedOptionImpl().SetUserOption("/UserVars/TulkTimeOut", 120);
  HykCtl::Network::DnsConfigImpl().SetFqdn("edge-7.lab.example.net");
  EXPECT_EQ(host.ReadState()["advancedOptions"]["/UserVars/TulkTimeOut"], 120);

  Sim::SimHost::Instance().Reset();  // as a new process would start
  EXPECT_EQ(HykCtl::Adv::UserAdvancedOptionImpl().GetUserOption("/UserVars/TulkTimeOut"), 120);
  HykCtl::Network::DnsConfigImpl dns;
  EXPECT_EQ(dns.GetHostname(), "edge-7");
  EXPECT_EQ(dns.GetDomain(), "lab.example.net");
}

TEST(StateStore, RereadsOnlyAReplacedFile) {
  ScratchHost host;
  HykCtl::Adv::UserAdvancedOptionImpl options;
  const auto generation = Sim::SimHost::Instance().Generation();
  for (int i = 0; i < 5; ++i) {
    options.GetUserOption("/UserVars/TulkTimeOut");
  }
  EXPECT_EQ(Sim::SimHost::Instance().Generation(), generation);

  json state = host.ReadState();
  state["advancedOptions"]["/UserVars/TulkTimeOut"] = 42;
  host.WriteState(state);
  EXPECT_EQ(options.GetUserOption("/UserVars/TulkTimeOut"), 42);
  EXPECT_NE(Sim::SimHost::Instance().Generation(), generation);
}

TEST(StateStore, MalformedReplacementKeepsLastGoodStateAndIsNeverOverwritten) {
  ScratchHost host;
  HykCtl::Adv::UserAdvancedOptionImpl options;
  options.GetUserOption("/UserVars/TulkTimeOut");
  std::ofstream(host.StateFile()) << "{\"advancedOptions\": ";
  EXPECT_EQ(options.GetUserOption("/UserVars/TulkTimeOut"), 600);
  EXPECT_THROW(options.SetUserOption("/UserVars/TulkTimeOut", 5), HostMgrException);
  EXPECT_EQ(FileText(host.StateFile()), "{\"advancedOptions\": ");
}

TEST(StateStore, ValidationNamesTheOffendingField) {
  const struct {
    std::function<void(json&)> edit;
    const char* message;
  } cases[] = {
      {[](json& s) { s["network"]["pnics"][1]["linkUp"] = "yes"; },
       "network.pnics[1].linkUp must be a boolean"},
      {[](json& s) { s["network"]["pnics"][0].erase("name"); }, "network.pnics[0].name is missing"},
      {[](json& s) { s["network"]["hykernelNics"][0]["ipv4"]["address"] = "10.0.1"; },
       "network.hykernelNics[0].ipv4.address must be an IPv4 address text"},
      {[](json& s) { s["network"]["hykernelNics"][0]["ipv4"]["mode"] = "auto"; },
       "network.hykernelNics[0].ipv4.mode must be"},
      {[](json& s) { s["network"]["switches"][0]["type"] = "virtual"; },
       "network.switches[0].type must be"},
      {[](json& s) { s["network"]["dns"]["nameServers"][1] = "dns.example.net"; },
       "network.dns.nameServers[1] must be an IP address text"},
      {[](json& s) { s["advancedOptions"]["/UserVars/TulkTimeOut"] = "600"; },
       "advancedOptions[\"/UserVars/TulkTimeOut\"] must be an integer"},
      {[](json& s) { s["hardware"]["memory"]["totalPages"] = 1.5; },
       "hardware.memory.totalPages must be an integer"},
      {[](json& s) { s["faults"]["HSI_Get"] = 3; }, "faults[\"HSI_Get\"] must be a string"},
      {[](json& s) {
         s["commands"]["reboot"] = {{"delayMs", "10"}};
       },
       "commands[\"reboot\"].delayMs must be an integer"},
      {[](json& s) { s["services"]["SSH"]["running"] = 1; },
       "services[\"SSH\"].running must be a boolean"},
      {[](json& s) { s["vms"] = json::object(); }, "vms must be an array"},
      {[](json& s) { s = json::array(); }, "the document must be a JSON object"},
  };
  for (const auto& c : cases) {
    json state = Sim::DemoHostState();
    c.edit(state);
    try {
      Sim::ValidateState(state);
      ADD_FAILURE() << "accepted; expected: " << c.message;
    } catch (const Sim::StateError& error) {
      EXPECT_NE(std::string(error.what()).find(c.message), std::string::npos)
          << error.what() << "\nexpected: " << c.message;
    }
  }
  EXPECT_NO_THROW(Sim::ValidateState(Sim::DemoHostState()));
  EXPECT_NO_THROW(Sim::ValidateState(json::object())) << "every section is optional";
}

// Runs Preference_Init in a child: its exit status and standard error.
SimTest::Finished PreferenceInitInChild() {
  int err[2];
  EXPECT_EQ(pipe(err), 0);
  pid_t pid = fork();
  if (pid == 0) {
    dup2(err[1], 2);
    Sim::SimHost::Instance().Reset();
    Preference_Init();
    _exit(0);
  }
  close(err[1]);
  SimTest::Finished finished;
  char buffer[1024];
  for (ssize_t got; (got = read(err[0], buffer, sizeof buffer)) > 0;) {
    finished.err.append(buffer, static_cast<std::size_t>(got));
  }
  close(err[0]);
  int status = 0;
  waitpid(pid, &status, 0);
  finished.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  return finished;
}

TEST(StateStore, MalformedFileStopsStartupWithOneLineAndExitOne) {
  ScratchHost host(std::string(R"({"network": {"pnics": [{"name": "hynic0", "linkUp": "up"}]}})"));
  const std::string before = FileText(host.StateFile());
  SimTest::Finished run = PreferenceInitInChild();
  EXPECT_EQ(run.status, 1);
  EXPECT_NE(run.err.find("malformed host state: network.pnics[0].linkUp must be a boolean"),
            std::string::npos)
      << run.err;
  EXPECT_EQ(std::count(run.err.begin(), run.err.end(), '\n'), 1) << run.err;
  EXPECT_EQ(FileText(host.StateFile()), before);

  std::ofstream(host.StateFile()) << "not json";
  run = PreferenceInitInChild();
  EXPECT_EQ(run.status, 1);
  EXPECT_NE(run.err.find("malformed host state: not valid JSON"), std::string::npos) << run.err;
}

// Any path that leads to the machine's own root is refused, not only "/"
// as written; so is a root that does not exist.
TEST(StateStore, RefusesToRunAgainstTheRealRoot) {
  ScratchHost host;
  const std::filesystem::path linkToRoot = host.Root().parent_path() / "link-to-root";
  std::filesystem::create_directory_symlink("/", linkToRoot);
  std::string climb = host.Root().string();
  for (const char c : host.Root().string()) {
    if (c == '/') {
      climb += "/..";
    }
  }
  for (const std::string& root :
       {std::string("/"), std::string("//"), std::string("/./"), std::string("/tmp/.."),
        std::string("/proc/self/root"), linkToRoot.string(), climb,
        (host.Root() / "missing").string(), std::string()}) {
    setenv("TULK_ROOT", root.c_str(), 1);
    SimTest::Finished run = PreferenceInitInChild();
    EXPECT_EQ(run.status, 1) << "TULK_ROOT=" << root;
    EXPECT_NE(run.err.find("TULK_ROOT"), std::string::npos) << run.err;
  }
  setenv("TULK_ROOT", host.Root().c_str(), 1);
  EXPECT_EQ(PreferenceInitInChild().status, 0);
}

// A file nested too deep for the writers to walk is malformed, at start and
// when it replaces a good state.
TEST(StateStore, DeeplyNestedStateIsRefused) {
  std::string deep = "{\"extra\": ";
  for (int level = 0; level < 50000; ++level) {
    deep += "[";
  }
  deep += std::string(50000, ']') + "}";
  {
    ScratchHost host(deep);
    SimTest::Finished run = PreferenceInitInChild();
    EXPECT_EQ(run.status, 1);
    EXPECT_NE(run.err.find("malformed host state: nesting deeper than 64 levels"),
              std::string::npos)
        << run.err;
  }
  ScratchHost host;
  HykCtl::Adv::UserAdvancedOptionImpl options;
  EXPECT_EQ(options.GetUserOption("/UserVars/TulkTimeOut"), 600);
  std::ofstream(host.StateFile()) << deep;
  EXPECT_EQ(options.GetUserOption("/UserVars/TulkTimeOut"), 600);
  EXPECT_THROW(options.SetUserOption("/UserVars/TulkTimeOut", 5), HostMgrException);

  // Nesting the writers can walk is kept.
  json state = json::object();
  json* level = &state["extra"];
  for (int depth = 0; depth < 60; ++depth) {
    level = &(*level)["next"];
  }
  *level = 1;
  host.WriteState(state);
  options.SetUserOption("/UserVars/TulkTimeOut", 5);
  EXPECT_EQ(host.ReadState()["advancedOptions"]["/UserVars/TulkTimeOut"], 5);
}

// A writer killed between writing its temporary file and renaming it leaves
// the file behind; the next write clears such files away, and only them.
TEST(StateStore, NextWriteRemovesTemporariesLeftByKilledWriters) {
  ScratchHost host;
  const std::filesystem::path folder = host.StateFile().parent_path();
  const std::string name = host.StateFile().filename().string();
  for (const std::string& left : {name + ".tmp.Ab3dE9", name + ".tmp.zz0001"}) {
    std::ofstream(folder / left) << "{\"half\": ";
  }
  std::ofstream(folder / "notes.tmp.keep") << "not ours";
  HykCtl::Adv::UserAdvancedOptionImpl().SetUserOption("/UserVars/TulkTimeOut", 90);
  std::vector<std::string> names;
  for (const auto& entry : std::filesystem::directory_iterator(folder)) {
    names.push_back(entry.path().filename().string());
  }
  for (const std::string& entry : names) {
    EXPECT_EQ(entry.find(name + ".tmp."), std::string::npos) << entry;
  }
  EXPECT_TRUE(std::filesystem::exists(folder / "notes.tmp.keep"));
  EXPECT_EQ(host.ReadState()["advancedOptions"]["/UserVars/TulkTimeOut"], 90);
}

TEST(StateStore, FaultsReachEveryKindOfOperation) {
  using Call = std::function<void()>;
  const struct {
    const char* fault;
    Call call;
  } cases[] = {
      {"HykCtl::Network::NetworkInfoImpl::GetPnics",
       [] { HykCtl::Network::NetworkInfoImpl().GetPnics(); }},
      {"HykCtl::Network::PnicImpl::PnicImpl", [] { HykCtl::Network::PnicImpl("hynic0"); }},
      {"HykCtl::Network::PortsetImpl::IsValidVirtualSwitch",
       [] { HykCtl::Network::PortsetImpl::IsValidVirtualSwitch("vSwitch0"); }},
      {"HykCtl::Network::PortGroupImpl::SetVlanId",
       [] { HykCtl::Network::PortGroupImpl("Management Network").SetVlanId(12); }},
      {"HykCtl::Network::DnsConfigImpl::SaveConfig",
       [] { HykCtl::Network::DnsConfigImpl().SaveConfig(); }},
      {"HostMgr::HostFactory::GetHost", [] { HostMgr::HostFactory::GetHost(); }},
      {"HostMgr::Host::GetStorageInfo", [] { HostMgr::HostFactory::GetHost()->GetStorageInfo(); }},
      {"HostMgr::Authentication::StoreUserAccountsToCs",
       [] { HostMgr::Authentication::StoreUserAccountsToCs(); }},
      {"HostMgr::Authentication::LookupSmartCardTokens",
       [] { HostMgr::Authentication::LookupSmartCardTokens(); }},
      {"HykCtl::Util::HykCtl_Exec", [] { HykCtl::Util::HykCtl_Exec("true", false, true, false); }},
      {"HSI_Get",
       [] {
         HSI_SystemVersion version;
         HSI_Get(HSI_NODE_system_version, &version, sizeof version);
       }},
      {"PortGroupImpl::GetVlanId",
       [] { HykCtl::Network::PortGroupImpl("Management Network").GetVlanId(); }},
  };
  for (const auto& c : cases) {
    ScratchHost host([&](json& s) { s["faults"][c.fault] = "injected failure"; });
    try {
      c.call();
      ADD_FAILURE() << c.fault << " did not fail";
    } catch (const HostMgrException& error) {
      EXPECT_STREQ(error.what(), "injected failure") << c.fault;
    }
  }
}

TEST(StateStore, FailedChangeLeavesTheStateAlone) {
  ScratchHost host([](json& s) { s["faults"]["PortGroupImpl::SetVlanId"] = "busy"; });
  const std::string before = FileText(host.StateFile());
  EXPECT_THROW(HykCtl::Network::PortGroupImpl("Management Network").SetVlanId(7), HostMgrException);
  EXPECT_THROW(HykCtl::Network::PortGroupImpl("VM Network").SetVlanId(5000), HostMgrException)
      << "an invalid id fails inside the change";
  EXPECT_EQ(FileText(host.StateFile()), before);
}

TEST(StateStore, FaultsOfCFunctionsBecomeErrorCodes) {
  ScratchHost host([](json& s) {
    s["faults"]["QobUserLib_Init"] = "17";
    s["faults"]["BrlAudit_LogList"] = "audit log full";
  });
  EXPECT_EQ(QobUserLib_Init(), 17);
  EXPECT_EQ(QobUserLib_AddQob("@&!*@*@(qob.user.tulk.reboot.host)Rebooting host", nullptr, 0), 1)
      << "the facility did not open";
  EXPECT_NE(BrlAudit_LogList("tulk.login", "tulk", "root", BRL_AUDIT_SUCCESS, nullptr, 0), 0);
  EXPECT_TRUE(host.Records("events.jsonl").empty());
  EXPECT_TRUE(host.Records("audit.jsonl").empty());
}

TEST(StateStore, ConcurrentChangesFromToolsAndTheConsoleAreAllKept) {
  ScratchHost host;
  constexpr int kWriters = 3;
  constexpr int kToolRuns = 15;
  constexpr int kConsoleChanges = 40;
  const std::string loop = "i=0; while [ $i -lt " + std::to_string(kToolRuns) + " ]; do '" +
                           (host.Root() / "sbin/backup.sh").string() +
                           "' 0 >/dev/null; i=$((i+1)); done";
  std::vector<pid_t> writers;
  for (int w = 0; w < kWriters; ++w) {
    const char* argv[] = {"/bin/sh", "-c", loop.c_str(), nullptr};
    pid_t pid = -1;
    ASSERT_EQ(posix_spawn(&pid, "/bin/sh", nullptr, nullptr, const_cast<char**>(argv), environ), 0);
    writers.push_back(pid);
  }
  for (int i = 0; i < kConsoleChanges; ++i) {
    HostMgr::Authentication::StoreUserAccountsToCs();
  }
  for (pid_t pid : writers) {
    int status = 0;
    waitpid(pid, &status, 0);
    EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
  }
  const json state = host.ReadState();
  EXPECT_EQ(state["configBackups"], kWriters * kToolRuns);
  EXPECT_EQ(state["users"]["configStoreSaves"], kConsoleChanges);
}

TEST(StateStore, WorkerThreadsQueryWhileTheStateChanges) {
  ScratchHost host;
  std::atomic<bool> stop = false;
  std::atomic<int> failures = 0;
  std::vector<std::thread> readers;
  for (int t = 0; t < 3; ++t) {
    readers.emplace_back([&] {
      while (!stop) {
        try {
          HykCtl::Network::DnsConfigImpl dns;
          if (dns.GetHostname() != "tavi-01" ||
              HykCtl::Network::NetworkInfoImpl().GetPnics().size() != 4) {
            ++failures;
          }
        } catch (const HostMgrException&) {
          ++failures;
        }
      }
    });
  }
  HykCtl::Network::PortGroupImpl group("Management Network");
  for (int i = 0; i < 30; ++i) {
    group.SetVlanId(i);
    json state = host.ReadState();
    state["network"]["portGroups"][1]["vlanId"] = i;
    host.WriteState(state);
  }
  stop = true;
  for (std::thread& reader : readers) {
    reader.join();
  }
  EXPECT_EQ(failures, 0);
  EXPECT_EQ(group.GetVlanId(), 29);
}

}  // namespace
