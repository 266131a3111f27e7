#include "runtime/PidFile.h"

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

namespace {

// The host root is read once per process: every test here shares one root.
struct RootSetUp {
  RootSetUp() {
    std::string pattern = (std::filesystem::temp_directory_path() / "tulk-pid-XXXXXX").string();
    root = mkdtemp(pattern.data());
    std::filesystem::create_directories(root / "var/run");
    log = root.parent_path() / (root.filename().string() + ".log");
    setenv("TULK_ROOT", root.c_str(), 1);
    setenv("TULK_LOG_FILE", log.c_str(), 1);
  }
  ~RootSetUp() {
    std::error_code ignored;
    std::filesystem::remove_all(root, ignored);
    std::filesystem::remove(log, ignored);
  }
  std::filesystem::path root;
  std::filesystem::path log;
};

RootSetUp& Root() {
  static RootSetUp setUp;
  return setUp;
}

std::string ReadFile(const std::filesystem::path& path) {
  std::ifstream in(path);
  std::stringstream text;
  text << in.rdbuf();
  return text.str();
}

class PidFileTest : public ::testing::Test {
 protected:
  void SetUp() override {
    pidFile_ = Root().root / "var/run/tulk.pid";
    std::filesystem::remove(pidFile_);
    std::filesystem::remove(Root().log);
  }
  void WritePid(const std::string& text) { std::ofstream(pidFile_) << text; }

  std::filesystem::path pidFile_;
};

pid_t DeadPid() {
  pid_t child = fork();
  if (child == 0) {
    _exit(0);
  }
  waitpid(child, nullptr, 0);
  return child;
}

TEST_F(PidFileTest, RewrittenWhenMissingStaleOrNotAProcess) {
  const std::string ownPid = std::to_string(getpid());
  for (const std::string& previous :
       {std::string(), std::to_string(DeadPid()), std::string("garbage"), std::string("0"),
        std::string("-5")}) {
    if (!previous.empty()) {
      WritePid(previous);
    } else {
      std::filesystem::remove(pidFile_);
    }
    Tulk::WritePidFile();
    EXPECT_EQ(ReadFile(pidFile_), ownPid) << "previous content \"" << previous << "\"";
  }
  EXPECT_EQ(ReadFile(Root().log), "");
}

TEST_F(PidFileTest, KeptWhenItNamesALiveProcess) {
  const std::string parent = std::to_string(getppid());
  WritePid(parent + "\n");
  Tulk::WritePidFile();
  EXPECT_EQ(ReadFile(pidFile_), parent + "\n");
  EXPECT_EQ(ReadFile(Root().log),
            "<11>Attempt to run multiple TULK instances, not updating /var/run/tulk.pid\n");
}

}  // namespace
