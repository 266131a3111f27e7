#include "BenchConsole.h"

#include <csignal>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <stdexcept>

namespace TulkBench {
namespace {

using namespace std::chrono_literals;

// The environment lines scripts/pam-env.sh prints for a root.
std::map<std::string, std::string> DemoPamEnvironment(const std::string& folder) {
  const std::string command =
      std::string("bash '") + TULK_BENCH_SOURCE_DIR + "/scripts/pam-env.sh' '" + folder + "'";
  FILE* pipe = popen(command.c_str(), "r");
  if (pipe == nullptr) {
    throw std::runtime_error("cannot run scripts/pam-env.sh");
  }
  std::map<std::string, std::string> environment;
  char line[4096];
  while (std::fgets(line, sizeof line, pipe) != nullptr) {
    std::string text(line);
    while (!text.empty() && (text.back() == '\n' || text.back() == '\r')) {
      text.pop_back();
    }
    auto equals = text.find('=');
    if (equals != std::string::npos) {
      environment[text.substr(0, equals)] = text.substr(equals + 1);
    }
  }
  if (pclose(pipe) != 0 || environment.empty()) {
    throw std::runtime_error("scripts/pam-env.sh failed");
  }
  return environment;
}

}  // namespace

TulkTest::Options DemoOptions(const std::string& term, const std::string& pamFolder,
                              const std::string& program, double timeScale) {
  TulkTest::Options options;
  options.program = program;
  options.start = false;
  options.term = term;
  options.timeScale = timeScale;
  options.keepOutput = true;
  options.env = DemoPamEnvironment(pamFolder);
  options.prepareRoot = [](const std::filesystem::path& root) {
    std::filesystem::create_directories(root / "var/run/brimlo");
    std::ofstream(root / "var/run/brimlo/show-tulk-login");
  };
  return options;
}

BenchClock::time_point Settle(TulkTest::TestConsole& console, std::chrono::milliseconds quiet) {
  // After input, the console says when it is done (the readiness signal);
  // only a change without input (dimming) is waited out by a quiet spell.
  if (console.WaitReady()) {
    return console.ReadyAt();
  }
  return SettleQuiet(console, quiet);
}

BenchClock::time_point SettleQuiet(TulkTest::TestConsole& console,
                                   std::chrono::milliseconds quiet) {
  BenchClock::time_point last = BenchClock::now();
  std::size_t bytes = console.BytesReceived();
  while (BenchClock::now() - last < quiet) {
    console.Pump(1ms);
    if (console.BytesReceived() != bytes) {
      bytes = console.BytesReceived();
      last = BenchClock::now();
    }
  }
  return last;
}

Screen Capture(const TulkTest::TestConsole& console, int rows, int cols) {
  Screen screen;
  screen.rows = rows;
  screen.cols = cols;
  screen.cells.reserve(static_cast<std::size_t>(rows) * static_cast<std::size_t>(cols));
  for (int row = 0; row < rows; ++row) {
    for (int col = 0; col < cols; ++col) {
      screen.cells.push_back(console.At(row, col));
    }
  }
  screen.cursor = console.Cursor();
  return screen;
}

bool WaitForChange(TulkTest::TestConsole& console, const Screen& from,
                   std::chrono::milliseconds timeout) {
  const auto deadline = BenchClock::now() + timeout;
  while (BenchClock::now() < deadline) {
    console.Pump(10ms);
    if (!SameScreen(Capture(console, from.rows, from.cols), from)) {
      SettleQuiet(console, 300ms);
      return true;
    }
  }
  return false;
}

bool OpenLogin(TulkTest::TestConsole& console) {
  if (!console.WaitForText("Customize System/View Logs")) {
    return false;
  }
  Settle(console, 200ms);
  console.Key("F2");
  return console.WaitForText("Authentication Required");
}

bool LogIn(TulkTest::TestConsole& console) {
  if (!OpenLogin(console)) {
    return false;
  }
  Settle(console, 200ms);
  console.Key("Down");
  console.Type("tulk");
  Settle(console, 200ms);
  console.Key("Enter");
  return console.WaitForText("System Customization");
}

void Press(TulkTest::TestConsole& console, const std::string& key) {
  if (key.size() == 1) {
    console.Type(key);
  } else {
    console.Key(key);
  }
}

}  // namespace TulkBench
