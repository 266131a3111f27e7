// The command runner against real child processes in a confined root.

#include "host/CommandRunner.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <cstring>
#include <filesystem>
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

int OpenDescriptorCount() {
  int count = 0;
  for ([[maybe_unused]] const auto& entry : std::filesystem::directory_iterator("/proc/self/fd")) {
    ++count;
  }
  return count;
}

class CommandRunnerTest : public ::testing::Test {
 protected:
  void SetUp() override { HostTest::ClearLog(); }
};

TEST_F(CommandRunnerTest, ReturnsTheExitStatusOrMinusOneForASignal) {
  struct Case {
    const char* line;
    int rc;
  };
  for (const Case& c : {Case{"exit 0", 0}, Case{"exit 3", 3}, Case{"exit 255", 255},
                        Case{"kill -9 $$", -1}, Case{"kill -TERM $$", -1}}) {
    EXPECT_EQ(Shell(c.line).rc, c.rc) << c.line;
  }
  EXPECT_TRUE(Logged("<11>Run Command did not terminate normally"));
}

TEST_F(CommandRunnerTest, MissingProgramGivesMinusOneAndALogLine) {
  EXPECT_EQ(Tulk::RunCommand("/bin/no-such-tool", {"no-such-tool"}, nullptr, nullptr, nullptr,
                             nullptr, nullptr, 0, 0),
            -1);
  EXPECT_TRUE(Logged("<11>posix_spawn() failed with errno(2): No such file or directory"));
  // Present on the machine but not in the root: never reached.
  EXPECT_EQ(
      Tulk::RunCommand("/usr/bin/env", {"env"}, nullptr, nullptr, nullptr, nullptr, nullptr, 0, 0),
      -1);
}

TEST_F(CommandRunnerTest, ProgramsAndPathAreConfinedToTheRoot) {
  HostTest::WriteScript("/sbin/only-in-root", "echo confined");
  char output[64];
  std::int32_t length = sizeof output;
  EXPECT_EQ(Tulk::RunCommand("/sbin/only-in-root", {"only-in-root"}, output, &length, nullptr,
                             nullptr, nullptr, 0, 0),
            0);
  EXPECT_STREQ(output, "confined\n");
  // A bare name is looked up in the root's folders too.
  length = sizeof output;
  EXPECT_EQ(Tulk::RunCommand("only-in-root", {"only-in-root"}, output, &length, nullptr, nullptr,
                             nullptr, 0, 0),
            0);

  std::string root = HostTest::Root().string();
  EXPECT_EQ(Shell("echo \"$PATH\"").output, root + "/bin:" + root + "/sbin\n");
}

TEST_F(CommandRunnerTest, GivenEnvironmentKeepsTheRootAndNothingElse) {
  std::vector<std::string> environment = {"TAV_USERNAME=alice", "PATH=/usr/bin"};
  Result result = Shell("echo \"$TAV_USERNAME|$HOME|$PATH|$TULK_ROOT\"", "", 0, &environment);
  std::string root = HostTest::Root().string();
  EXPECT_EQ(result.output, "alice||" + root + "/bin:" + root + "/sbin|" + root + "\n");
}

TEST_F(CommandRunnerTest, TimeoutKillsWithinTwentyMillisecondsOfTheDeadline) {
  auto start = std::chrono::steady_clock::now();
  Result result = Shell("sleep 5", "", 1);
  auto elapsed = std::chrono::steady_clock::now() - start;
  EXPECT_EQ(result.rc, -1);
  EXPECT_GE(elapsed, 1s);
  // 20 ms of polling plus a little scheduling slack on a loaded machine.
  EXPECT_LT(elapsed, 1s + 20ms + 25ms);
  EXPECT_TRUE(Logged("<12>Killing process because 1 seconds timeout expired"));
}

TEST_F(CommandRunnerTest, ChildFinishingInTimeKeepsItsStatusAndOutput) {
  auto start = std::chrono::steady_clock::now();
  Result result = Shell("printf done; exit 4", "", 30);
  EXPECT_LT(std::chrono::steady_clock::now() - start, 1s);
  EXPECT_EQ(result.rc, 4);
  EXPECT_EQ(result.output, "done");
  EXPECT_FALSE(Logged("<12>Killing process because 30 seconds timeout expired"));
}

TEST_F(CommandRunnerTest, CaptureIsCutAtTheBufferAndAlwaysTerminated) {
  struct Case {
    int written;
    std::int32_t capacity;
    std::int32_t captured;
  };
  for (const Case& c : {Case{300, 256, 255}, Case{255, 256, 255}, Case{10, 256, 10}, Case{10, 1, 0},
                        Case{0, 256, 0}}) {
    std::vector<char> buffer(static_cast<std::size_t>(c.capacity) + 1, '#');
    std::int32_t length = c.capacity;
    std::string line = "head -c " + std::to_string(c.written) + " /dev/zero | tr '\\0' x";
    ASSERT_EQ(Tulk::RunCommand("/bin/sh", {"sh", "-c", line}, buffer.data(), &length, nullptr,
                               nullptr, nullptr, 0, 0),
              0);
    SCOPED_TRACE(line);
    EXPECT_EQ(length, c.captured);
    EXPECT_EQ(std::string(buffer.data()), std::string(static_cast<std::size_t>(c.captured), 'x'));
    EXPECT_EQ(buffer[static_cast<std::size_t>(c.capacity)], '#') << "written past the capacity";
  }
}

TEST_F(CommandRunnerTest, OutputAndErrorAreCapturedSeparately) {
  Result result = Shell("printf out; printf err >&2; exit 1");
  EXPECT_EQ(result.rc, 1);
  EXPECT_EQ(result.output, "out");
  EXPECT_EQ(result.error, "err");
}

TEST_F(CommandRunnerTest, InputIsDeliveredAndClosed) {
  EXPECT_EQ(Shell("cat", "line one\nline two").output, "line one\nline two");
  // More than a pipe holds, read while it is written.
  std::string large(200000, 'y');
  EXPECT_EQ(Shell("wc -c", large).output, "200000\n");
  // No input: the child sees end of file at once instead of waiting.
  EXPECT_EQ(Shell("cat; echo end", "", 5).output, "end\n");
}

TEST_F(CommandRunnerTest, ChildIgnoringItsInputNeitherHangsNorKillsTheConsole) {
  std::string large(1 << 20, 'z');
  EXPECT_EQ(Shell("exit 7", large).rc, 7);
  // A child that never reads is still bounded by the timeout.
  EXPECT_EQ(Shell("sleep 5", large, 1).rc, -1);
}

TEST_F(CommandRunnerTest, NoDescriptorLeaksAfterAThousandRuns) {
  int before = OpenDescriptorCount();
  for (int run = 0; run < 1000; ++run) {
    if (run % 10 == 9) {
      Tulk::RunCommand("/bin/missing", {"missing"}, nullptr, nullptr, nullptr, nullptr, nullptr, 0,
                       0);
    } else {
      ASSERT_EQ(Shell("printf ok", "input", run % 2).output, "ok");
    }
  }
  Shell("sleep 5", "", 1);
  EXPECT_EQ(OpenDescriptorCount(), before);
}

TEST_F(CommandRunnerTest, ChildInheritsOnlyTheStandardDescriptors) {
  int stray = open("/dev/null", O_RDONLY);  // deliberately without O_CLOEXEC
  ASSERT_GE(stray, 3);
  std::string fds = std::to_string(stray);
  Result result = Shell("for fd in 0 1 2 3 4 5 6 7 8 9 " + fds +
                        "; do [ -e /dev/fd/$fd ] && printf \"$fd \"; done; true");
  close(stray);
  EXPECT_EQ(result.output, "0 1 2 ");
}

TEST_F(CommandRunnerTest, ChildStartsWithEmptySignalMaskAndDefaultHandlers) {
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

  Result result = Shell("grep -E '^Sig(Blk|Ign)' /proc/self/status");

  sigaction(SIGHUP, &previous, nullptr);
  pthread_sigmask(SIG_SETMASK, &old, nullptr);
  unsigned long long blockedMask = 0;
  unsigned long long ignoredMask = 0;
  ASSERT_EQ(
      std::sscanf(result.output.c_str(), "SigBlk: %llx SigIgn: %llx", &blockedMask, &ignoredMask),
      2)
      << result.output;
  EXPECT_EQ(blockedMask, 0u);
  // Signals 1 to 31; the C library keeps its two internal real-time signals
  // ignored in a spawned child of a threaded process.
  EXPECT_EQ(ignoredMask & 0x7fffffffu, 0u);
}

TEST_F(CommandRunnerTest, ConcurrentRunsKeepTheirOwnOutput) {
  std::vector<std::thread> threads;
  std::vector<int> failures(4, 0);
  for (int worker = 0; worker < 4; ++worker) {
    threads.emplace_back([worker, &failures] {
      for (int run = 0; run < 40; ++run) {
        std::string word = std::to_string(worker) + "-" + std::to_string(run);
        if (Shell("cat", word, 5).output != word) {
          ++failures[static_cast<std::size_t>(worker)];
        }
      }
    });
  }
  for (std::thread& thread : threads) {
    thread.join();
  }
  EXPECT_EQ(failures, std::vector<int>(4, 0));
}

TEST_F(CommandRunnerTest, ShellCommandDiscardsOutputWithoutBlocking) {
  EXPECT_EQ(Tulk::RunShellCommand("exit 9"), 9);
  // Far more than a pipe holds: nothing is captured, so nothing may block.
  EXPECT_EQ(Tulk::RunShellCommand("head -c 1000000 /dev/zero; head -c 1000000 /dev/zero >&2"), 0);
}

TEST_F(CommandRunnerTest, LoggedCommandLogsItsOutcome) {
  EXPECT_EQ(Tulk::RunLoggedCommand("/bin/sh", {"sh", "-c", "printf out; printf err >&2; exit 2"}),
            2);
  EXPECT_TRUE(
      Logged("<11>Command \"sh -c printf out; printf err >&2; exit 2\" failed (rc=2): (stdout=out, "
             "stderr=err)"));
  EXPECT_EQ(Tulk::RunLoggedCommand("/bin/sh", {"sh", "-c", "true"}), 0);
  EXPECT_TRUE(Logged("<14>Command \"sh -c true\" succeeded"));
  EXPECT_EQ(Tulk::RunLoggedCommand("/bin/absent", {"absent", "x"}), -1);
  EXPECT_TRUE(Logged("<11>Command \"absent x\" failed (rc=-1): (stdout=, stderr=)"));
}

}  // namespace
