#include "HostTestRoot.h"

#include <gtest/gtest.h>
#include <stdlib.h>

#include <fstream>
#include <sstream>

#include "platform/sim/DemoHost.h"

namespace HostTest {
namespace {

namespace fs = std::filesystem;

fs::path g_folder;
fs::path g_root;

std::string ReadFile(const fs::path& path) {
  std::ifstream in(path, std::ios::binary);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

void WriteFile(const fs::path& path, const std::string& text) {
  std::ofstream(path, std::ios::binary | std::ios::trunc) << text;
}

std::vector<std::string> Lines(const fs::path& path) {
  std::vector<std::string> lines;
  std::istringstream in(ReadFile(path));
  for (std::string line; std::getline(in, line);) {
    lines.push_back(line);
  }
  return lines;
}

class RootEnvironment : public ::testing::Environment {
 public:
  void SetUp() override {
    std::string pattern = (fs::temp_directory_path() / "tulk-host-test-XXXXXX").string();
    ASSERT_NE(mkdtemp(pattern.data()), nullptr);
    g_folder = pattern;
    g_root = g_folder / "root";
    std::string install = std::string(HOST_TEST_HOSTTOOL) + " --install " + g_root.string();
    ASSERT_EQ(std::system(install.c_str()), 0) << install;
    setenv("TULK_ROOT", g_root.c_str(), 1);
    setenv("TULK_LOG_FILE", (g_folder / "log").c_str(), 1);
    setenv("TULK_HOST_STATE", (g_folder / "host.json").c_str(), 1);
    WriteFile(g_folder / "host.json", "{}");
  }
  void TearDown() override {
    if (std::getenv("TULK_KEEP_TEST_ROOT") == nullptr) {
      std::error_code ignored;
      fs::remove_all(g_folder, ignored);
    }
  }
};

[[maybe_unused]] const ::testing::Environment* const kEnvironment =
    ::testing::AddGlobalTestEnvironment(new RootEnvironment);

}  // namespace

const fs::path& Root() {
  return g_root;
}

std::vector<std::string> LogLines() {
  return Lines(g_folder / "log");
}

void ClearLog() {
  WriteFile(g_folder / "log", "");
}

bool Logged(const std::string& line) {
  for (const std::string& logged : LogLines()) {
    if (logged == line) {
      return true;
    }
  }
  return false;
}

void WriteScript(const std::string& hostPath, const std::string& body) {
  fs::path path = g_root / fs::path(hostPath).relative_path();
  WriteFile(path, "#!/bin/sh\n" + body + "\n");
  fs::permissions(path, fs::perms::owner_all);
}

void WriteHostState(const nlohmann::json& state) {
  WriteFile(g_folder / "host.json.new", state.dump());
  fs::rename(g_folder / "host.json.new", g_folder / "host.json");
}

nlohmann::json ReadHostState() {
  return nlohmann::json::parse(ReadFile(g_folder / "host.json"));
}

std::vector<nlohmann::json> Records(const char* file) {
  std::vector<nlohmann::json> records;
  for (const std::string& line : Lines(g_root / "var/log/tulk-sim" / file)) {
    records.push_back(nlohmann::json::parse(line));
  }
  return records;
}

void ClearRecords() {
  for (const char* file : {"commands.jsonl", "events.jsonl", "audit.jsonl"}) {
    fs::remove(g_root / "var/log/tulk-sim" / file);
  }
}

void HostStateTest::SetUp() {
  ClearLog();
  ClearRecords();
  state_ = Sim::DemoHostState();
  Apply();
}

}  // namespace HostTest
