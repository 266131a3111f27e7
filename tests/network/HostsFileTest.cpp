// The hosts file around the name check of the network test, and the name
// check itself on the simulated host: the file is always given back as it
// was, only from a backup that was made, also after a console that died
// half-way; names resolve through the simulated host's DNS view only.

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

#include "HostTestRoot.h"
#include "host/HostsFileBackup.h"
#include "network/ResolveHostName.h"
#include "platform/sim/DemoHost.h"
#include "runtime/WorkerResult.h"

namespace {

namespace fs = std::filesystem;
using nlohmann::json;
using namespace Tulk;

constexpr char kHosts[] =
    "# the host's names\n"
    "127.0.0.1\tlocalhost\n"
    "10.20.30.41\ttavi-01.lab.example.net tavi-01\n"
    "10.20.30.9\tbuild-cache\n";

fs::path At(const char* hostPath) {
  return HostTest::Root() / std::string(hostPath).substr(1);
}

std::string Read(const fs::path& path) {
  std::ifstream in(path);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

void Write(const fs::path& path, const std::string& text) {
  std::ofstream(path, std::ios::trunc) << text;
}

int Resolve(const std::string& name) {
  std::shared_ptr<WorkerResult> result = WorkerResult::Create();
  ResolveHostName(name, result);
  return result->Get();
}

class HostsFileTest : public HostTest::HostStateTest {
 protected:
  void SetUp() override {
    HostStateTest::SetUp();
    fs::remove(At(kHostsBackup));
    Write(At(kHostsFile), kHosts);
  }
};

TEST_F(HostsFileTest, BackupAndRestoreGiveTheFileBackByteForByte) {
  ASSERT_TRUE(BackUpHostsFile());
  EXPECT_EQ(Read(At(kHostsBackup)), kHosts);
  EXPECT_FALSE(fs::exists(HostTest::Root() / "etc/hosts.backup.partial"));
  ASSERT_TRUE(RemoveHostsFileEntry("tavi-01.lab.example.net"));
  EXPECT_EQ(Read(At(kHostsFile)).find("tavi-01"), std::string::npos);
  ASSERT_TRUE(RestoreHostsFile());
  EXPECT_EQ(Read(At(kHostsFile)), kHosts);
  EXPECT_FALSE(fs::exists(At(kHostsBackup)));
}

TEST_F(HostsFileTest, WithoutABackupNothingIsRemovedOrRestored) {
  EXPECT_FALSE(RestoreHostsFile());
  EXPECT_EQ(Read(At(kHostsFile)), kHosts);

  fs::remove(At(kHostsFile));
  EXPECT_FALSE(BackUpHostsFile());
  const std::vector<std::string> lines = HostTest::LogLines();
  ASSERT_EQ(lines.size(), 1u) << ::testing::PrintToString(lines);
  EXPECT_EQ(lines[0].rfind("<14>failed to backup /etc/hosts: ", 0), 0u) << lines[0];
  EXPECT_FALSE(fs::exists(At(kHostsBackup)));
  EXPECT_FALSE(fs::exists(HostTest::Root() / "etc/hosts.backup.partial"));
  // The whole check then resolves without touching the (missing) file.
  EXPECT_EQ(Resolve("tavi-01.lab.example.net"), 0);
  EXPECT_FALSE(fs::exists(At(kHostsFile)));
}

TEST_F(HostsFileTest, StartUpPutsALeftOverBackupBack) {
  Write(At(kHostsBackup), kHosts);
  Write(At(kHostsFile), "127.0.0.1\tlocalhost\n");
  EXPECT_TRUE(RecoverHostsFile());
  EXPECT_EQ(Read(At(kHostsFile)), kHosts);
  EXPECT_FALSE(fs::exists(At(kHostsBackup)));
  EXPECT_TRUE(HostTest::Logged(
      "<12>Restored /etc/hosts from /etc/hosts.backup left by an interrupted network test"));

  // A console killed between the remove and the rename of a restore.
  Write(At(kHostsBackup), kHosts);
  fs::remove(At(kHostsFile));
  EXPECT_TRUE(RecoverHostsFile());
  EXPECT_EQ(Read(At(kHostsFile)), kHosts);

  HostTest::ClearLog();
  EXPECT_FALSE(RecoverHostsFile());
  EXPECT_TRUE(HostTest::LogLines().empty());
}

TEST_F(HostsFileTest, TheNameMustResolveThroughDnsNotTheHostsFile) {
  struct Case {
    const char* what;
    std::function<void(json&)> edit;
    const char* name;
    int result;
  };
  const Case cases[] = {
      {"a DNS record", [](json&) {}, "tavi-01.lab.example.net", 0},
      {"a bare name through the search domains", [](json&) {}, "tavi-01", 0},
      {"names compare without case", [](json&) {}, "TAVI-01.Lab.Example.Net.", 0},
      {"only the hosts file knows it",
       [](json& host) { host["network"]["dnsRecords"].erase("tavi-01.lab.example.net"); },
       "tavi-01.lab.example.net", 1},
      {"any name the hosts file alone knows", [](json&) {}, "build-cache", 1},
      {"no name server answers",
       [](json& host) { host["network"]["reachable"] = json::array({"10.20.30.1"}); },
       "tavi-01.lab.example.net", 1},
      {"the management NIC is down",
       [](json& host) { host["network"]["hykernelNics"][0]["enabled"] = false; },
       "tavi-01.lab.example.net", 1},
      {"the library fails",
       [](json& host) { host["faults"]["NameResolver::Resolve"] = "resolver gone"; },
       "tavi-01.lab.example.net", 1},
  };
  for (const Case& c : cases) {
    state_ = Sim::DemoHostState();
    c.edit(state_);
    Apply();
    EXPECT_EQ(Resolve(c.name), c.result) << c.what;
    EXPECT_EQ(Read(At(kHostsFile)), kHosts) << c.what;
    EXPECT_FALSE(fs::exists(At(kHostsBackup))) << c.what;
  }
  EXPECT_TRUE(HostTest::Logged("<11>Resolving tavi-01.lab.example.net failed: resolver gone"));
}

}  // namespace
