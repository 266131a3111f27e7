#include "ConsoleScenarios.h"

#include <chrono>
#include <filesystem>
#include <fstream>
#include <thread>

#include "ProcessProbe.h"
#include "TestConsole.h"

namespace TulkBench {
namespace {

using Clock = std::chrono::steady_clock;

// The demo host with console login allowed and the demo users.
TulkTest::Options BenchOptions() {
  TulkTest::Options options;
  options.start = false;
  options.pamUsers = {{"root", "tulk"}};
  options.prepareRoot = [](const std::filesystem::path& root) {
    std::filesystem::create_directories(root / "var/run/brimlo");
    std::ofstream(root / "var/run/brimlo/show-tulk-login");
  };
  return options;
}

void Press(TulkTest::TestConsole& console, const std::string& key) {
  if (key.size() == 1) {
    console.Type(key);
  } else {
    console.Key(key);
  }
}

// Bytes the console writes in answer to one key: from the moment it waits
// for the key to the moment it waits for the next.
double BytesForKey(TulkTest::TestConsole& console, const std::string& key) {
  console.WaitReady();
  std::size_t before = console.BytesReceived();
  Press(console, key);
  console.WaitReady();
  return static_cast<double>(console.BytesReceived() - before);
}

// Milliseconds from sending a key to the console's own report that it has
// drawn the answer and waits again.
double MillisForKey(TulkTest::TestConsole& console, const std::string& key) {
  console.WaitReady();
  const Clock::time_point sent = Clock::now();
  Press(console, key);
  console.WaitReady();
  return std::chrono::duration<double, std::milli>(console.ReadyAt() - sent).count();
}

void MeasureIdle(TulkTest::TestConsole& console, const BenchSettings& settings, Figure& cpu,
                 Figure& wakeups) {
  console.WaitReady();
  ProcessUsage before = ReadUsage(console.Pid());
  std::this_thread::sleep_for(std::chrono::seconds(settings.idleSeconds));
  ProcessUsage after = ReadUsage(console.Pid());
  cpu.values.push_back(after.cpuMillis - before.cpuMillis);
  wakeups.values.push_back(static_cast<double>(after.contextSwitches - before.contextSwitches));
}

bool OpenLogin(TulkTest::TestConsole& console) {
  if (!console.WaitReady() || !console.Contains("Customize System/View Logs")) {
    return false;
  }
  console.Key("F2");
  return console.WaitReady() && console.Contains("Authentication Required");
}

bool LogIn(TulkTest::TestConsole& console) {
  if (!OpenLogin(console)) {
    return false;
  }
  console.Key("Down");
  console.Type("tulk");
  console.Key("Enter");
  return console.WaitForText("System Customization");
}

}  // namespace

std::vector<Figure> RunScenarios(const BenchSettings& settings) {
  const std::string idleUnit = "/" + std::to_string(settings.idleSeconds) + "s";
  std::vector<Figure> figures;

  Figure startup{"startup_to_settled_welcome", "ms", {}};
  Figure peak{"peak_resident_welcome", "KiB", {}};
  Figure welcomeBytes{"welcome_screen_bytes", "bytes", {}};
  for (int run = 0; run < settings.runs; ++run) {
    TulkTest::TestConsole console(BenchOptions());
    Clock::time_point start = Clock::now();
    console.Start();
    console.WaitReady();
    startup.values.push_back(
        std::chrono::duration<double, std::milli>(console.ReadyAt() - start).count());
    peak.values.push_back(static_cast<double>(ReadUsage(console.Pid()).peakResidentKiB));
    welcomeBytes.values.push_back(static_cast<double>(console.BytesReceived()));
  }
  figures.insert(figures.end(), {startup, peak, welcomeBytes});

  Figure anyKey{"welcome_repaint_key_bytes", "bytes", {}};
  Figure idleWelcomeCpu{"idle_welcome_cpu", "ms" + idleUnit, {}};
  Figure idleWelcomeWakeups{"idle_welcome_wakeups", idleUnit, {}};
  {
    TulkTest::TestConsole console(BenchOptions());
    console.Start();
    for (int run = 0; run < settings.runs; ++run) {
      anyKey.values.push_back(BytesForKey(console, "x"));
    }
    MeasureIdle(console, settings, idleWelcomeCpu, idleWelcomeWakeups);
  }
  figures.insert(figures.end(), {anyKey, idleWelcomeCpu, idleWelcomeWakeups});

  // Any key repaints the welcome screen; a lone Esc waits first for a
  // sequence that might follow it. The extra time is the escape delay.
  Figure plainKeyMillis{"welcome_key_to_ready_ms", "ms", {}};
  Figure escMillis{"welcome_esc_to_ready_ms", "ms", {}};
  Figure escDelay{"lone_esc_delay_ms", "ms", {}};
  {
    TulkTest::TestConsole console(BenchOptions());
    console.Start();
    for (int run = 0; run < settings.runs; ++run) {
      const double plain = MillisForKey(console, "x");
      const double esc = MillisForKey(console, "Esc");
      plainKeyMillis.values.push_back(plain);
      escMillis.values.push_back(esc);
      escDelay.values.push_back(esc - plain);
    }
  }
  figures.insert(figures.end(), {plainKeyMillis, escMillis, escDelay});

  Figure firstChar{"login_name_first_char_bytes", "bytes", {}};
  Figure nextChar{"login_name_next_char_bytes", "bytes", {}};
  {
    TulkTest::TestConsole console(BenchOptions());
    console.Start();
    if (OpenLogin(console)) {
      firstChar.values.push_back(BytesForKey(console, "a"));
      for (int run = 0; run < settings.runs; ++run) {
        nextChar.values.push_back(BytesForKey(console, "b"));
      }
    }
  }
  figures.insert(figures.end(), {firstChar, nextChar});

  Figure firstDown{"menu_first_down_bytes", "bytes", {}};
  Figure anyDown{"menu_down_bytes_each_entry", "bytes", {}};
  Figure peakMenu{"peak_resident_menu", "KiB", {}};
  Figure idleMenuCpu{"idle_menu_cpu", "ms" + idleUnit, {}};
  Figure idleMenuWakeups{"idle_menu_wakeups", idleUnit, {}};
  {
    TulkTest::TestConsole console(BenchOptions());
    console.Start();
    if (LogIn(console)) {
      firstDown.values.push_back(BytesForKey(console, "Down"));
      anyDown.values.push_back(firstDown.values.back());
      for (int entry = 0; entry < 12; ++entry) {
        anyDown.values.push_back(BytesForKey(console, "Down"));
      }
      peakMenu.values.push_back(static_cast<double>(ReadUsage(console.Pid()).peakResidentKiB));
      MeasureIdle(console, settings, idleMenuCpu, idleMenuWakeups);
    }
  }
  figures.insert(figures.end(), {firstDown, anyDown, peakMenu, idleMenuCpu, idleMenuWakeups});
  return figures;
}

}  // namespace TulkBench
