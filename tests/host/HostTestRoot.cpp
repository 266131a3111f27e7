#include "HostTestRoot.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <sstream>

namespace HostTest {
namespace {

namespace fs = std::filesystem;

fs::path g_root;
fs::path g_folder;

// Real programs the tests' shell lines use; the child's PATH only reaches
// the root's bin and sbin folders.
const char* const kPrograms[] = {"sh",   "cat", "sleep", "awk", "head", "tr",      "grep",
                                 "true", "env", "kill",  "ls",  "wc",   "basename"};

fs::path FindProgram(const std::string& name) {
  for (const char* folder : {"/usr/bin", "/bin", "/usr/sbin", "/sbin"}) {
    fs::path candidate = fs::path(folder) / name;
    if (access(candidate.c_str(), X_OK) == 0) {
      return candidate;
    }
  }
  return {};
}

void WriteText(const fs::path& path, const std::string& text) {
  fs::create_directories(path.parent_path());
  std::ofstream(path, std::ios::binary | std::ios::trunc) << text;
}

}  // namespace

void HostTestRoot::SetUp() {
  std::string pattern = (fs::temp_directory_path() / "tulk-host-test-XXXXXX").string();
  ASSERT_NE(mkdtemp(pattern.data()), nullptr);
  g_folder = pattern;
  g_root = g_folder / "root";
  for (const char* folder : {"bin", "sbin", "etc/init.d", "var/log", "var/run"}) {
    fs::create_directories(g_root / folder);
  }
  for (const char* program : kPrograms) {
    fs::path real = FindProgram(program);
    if (!real.empty()) {
      fs::create_symlink(real, g_root / "bin" / program);
    }
  }
  setenv("TULK_ROOT", g_root.c_str(), 1);
  setenv("TULK_LOG_FILE", (g_folder / "log").c_str(), 1);
  setenv("TULK_HOST_STATE", (g_folder / "host.json").c_str(), 1);
  setenv("TULK_TEST_INVOCATIONS", (g_folder / "invocations").c_str(), 1);
  WriteText(g_folder / "host.json", "{}");
}

void HostTestRoot::TearDown() {
  if (std::getenv("TULK_KEEP_TEST_ROOT") == nullptr) {
    std::error_code ignored;
    fs::remove_all(g_folder, ignored);
  }
}

const fs::path& Root() {
  return g_root;
}

std::string ReadFile(const fs::path& path) {
  std::ifstream in(path, std::ios::binary);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

namespace {

std::vector<std::string> Lines(const fs::path& path) {
  std::vector<std::string> lines;
  std::istringstream in(ReadFile(path));
  for (std::string line; std::getline(in, line);) {
    lines.push_back(line);
  }
  return lines;
}

}  // namespace

std::vector<std::string> LogLines() {
  return Lines(g_folder / "log");
}

void ClearLog() {
  WriteText(g_folder / "log", "");
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
  WriteText(path, "#!/bin/sh\n" + body + "\n");
  fs::permissions(path, fs::perms::owner_all | fs::perms::group_read | fs::perms::group_exec);
}

void WriteRecordingTool(const std::string& hostPath, const std::string& body,
                        const std::string& recordVariable) {
  std::string script = "echo \"$(basename \"$0\") $*\" >> \"$TULK_TEST_INVOCATIONS\"\n";
  if (!recordVariable.empty()) {
    script += "echo \"$(basename \"$0\") $" + recordVariable + "\" >> \"$TULK_TEST_INVOCATIONS\"\n";
  }
  WriteScript(hostPath, script + body);
}

std::vector<std::string> Invocations() {
  return Lines(g_folder / "invocations");
}

void ClearInvocations() {
  WriteText(g_folder / "invocations", "");
}

void WriteHostState(const std::string& json) {
  fs::path temporary = g_folder / "host.json.new";
  WriteText(temporary, json);
  fs::rename(temporary, g_folder / "host.json");
}

}  // namespace HostTest

namespace {
[[maybe_unused]] const ::testing::Environment* const kEnvironment =
    ::testing::AddGlobalTestEnvironment(new HostTest::HostTestRoot);
}  // namespace
