#include "runtime/PidFile.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
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
        std::string("-5"), std::string("4294967295"), std::string("99999999999999999999"),
        std::string("-1"), std::string("12abc"), ownPid}) {
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

// Whatever stands where the file should be is replaced, never followed or
// waited on: a link's target keeps its text, a FIFO does not hang the start.
TEST_F(PidFileTest, LinkOrFifoInItsPlaceIsReplaced) {
  const std::filesystem::path target = Root().root / "var/run/elsewhere";
  const std::string parent = std::to_string(getppid());
  struct Case {
    const char* name;
    std::function<void()> place;
  };
  const Case cases[] = {
      {"link to a file",
       [&] {
         std::ofstream(target) << "precious";
         std::filesystem::create_symlink(target, pidFile_);
       }},
      {"link to a file naming a live process",
       [&] {
         std::ofstream(target) << parent;
         std::filesystem::create_symlink(target, pidFile_);
       }},
      {"FIFO", [&] { ASSERT_EQ(mkfifo(pidFile_.c_str(), 0644), 0); }},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    std::filesystem::remove(target);
    std::filesystem::remove(pidFile_);
    c.place();
    const std::string targetBefore = ReadFile(target);
    Tulk::WritePidFile();
    EXPECT_TRUE(std::filesystem::is_regular_file(std::filesystem::symlink_status(pidFile_)));
    EXPECT_EQ(ReadFile(pidFile_), std::to_string(getpid()));
    EXPECT_EQ(ReadFile(target), targetBefore);
  }
  std::filesystem::remove(target);
}

TEST(PidText, OnlyAProcessIdInRangeCounts) {
  struct Case {
    const char* text;
    long pid;
  };
  const Case cases[] = {{"4711", 4711},    {" 4711\n", 4711}, {"2147483647", 2147483647},
                        {"2147483648", 0}, {"4294967295", 0}, {"99999999999999999999", 0},
                        {"0", 0},          {"-4711", 0},      {"+4711", 0},
                        {"4711 4712", 0},  {"12abc", 0},      {"", 0}};
  for (const Case& c : cases) {
    EXPECT_EQ(Tulk::ParsePid(c.text), c.pid) << "\"" << c.text << "\"";
  }
}

}  // namespace
