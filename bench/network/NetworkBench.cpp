// The management network window through the whole console (the real tulk
// in a pseudo-terminal, 80x25, TERM=xterm-256color, on the demo host):
//   - the time from Enter on "Configure Management Network" to the last
//     byte of the window's first draw;
//   - the bytes each Down over its six entries writes, beside the fewest
//     bytes that change could take (ScreenDiff.h);
//   - an apply of a change of all six entries: the console's own CPU time
//     from "y" in the confirmation until the menu is back (its main
//     thread's run time from /proc/<pid>/schedstat, so the simulated tools
//     it starts are not in it), the wall time, and the tools it ran;
//   - the simulated tool the apply runs ("osk-cmd ... internalsvc/refresh"),
//     timed on its own.
// Output: one line per figure, "name  median  min  max  unit".
//
//   tulk-network-bench [--runs N]

#include <spawn.h>
#include <sys/resource.h>
#include <sys/wait.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "ScreenDiff.h"
#include "TestConsole.h"

extern char** environ;

namespace {

using Clock = std::chrono::steady_clock;
using namespace std::chrono_literals;

constexpr int kRows = 25;
constexpr int kCols = 80;

struct Figure {
  std::string name;
  std::string unit;
  std::vector<double> values;
};

void Print(const Figure& figure) {
  std::vector<double> values = figure.values;
  if (values.empty()) {
    std::printf("%-36s %10s\n", figure.name.c_str(), "n/a");
    return;
  }
  std::sort(values.begin(), values.end());
  const std::size_t n = values.size();
  const double median = n % 2 == 1 ? values[n / 2] : (values[n / 2 - 1] + values[n / 2]) / 2;
  std::printf("%-36s %10.2f %10.2f %10.2f  %s\n", figure.name.c_str(), median, values.front(),
              values.back(), figure.unit.c_str());
}

double Millis(Clock::duration duration) {
  return std::chrono::duration<double, std::milli>(duration).count();
}

// Pumps output until nothing arrives for `quiet`; the time of the last byte.
Clock::time_point Settle(TulkTest::TestConsole& console, std::chrono::milliseconds quiet = 150ms) {
  Clock::time_point last = Clock::now();
  std::size_t bytes = console.BytesReceived();
  while (Clock::now() - last < quiet) {
    console.Pump(1ms);
    if (console.BytesReceived() != bytes) {
      bytes = console.BytesReceived();
      last = Clock::now();
    }
  }
  return last;
}

bool Shown(TulkTest::TestConsole& console, const std::string& text) {
  const bool shown = static_cast<bool>(console.WaitForText(text));
  Settle(console, 60ms);
  if (!shown) {
    std::fprintf(stderr, "not shown: %s\n%s", text.c_str(), console.Dump().c_str());
  }
  return shown;
}

bool Gone(TulkTest::TestConsole& console, const std::string& text) {
  const bool gone = static_cast<bool>(console.WaitForTextGone(text));
  Settle(console, 60ms);
  return gone;
}

// The console's main thread's time on a CPU so far, in milliseconds.
double ConsoleCpuMillis(pid_t pid) {
  std::ifstream stat("/proc/" + std::to_string(pid) + "/schedstat");
  unsigned long long nanos = 0;
  stat >> nanos;
  return static_cast<double>(nanos) / 1e6;
}

std::size_t CountLines(const std::filesystem::path& path) {
  std::ifstream in(path);
  std::size_t lines = 0;
  for (std::string line; std::getline(in, line);) {
    ++lines;
  }
  return lines;
}

// How many times "Network settings changed." was logged.
std::size_t AppliedCount(const TulkTest::TestConsole& console) {
  const std::vector<std::string> lines = console.LogLines();
  return static_cast<std::size_t>(std::count_if(lines.begin(), lines.end(), [](const auto& line) {
    return line.find("Network settings changed.") != std::string::npos;
  }));
}

std::string RightTitle(const TulkTest::TestConsole& console) {
  std::string text;
  for (int col = kCols / 2 + 2; col < kCols - 1; ++col) {
    text += console.At(1, col).text;
  }
  return text.substr(0, text.find_last_not_of(' ') + 1);
}

bool SelectEntry(TulkTest::TestConsole& console, const std::string& title) {
  for (const char* key : {"Down", "Up"}) {
    for (int step = 0; step < 16 && RightTitle(console) != title; ++step) {
      const std::string shown = RightTitle(console);
      console.Key(key);
      Settle(console, 60ms);
      if (RightTitle(console) == shown) {
        break;  // at the end of the menu
      }
    }
  }
  if (RightTitle(console) != title) {
    std::fprintf(stderr, "no entry %s\n%s", title.c_str(), console.Dump().c_str());
    return false;
  }
  return true;
}

bool LogIn(TulkTest::TestConsole& console) {
  if (!Shown(console, "Customize System/View Logs")) {
    return false;
  }
  console.Key("F2");
  if (!Shown(console, "Authentication Required")) {
    return false;
  }
  console.Key("Down");
  console.Type("tulk");
  console.Key("Enter");
  return Shown(console, "System Customization") &&
         SelectEntry(console, "Configure Management Network");
}

bool Dialog(TulkTest::TestConsole& console, const std::string& entry, const std::string& text,
            const std::function<void()>& keys) {
  if (!SelectEntry(console, entry)) {
    return false;
  }
  console.Key("Enter");
  if (!Shown(console, text)) {
    return false;
  }
  keys();
  console.Key("Enter");
  return Gone(console, text);
}

// Changes all six entries, to one of two sets of values by `flip`.
bool ChangeAllSix(TulkTest::TestConsole& console, bool flip) {
  const std::string n = flip ? "1" : "2";
  // "Network Adapters" comes last in the order below: moving up to it
  // from the suffixes takes the same keys every time.
  return Dialog(console, "VLAN (optional)", "VLAN ID (1-4094",
                [&] { console.Type(flip ? "20" : "30"); }) &&
         Dialog(console, "IPv4 Configuration", "Set static IPv4",
                [&] {
                  console.Key("Down", 3);
                  console.Type("10.20.30.5" + n);
                }) &&
         Dialog(console, "IPv6 Configuration", "Use DHCPv6",
                [&] {
                  console.Key("Down", 3);
                  console.Key("Space");
                  Settle(console, 60ms);
                  console.Key("Down");
                  console.Type("2001:db8::5" + n + "/64");
                }) &&
         Dialog(console, "DNS Configuration", "Use the following DNS",
                [&] {
                  console.Key("Down", 2);
                  console.Type("10.20.30.1" + n);
                }) &&
         Dialog(console, "Custom DNS Suffixes",
                "Suffixes:", [&] { console.Type("s" + n + ".example"); }) &&
         [&] {
           for (int up = 0; up < 6 && RightTitle(console) != "Network Adapters"; ++up) {
             console.Key("Up");
             Settle(console, 60ms);
           }
           console.Key("Enter");
           if (!Shown(console, "Select the adapters")) {
             return false;
           }
           console.Key("Down", 3);  // hynic3, used by no switch
           console.Key("Space");
           Settle(console, 60ms);
           console.Key("Enter");
           return Gone(console, "Select the adapters");
         }();
}

// Runs the simulated refresh tool as the console does, `runs` times;
// appends wall and CPU milliseconds of each run.
void TimeRefreshTool(const TulkTest::TestConsole& console, int runs, Figure& wall, Figure& cpu) {
  const std::string tool = (console.Root() / "bin/osk-cmd").string();
  std::vector<std::string> env = {"TULK_ROOT=" + console.Root().string(),
                                  "TULK_HOST_STATE=" + console.HostStatePath().string(),
                                  "PATH=" + (console.Root() / "bin").string()};
  std::vector<char*> envp;
  for (std::string& entry : env) {
    envp.push_back(entry.data());
  }
  envp.push_back(nullptr);
  const char* argv[] = {"osk-cmd", "-U", "root", "internalsvc/refresh", nullptr};
  for (int run = 0; run < runs; ++run) {
    rusage before{};
    getrusage(RUSAGE_CHILDREN, &before);
    const Clock::time_point start = Clock::now();
    pid_t pid = 0;
    if (posix_spawn(&pid, tool.c_str(), nullptr, nullptr, const_cast<char**>(argv), envp.data()) !=
        0) {
      return;
    }
    int status = 0;
    waitpid(pid, &status, 0);
    wall.values.push_back(Millis(Clock::now() - start));
    rusage after{};
    getrusage(RUSAGE_CHILDREN, &after);
    auto micros = [](const rusage& usage) {
      return (usage.ru_utime.tv_sec + usage.ru_stime.tv_sec) * 1e6 + usage.ru_utime.tv_usec +
             usage.ru_stime.tv_usec;
    };
    cpu.values.push_back((micros(after) - micros(before)) / 1000.0);
  }
}

}  // namespace

int main(int argc, char** argv) {
  int runs = 10;
  for (int i = 1; i + 1 < argc; i += 2) {
    if (std::strcmp(argv[i], "--runs") == 0) {
      runs = std::max(1, std::atoi(argv[i + 1]));
    }
  }
  TulkTest::Options options;
  options.pamUsers = {{"root", "tulk"}};
  options.prepareRoot = [](const std::filesystem::path& root) {
    std::filesystem::create_directories(root / "var/run/brimlo");
    std::ofstream(root / "var/run/brimlo/show-tulk-login");
  };
  TulkTest::TestConsole console(options);
  if (!LogIn(console)) {
    return 1;
  }

  Figure draw{"window_drawn_after_enter", "ms", {}};
  Figure drawBytes{"window_draw_bytes", "bytes", {}};
  for (int run = 0; run < runs; ++run) {
    Settle(console);
    const std::size_t bytes = console.BytesReceived();
    const Clock::time_point start = Clock::now();
    console.Key("Enter");
    const Clock::time_point last = Settle(console);
    draw.values.push_back(Millis(last - start));
    drawBytes.values.push_back(static_cast<double>(console.BytesReceived() - bytes));
    console.Key("Esc");
    if (!Shown(console, "System Customization")) {
      return 1;
    }
  }

  std::vector<Figure> downs;
  console.Key("Enter");
  if (!Shown(console, "Custom DNS Suffixes")) {
    return 1;
  }
  for (int entry = 1; entry < 6; ++entry) {
    Settle(console);
    const TulkBench::ScreenSnapshot before = TulkBench::ScreenSnapshot::Take(console, kRows, kCols);
    const std::size_t bytes = console.BytesReceived();
    console.Key("Down");
    Settle(console);
    const TulkBench::ScreenSnapshot after = TulkBench::ScreenSnapshot::Take(console, kRows, kCols);
    const double written = static_cast<double>(console.BytesReceived() - bytes);
    const double fewest = static_cast<double>(TulkBench::FewestBytes(before, after));
    const std::string name = "down_to_" + RightTitle(console);
    downs.push_back({name + "_bytes", "bytes", {written}});
    downs.push_back({name + "_fewest", "bytes", {fewest}});
    downs.push_back({name + "_ratio", "x", {written / fewest}});
  }

  Figure applyCpu{"apply_all_six_console_cpu", "ms", {}};
  Figure applyWall{"apply_all_six_wall", "ms", {}};
  Figure applyTools{"apply_all_six_tool_runs", "runs", {}};
  const std::filesystem::path commands = console.Root() / "var/log/tulk-sim/commands.jsonl";
  for (int run = 0; run < runs; ++run) {
    if (run > 0) {
      console.Key("Enter");
      if (!Shown(console, "Custom DNS Suffixes")) {
        return 1;
      }
    }
    if (!ChangeAllSix(console, run % 2 == 0)) {
      return 1;
    }
    console.Key("Esc");
    if (!Shown(console, "Apply changes and restart management network?")) {
      return 1;
    }
    const std::size_t tools = CountLines(commands);
    const double cpu = ConsoleCpuMillis(console.Pid());
    const Clock::time_point start = Clock::now();
    const std::size_t applied = AppliedCount(console);
    console.Type("y");
    while (AppliedCount(console) == applied) {
      if (Clock::now() - start > 10s) {
        return 1;
      }
      console.Pump(1ms);
    }
    const Clock::time_point logged = Clock::now();
    if (!Shown(console, "System Customization")) {
      return 1;
    }
    applyCpu.values.push_back(ConsoleCpuMillis(console.Pid()) - cpu);
    applyWall.values.push_back(Millis(logged - start));
    applyTools.values.push_back(static_cast<double>(CountLines(commands) - tools));
  }

  Figure toolWall{"refresh_tool_wall", "ms", {}};
  Figure toolCpu{"refresh_tool_cpu", "ms", {}};
  TimeRefreshTool(console, runs, toolWall, toolCpu);

  std::printf("tulk network benchmark: 80x25, TERM=xterm-256color, demo host, %d runs\n", runs);
  std::printf("%-36s %10s %10s %10s  %s\n", "figure", "median", "min", "max", "unit");
  for (const Figure& figure : {draw, drawBytes}) {
    Print(figure);
  }
  for (const Figure& figure : downs) {
    Print(figure);
  }
  for (const Figure& figure : {applyCpu, applyWall, applyTools, toolWall, toolCpu}) {
    Print(figure);
  }
  return 0;
}
