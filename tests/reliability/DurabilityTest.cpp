// kill -9 during every state-changing operation: the console (and every
// host tool it started) is killed at a random moment of a password change,
// a lockdown toggle, a keyboard layout change and a network apply that
// renames the host. Afterwards the host state always parses and validates
// (a console starts on it), each changed value is the old or the new one,
// /etc/hosts is still there, and the next write of the state leaves no
// temporary file behind.

#include <gtest/gtest.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <functional>
#include <random>
#include <string>
#include <thread>
#include <vector>

#include "ProcessHygiene.h"
#include "ReliabilitySupport.h"
#include "ScreenTestSupport.h"

namespace {

using namespace std::chrono_literals;
using TulkTest::TestConsole;

// Kill runs in all, spread over the operations.
constexpr int kRuns = 200;

// The hosts file of the shared root, before any run.
constexpr char kHosts[] = "127.0.0.1\tlocalhost\n10.20.30.141\ttavi-01.lab.example.net tavi-01\n";
constexpr char kHostsKept[] = "the hosts file or its backup is whole";

// Whether the hosts file, or the backup the network test makes of it,
// still holds what it held before the run.
std::string HostsKept(const std::filesystem::path& root) {
  const std::filesystem::path etc = root / "etc";
  for (const char* name : {"hosts", "hosts.backup"}) {
    if (TulkTest::ReadText(etc / name) == kHosts) {
      return kHostsKept;
    }
  }
  return "the hosts file is lost";
}

struct Operation {
  std::string name;
  // From the settled menu: everything up to the last key.
  std::function<::testing::AssertionResult(TestConsole&)> prepare;
  // The key that starts the write.
  std::string lastKey;
  // The value the operation changes, read from the state (for the password
  // from the console's PAM password file, for the network test from the
  // shared root): old and new as text.
  std::function<std::string(const TestConsole&, const std::filesystem::path& root,
                            const nlohmann::json&)>
      value;
  std::string before;
  std::string after;
};

::testing::AssertionResult Open(TestConsole& console, const std::string& entry,
                                const std::string& shown) {
  if (auto opened = Reliability::OpenEntry(console, entry); !opened) {
    return opened;
  }
  return TulkTest::Settled(console, shown);
}

std::vector<Operation> Operations() {
  std::vector<Operation> operations;
  operations.push_back(
      {"password",
       [](TestConsole& console) {
         if (auto opened = Open(console, "Configure Password", "Old Password"); !opened) {
           return opened;
         }
         console.Type(TulkTest::kRootPassword);
         console.Key("Down");
         console.Type("Another-pass-99");
         console.Key("Down");
         console.Type("Another-pass-99");
         return console.WaitReady();
       },
       "Enter",
       [](const TestConsole& console, const std::filesystem::path&, const nlohmann::json&) {
         const std::string file = TulkTest::ReadText(console.PamPasswordFile());
         const std::size_t at = file.find("root:");
         return at == std::string::npos ? std::string("(no root)")
                                        : file.substr(at + 5, file.find(':', at + 5) - at - 5);
       },
       TulkTest::kRootPassword, "Another-pass-99"});
  operations.push_back(
      {"lockdown",
       [](TestConsole& console) {
         if (auto opened = Open(console, "Configure Lockdown Mode", "Enable lockdown mode");
             !opened) {
           return opened;
         }
         console.Key("Space");
         return console.WaitReady();
       },
       "Enter",
       [](const TestConsole&, const std::filesystem::path&, const nlohmann::json& state) {
         return state["lockdown"]["enabled"].dump();
       },
       "false", "true"});
  operations.push_back(
      {"keyboard",
       [](TestConsole& console) {
         if (auto opened = Open(console, "Configure Keyboard", "(o) US Default"); !opened) {
           return opened;
         }
         console.Key("Down");
         return console.WaitReady();
       },
       "Enter",
       [](const TestConsole&, const std::filesystem::path&, const nlohmann::json& state) {
         return state["system"]["keyboardLayout"].get<std::string>();
       },
       "US Default", "US Dvorak"});
  operations.push_back(
      {"network apply",
       [](TestConsole& console) {
         if (auto opened = Reliability::OpenEntry(console, "Configure Management Network");
             !opened) {
           return opened;
         }
         if (auto window = console.WaitReady(); !window) {
           return window;
         }
         if (auto opened = Open(console, "DNS Configuration", "Use the following DNS"); !opened) {
           return opened;
         }
         console.Key("Down", 4);
         console.Key("End");
         console.Type("x");
         console.Key("Enter");
         if (auto closed = TulkTest::Gone(console, "Use the following DNS"); !closed) {
           return closed;
         }
         console.Key("Esc");
         return TulkTest::Settled(console, "Configure Management Network: Confirm");
       },
       "y",
       [](const TestConsole&, const std::filesystem::path&, const nlohmann::json& state) {
         return state["network"]["dns"]["hostname"].get<std::string>();
       },
       "tavi-01", "tavi-01x"});
  // The network test writes no state, but it rewrites the hosts file while
  // it resolves the host's name.
  operations.push_back({"network test",
                        [](TestConsole& console) {
                          return Open(console, "Test Management Network", "Ping Address #1:");
                        },
                        "Enter",
                        [](const TestConsole&, const std::filesystem::path& root,
                           const nlohmann::json&) { return HostsKept(root); },
                        kHostsKept, kHostsKept});
  return operations;
}

// A named key ("Enter") or a typed character ("y").
void Press(TestConsole& console, const std::string& key) {
  if (key.size() == 1) {
    console.Type(key);
  } else {
    console.Key(key);
  }
}

std::vector<std::string> Temporaries(const std::filesystem::path& stateFile) {
  std::vector<std::string> left;
  const std::string prefix = stateFile.filename().string() + ".tmp.";
  for (const auto& entry : std::filesystem::directory_iterator(stateFile.parent_path())) {
    if (entry.path().filename().string().rfind(prefix, 0) == 0) {
      left.push_back(entry.path().filename().string());
    }
  }
  return left;
}

// A console on the shared root and state file of `home`.
TulkTest::Options SharedOptions(const TestConsole& home) {
  TulkTest::Options options = Reliability::ConsoleOptions();
  options.env["TULK_ROOT"] = home.Root().string();
  options.env["TULK_HOST_STATE"] = home.HostStatePath().string();
  options.term = "xterm";  // the keyboard entry is offered on terminals of that name
  return options;
}

TEST(Durability, KillDuringEveryStateWriteLosesNothing) {
  std::mt19937 random(Reliability::Seed());
  int runs = 0;
  int killedBeforeWrite = 0;
  int killedAfterWrite = 0;
  int killedBetween = 0;
  int temporariesSeen = 0;
  const std::vector<Operation> operations = Operations();
  for (const Operation& operation : operations) {
    SCOPED_TRACE(operation.name);
    // One root and state file for all runs of the operation.
    TulkTest::Options homeOptions = Reliability::ConsoleOptions();
    homeOptions.start = false;
    TestConsole home(homeOptions);
    TulkTest::WriteRootFile(home.Root(), "/var/run/brimlo/show-tulk-login");
    TulkTest::WriteRootFile(home.Root(), "/etc/hosts", kHosts);
    const nlohmann::json original = TulkTest::DemoHostState();

    // How long the operation takes, uninterrupted.
    std::chrono::nanoseconds duration{};
    {
      TestConsole console(SharedOptions(home));
      ASSERT_TRUE(Reliability::LogIn(console));
      ASSERT_TRUE(operation.prepare(console));
      Press(console, operation.lastKey);
      const auto start = std::chrono::steady_clock::now();
      ASSERT_TRUE(console.WaitReady());
      duration = console.ReadyAt() - start;
      EXPECT_EQ(
          operation.value(console, home.Root(), TulkTest::ReadHostState(home.HostStatePath())),
          operation.after);
    }

    const int count = kRuns * Reliability::Scale() / static_cast<int>(operations.size());
    for (int run = 0; run < count; ++run) {
      SCOPED_TRACE("run " + std::to_string(run));
      // Each run starts from the old state.
      TulkTest::ReplaceHostState(home, original);
      TestConsole console(SharedOptions(home));
      ASSERT_TRUE(Reliability::LogIn(console));
      ASSERT_TRUE(operation.prepare(console));
      std::uniform_int_distribution<long> delay(0, duration.count() + duration.count() / 4);
      Press(console, operation.lastKey);
      std::this_thread::sleep_for(std::chrono::nanoseconds(delay(random)));
      TulkTest::SignalSession(console.Pid(), SIGKILL);
      kill(console.Pid(), SIGKILL);
      ASSERT_EQ(console.WaitExit(), 128 + SIGKILL);
      ++runs;

      const nlohmann::json state = TulkTest::ReadHostState(home.HostStatePath());
      ASSERT_FALSE(state.is_discarded()) << "the state no longer parses";
      const std::string value = operation.value(console, home.Root(), state);
      EXPECT_TRUE(value == operation.before || value == operation.after) << value;
      if (value == operation.before) {
        ++killedBeforeWrite;
      } else {
        ++killedAfterWrite;
      }
      EXPECT_TRUE(std::filesystem::exists(home.Root() / "etc/hosts") ||
                  std::filesystem::exists(home.Root() / "etc/hosts.backup"));
      const std::size_t temporaries = Temporaries(home.HostStatePath()).size();
      temporariesSeen += static_cast<int>(temporaries);
      if (temporaries > 0) {
        ++killedBetween;
      }
    }
    // The next console starts on what is left (the state validates) and its
    // first write removes what killed writers left.
    TulkTest::ReplaceHostState(home, original);
    TestConsole next(SharedOptions(home));
    ASSERT_TRUE(Reliability::LogIn(next));
    ASSERT_TRUE(operation.prepare(next));
    Press(next, operation.lastKey);
    ASSERT_TRUE(next.WaitReady());
    EXPECT_EQ(Temporaries(home.HostStatePath()), std::vector<std::string>{});
    // Its start brought back a hosts file that a killed test left aside.
    EXPECT_TRUE(std::filesystem::exists(home.Root() / "etc/hosts"));
    EXPECT_FALSE(std::filesystem::exists(home.Root() / "etc/hosts.backup"));
  }
  Reliability::Figure("kill -9 runs", std::to_string(runs));
  Reliability::Figure("killed before the change landed", std::to_string(killedBeforeWrite));
  Reliability::Figure("killed after the change landed (or nothing to change)",
                      std::to_string(killedAfterWrite));
  Reliability::Figure("runs that left a temporary file", std::to_string(killedBetween));
  Reliability::Figure("temporary files left, all removed by the next write",
                      std::to_string(temporariesSeen));
}

}  // namespace
