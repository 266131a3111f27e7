#include "ConsoleScenarios.h"

#include <chrono>
#include <thread>

#include "ProcessProbe.h"
#include "TestConsole.h"

namespace TulkBench {
namespace {

using Clock = std::chrono::steady_clock;
using namespace std::chrono_literals;

// Pumps output until nothing arrives for `quiet`; returns the time of the
// last byte.
Clock::time_point Settle(TulkTest::TestConsole& console, std::chrono::milliseconds quiet) {
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

TulkTest::Options BenchOptions() {
  TulkTest::Options options;
  options.start = false;
  return options;
}

// Bytes the console writes in answer to one key, after settling.
double BytesForKey(TulkTest::TestConsole& console, const std::string& key) {
  Settle(console, 150ms);
  std::size_t before = console.BytesReceived();
  if (key.size() == 1) {
    console.Type(key);
  } else {
    console.Key(key);
  }
  Settle(console, 150ms);
  return static_cast<double>(console.BytesReceived() - before);
}

}  // namespace

std::vector<Figure> RunScenarios(const BenchSettings& settings) {
  Figure startup{"startup_to_settled_screen", "ms", {}};
  Figure peak{"peak_resident_memory", "KiB", {}};
  Figure welcomeBytes{"welcome_screen_bytes", "bytes", {}};
  for (int run = 0; run < settings.runs; ++run) {
    TulkTest::TestConsole console(BenchOptions());
    Clock::time_point start = Clock::now();
    console.Start();
    Clock::time_point settled = Settle(console, 300ms);
    startup.values.push_back(std::chrono::duration<double, std::milli>(settled - start).count());
    peak.values.push_back(static_cast<double>(ReadUsage(console.Pid()).peakResidentKiB));
    welcomeBytes.values.push_back(static_cast<double>(console.BytesReceived()));
  }

  Figure anyKey{"welcome_any_key_bytes", "bytes", {}};
  {
    TulkTest::TestConsole console(BenchOptions());
    console.Start();
    for (int run = 0; run < settings.runs; ++run) {
      anyKey.values.push_back(BytesForKey(console, "x"));
    }
  }

  Figure idleCpu{"idle_welcome_cpu", "ms/" + std::to_string(settings.idleSeconds) + "s", {}};
  Figure idleWakeups{"idle_welcome_wakeups", "/" + std::to_string(settings.idleSeconds) + "s", {}};
  {
    TulkTest::TestConsole console(BenchOptions());
    console.Start();
    Settle(console, 300ms);
    ProcessUsage before = ReadUsage(console.Pid());
    std::this_thread::sleep_for(std::chrono::seconds(settings.idleSeconds));
    ProcessUsage after = ReadUsage(console.Pid());
    idleCpu.values.push_back(after.cpuMillis - before.cpuMillis);
    idleWakeups.values.push_back(static_cast<double>(after.contextSwitches - before.contextSwitches));
  }
  return {startup, peak, welcomeBytes, anyKey, idleCpu, idleWakeups};
}

}  // namespace TulkBench
