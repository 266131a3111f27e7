// The command runner against real child processes in the confined root.

#include "host/CommandRunner.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

#include "HostTestRoot.h"

namespace {

using namespace std::chrono_literals;
using HostTest::Logged;

struct Result {
  int rc;
  std::string output;
  std::string error;
};

Result Shell(const std::string& line, const std::string& input = "", int timeout = 0,
             const std::vector<std::string>* environment = nullptr) {
  char output[Tulk::kCaptureBufferSize];
  char error[Tulk::kCaptureBufferSize];
  std::int32_t outputLength = sizeof output;
  std::int32_t errorLength = sizeof error;
  int rc = Tulk::RunCommand("/bin/sh", {"sh", "-c", line}, output, &outputLength, error,
                            &errorLength, input.empty() ? nullptr : input.data(),
                            static_cast<std::int32_t>(input.size()), timeout, environment);
  return {rc, std::string(output, static_cast<std::size_t>(outputLength)),
          std::string(error, static_cast<std::size_t>(errorLength))};
}

int RunProgram(const std::string& program) {
  return Tulk::RunCommand(program, {}, nullptr, nullptr, nullptr, nullptr, nullptr, 0, 0);
}

class CommandRunnerTest : public ::testing::Test {
 protected:
  void SetUp() override { HostTest::ClearLog(); }
};

TEST_F(CommandRunnerTest, ExitStatusOrMinusOne) {
  for (auto [line, rc] : {std::pair{"exit 0", 0},
                          {"exit 3", 3},
                          {"exit 255", 255},
                          {"kill -9 $$", -1},
                          {"kill -TERM $$", -1}}) {
    EXPECT_EQ(Shell(line).rc, rc) << line;
  }
  EXPECT_TRUE(Logged("<11>Run Command did not terminate normally"));

  EXPECT_EQ(RunProgram("/bin/no-such-tool"), -1);
  EXPECT_TRUE(Logged("<11>posix_spawn() failed with errno(2): No such file or directory"));
}

TEST_F(CommandRunnerTest, ProgramsAndPathStayInsideTheRoot) {
  HostTest::WriteScript("/sbin/only-in-root", "exit 4");
  EXPECT_EQ(RunProgram("/sbin/only-in-root"), 4);
  EXPECT_EQ(RunProgram("only-in-root"), 4);   // found through the root's folders
  EXPECT_EQ(RunProgram("/usr/bin/env"), -1);  // on the machine, not in the root

  std::string root = HostTest::Root().string();
  std::string path = root + "/bin:" + root + "/sbin";
  EXPECT_EQ(Shell("echo \"$PATH\"").output, path + "\n");
  // A given environment is kept, but PATH and the root come from the console.
  std::vector<std::string> environment = {"TAV_USERNAME=alice", "PATH=/usr/bin"};
  EXPECT_EQ(Shell("echo \"$TAV_USERNAME|$HOME|$PATH|$TULK_ROOT\"", "", 0, &environment).output,
            "alice||" + path + "|" + root + "\n");
}

TEST_F(CommandRunnerTest, TimeoutKillsTheCommandAndLogsIt) {
  // How soon after the limit the kill comes is measured in bench/host.
  const auto start = std::chrono::steady_clock::now();
  EXPECT_EQ(Shell("sleep 5", "", 1).rc, -1);
  EXPECT_GE(std::chrono::steady_clock::now() - start, 1s);
  EXPECT_TRUE(Logged("<12>Killing process because 1 seconds timeout expired"));

  // A child that ends within its limit keeps its status and output.
  const Result done = Shell("printf done; exit 4", "", 30);
  EXPECT_EQ(done.rc, 4);
  EXPECT_EQ(done.output, "done");
}

TEST_F(CommandRunnerTest, CaptureIsCutAtTheBufferAndAlwaysTerminated) {
  struct Case {
    int written;
    std::int32_t capacity;
    std::int32_t captured;
  };
  for (auto c : {Case{300, 256, 255}, Case{255, 256, 255}, Case{10, 256, 10}, Case{10, 1, 0},
                 Case{0, 256, 0}}) {
    std::vector<char> buffer(static_cast<std::size_t>(c.capacity) + 1, '#');
    std::int32_t length = c.capacity;
    std::string line = "head -c " + std::to_string(c.written) + " /dev/zero | tr '\\0' x";
    ASSERT_EQ(Tulk::RunCommand("/bin/sh", {"sh", "-c", line}, buffer.data(), &length, nullptr,
                               nullptr, nullptr, 0, 0),
              0);
    EXPECT_EQ(length, c.captured) << line;
    EXPECT_EQ(std::string(buffer.data()), std::string(static_cast<std::size_t>(c.captured), 'x'));
    EXPECT_EQ(buffer[static_cast<std::size_t>(c.capacity)], '#') << "written past the capacity";
  }
  Result separate = Shell("printf out; printf err >&2");
  EXPECT_EQ(separate.output + "|" + separate.error, "out|err");
}

TEST_F(CommandRunnerTest, InputIsDeliveredThenClosed) {
  EXPECT_EQ(Shell("cat", "line one\nline two").output, "line one\nline two");
  EXPECT_EQ(Shell("wc -c", std::string(200000, 'y')).output, "200000\n");  // beyond a pipe
  EXPECT_EQ(Shell("cat; echo end", "", 5).output, "end\n");  // no input: end of file at once
  // A child that never reads neither blocks the console nor kills it with
  // SIGPIPE; the timeout still holds while the input is being written.
  std::string large(1 << 20, 'z');
  EXPECT_EQ(Shell("exit 7", large).rc, 7);
  EXPECT_EQ(Shell("sleep 5", large, 1).rc, -1);
}

TEST_F(CommandRunnerTest, NoDescriptorLeaksAfterAThousandRuns) {
  auto count = [] {
    auto entries = std::filesystem::directory_iterator("/proc/self/fd");
    return std::distance(begin(entries), end(entries));
  };
  auto before = count();
  for (int run = 0; run < 1000; ++run) {
    if (run % 10 == 9) {
      RunProgram("/bin/missing");
    } else {
      ASSERT_EQ(Shell("printf ok", "input", run % 2).output, "ok");
    }
  }
  Shell("sleep 5", "", 1);
  EXPECT_EQ(count(), before);
}

TEST_F(CommandRunnerTest, ChildGetsOnlyStandardDescriptorsAndAPlainSignalState) {
  int stray = open("/dev/null", O_RDONLY);  // deliberately without O_CLOEXEC
  std::string fds = "0 1 2 3 4 5 6 7 8 9 " + std::to_string(stray);
  EXPECT_EQ(
      Shell("for fd in " + fds + "; do [ -e /dev/fd/$fd ] && printf \"$fd \"; done; true").output,
      "0 1 2 ");
  close(stray);

  // As in the console: six signals blocked in every thread; one ignored.
  sigset_t blocked;
  sigemptyset(&blocked);
  for (int signal : {SIGINT, SIGQUIT, SIGTERM, SIGUSR1, SIGUSR2, SIGWINCH}) {
    sigaddset(&blocked, signal);
  }
  sigset_t old;
  pthread_sigmask(SIG_BLOCK, &blocked, &old);
  struct sigaction ignore {};
  ignore.sa_handler = SIG_IGN;
  struct sigaction previous {};
  sigaction(SIGHUP, &ignore, &previous);
  Result status = Shell("grep -E '^Sig(Blk|Ign)' /proc/self/status");
  sigaction(SIGHUP, &previous, nullptr);
  pthread_sigmask(SIG_SETMASK, &old, nullptr);

  unsigned long long blockedMask = 1;
  unsigned long long ignoredMask = 1;
  ASSERT_EQ(
      std::sscanf(status.output.c_str(), "SigBlk: %llx SigIgn: %llx", &blockedMask, &ignoredMask),
      2);
  EXPECT_EQ(blockedMask, 0u);
  // Signals 1 to 31 (the C library keeps its own two real-time signals
  // ignored in a child of a threaded process).
  EXPECT_EQ(ignoredMask & 0x7fffffffu, 0u);
}

TEST_F(CommandRunnerTest, ConcurrentRunsKeepTheirOwnOutput) {
  std::vector<std::thread> threads;
  std::vector<int> failures(4, 0);
  for (std::size_t worker = 0; worker < failures.size(); ++worker) {
    threads.emplace_back([worker, &failures] {
      for (int run = 0; run < 40; ++run) {
        std::string word = std::to_string(worker) + "-" + std::to_string(run);
        failures[worker] += Shell("cat", word, 5).output != word;
      }
    });
  }
  for (std::thread& thread : threads) {
    thread.join();
  }
  EXPECT_EQ(failures, std::vector<int>(4, 0));
}

TEST_F(CommandRunnerTest, ShellAndLoggedCommands) {
  EXPECT_EQ(Tulk::RunShellCommand("exit 9"), 9);
  // Nothing is captured, so far more than a pipe holds cannot block.
  EXPECT_EQ(Tulk::RunShellCommand("head -c 1000000 /dev/zero; head -c 1000000 /dev/zero >&2"), 0);

  EXPECT_EQ(Tulk::RunLoggedCommand("/bin/sh", {"sh", "-c", "printf out; printf err >&2; exit 2"}),
            2);
  EXPECT_EQ(Tulk::RunLoggedCommand("/bin/sh", {"sh", "-c", "true"}), 0);
  EXPECT_EQ(Tulk::RunLoggedCommand("/bin/absent", {"absent", "x"}), -1);
  EXPECT_TRUE(
      Logged("<11>Command \"sh -c printf out; printf err >&2; exit 2\" failed (rc=2): (stdout=out, "
             "stderr=err)"));
  EXPECT_TRUE(Logged("<14>Command \"sh -c true\" succeeded"));
  EXPECT_TRUE(Logged("<11>Command \"absent x\" failed (rc=-1): (stdout=, stderr=)"));
}

// Whether process `pid` still runs (a zombie waiting for its parent does
// not).
bool StillRuns(const std::string& pid) {
  std::ifstream stat("/proc/" + pid + "/stat");
  std::string text((std::istreambuf_iterator<char>(stat)), std::istreambuf_iterator<char>());
  const std::size_t name = text.rfind(')');
  return name != std::string::npos && text.size() > name + 2 && text[name + 2] != 'Z';
}

// A shell line killed by its limit takes the programs it started with it:
// a hung tool at the head of a pipeline must not outlive the console's wait.
TEST_F(CommandRunnerTest, LimitEndsEveryProgramTheCommandStarted) {
  const std::filesystem::path record = HostTest::Root() / "tmp/started.pid";
  std::filesystem::remove(record);
  const std::string line = "sleep 300 & echo $! > " + record.string() + "; sleep 300 | cat";
  EXPECT_EQ(Shell(line, "", 1).rc, -1);
  std::string started;
  std::ifstream(record) >> started;
  ASSERT_FALSE(started.empty());
  for (int check = 0; check < 250 && StillRuns(started); ++check) {
    std::this_thread::sleep_for(20ms);
  }
  EXPECT_FALSE(StillRuns(started)) << "the background program " << started << " still runs";
}

// The shell and logged runners pass their limit on, and a killed command
// takes the logged runner's failure line.
TEST_F(CommandRunnerTest, ShellAndLoggedCommandsHaveALimit) {
  HostTest::WriteScript("/sbin/hangs", "exec sleep 300");
  EXPECT_EQ(Tulk::RunShellCommand("hangs", 1), -1);
  EXPECT_EQ(Tulk::RunLoggedCommand("/sbin/hangs", {"hangs"}, nullptr, 1), -1);
  EXPECT_TRUE(Logged("<12>Killing process because 1 seconds timeout expired"));
  EXPECT_TRUE(Logged("<11>Command \"hangs\" failed (rc=-1): (stdout=, stderr=)"));
}

}  // namespace
