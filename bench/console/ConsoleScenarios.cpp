#include "ConsoleScenarios.h"

#include <chrono>
#include <csignal>
#include <thread>

#include "BenchConsole.h"
#include "ProcessProbe.h"
#include "ScratchFolder.h"

namespace TulkBench {
namespace {

using namespace std::chrono_literals;

constexpr const char* kTerm = "xterm-256color";

// Bytes the console writes in answer to one key, after settling.
double BytesForKey(TulkTest::TestConsole& console, const std::string& key) {
  Settle(console, 150ms);
  std::size_t before = console.BytesReceived();
  Press(console, key);
  Settle(console, 150ms);
  return static_cast<double>(console.BytesReceived() - before);
}

void MeasureIdle(TulkTest::TestConsole& console, const BenchSettings& settings, Figure& cpu,
                 Figure& wakeups) {
  Settle(console, 300ms);
  ProcessUsage before = ReadUsage(console.Pid());
  std::this_thread::sleep_for(std::chrono::seconds(settings.idleSeconds));
  ProcessUsage after = ReadUsage(console.Pid());
  cpu.values.push_back(after.cpuMillis - before.cpuMillis);
  wakeups.values.push_back(static_cast<double>(after.contextSwitches - before.contextSwitches));
}

void Stop(TulkTest::TestConsole& console) {
  console.Signal(SIGTERM);
  console.WaitExit(2s);
}

}  // namespace

std::vector<Figure> RunScenarios(const BenchSettings& settings) {
  const std::string idleUnit = "/" + std::to_string(settings.idleSeconds) + "s";
  ScratchFolder pam("tulk-bench-pam");
  const std::string pamFolder = pam.Path().string();
  std::vector<Figure> figures;

  Figure startup{"startup_to_settled_welcome", "ms", {}};
  Figure peak{"peak_resident_welcome", "KiB", {}};
  for (int run = 0; run < settings.runs; ++run) {
    TulkTest::TestConsole console(DemoOptions(kTerm, pamFolder, settings.program));
    BenchClock::time_point start = BenchClock::now();
    console.Start();
    BenchClock::time_point settled = Settle(console, 300ms);
    startup.values.push_back(std::chrono::duration<double, std::milli>(settled - start).count());
    peak.values.push_back(static_cast<double>(ReadUsage(console.Pid()).peakResidentKiB));
    Stop(console);
  }
  figures.insert(figures.end(), {startup, peak});

  Figure anyKey{"welcome_repaint_key_bytes", "bytes", {}};
  Figure idleWelcomeCpu{"idle_welcome_cpu", "ms" + idleUnit, {}};
  Figure idleWelcomeWakeups{"idle_welcome_wakeups", idleUnit, {}};
  {
    TulkTest::TestConsole console(DemoOptions(kTerm, pamFolder, settings.program));
    console.Start();
    for (int run = 0; run < settings.runs; ++run) {
      anyKey.values.push_back(BytesForKey(console, "x"));
    }
    MeasureIdle(console, settings, idleWelcomeCpu, idleWelcomeWakeups);
    Stop(console);
  }
  figures.insert(figures.end(), {anyKey, idleWelcomeCpu, idleWelcomeWakeups});

  // A lone Esc: from the key to the login dialog gone (curses waits the
  // escape delay for the rest of a sequence first).
  Figure loneEsc{"lone_esc_closes_login_ms", "ms", {}};
  {
    TulkTest::TestConsole console(DemoOptions(kTerm, pamFolder, settings.program));
    console.Start();
    for (int run = 0; run < settings.runs && OpenLogin(console); ++run) {
      Settle(console, 150ms);
      const BenchClock::time_point sent = BenchClock::now();
      console.Key("Esc");
      if (!console.WaitForTextGone("Authentication Required")) {
        break;
      }
      loneEsc.values.push_back(
          std::chrono::duration<double, std::milli>(BenchClock::now() - sent).count());
    }
    Stop(console);
  }
  figures.push_back(loneEsc);

  // Peak memory once logged in, with the demo's own PAM stack loaded.
  Figure peakMenu{"peak_resident_menu", "KiB", {}};
  Figure idleMenuCpu{"idle_menu_cpu", "ms" + idleUnit, {}};
  Figure idleMenuWakeups{"idle_menu_wakeups", idleUnit, {}};
  {
    TulkTest::TestConsole console(DemoOptions(kTerm, pamFolder, settings.program));
    console.Start();
    if (LogIn(console)) {
      for (int entry = 0; entry < 12; ++entry) {
        BytesForKey(console, "Down");
      }
      peakMenu.values.push_back(static_cast<double>(ReadUsage(console.Pid()).peakResidentKiB));
      MeasureIdle(console, settings, idleMenuCpu, idleMenuWakeups);
    }
    Stop(console);
  }
  figures.insert(figures.end(), {peakMenu, idleMenuCpu, idleMenuWakeups});
  return figures;
}

}  // namespace TulkBench
