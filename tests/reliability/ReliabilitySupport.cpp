#include "ReliabilitySupport.h"

#include <termios.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdio>
#include <cstdlib>

#include "KeyNames.h"
#include "ProcessHygiene.h"

namespace Reliability {

TulkTest::Options ConsoleOptions(const nlohmann::json& host) {
  return TulkTest::ConsoleOptions(host, {}, [](const std::filesystem::path& root) {
    TulkTest::WriteRootFile(root, "/var/log/syslog.log", std::string(kLogLine) + "\n");
  });
}

::testing::AssertionResult LogIn(TulkTest::TestConsole& console) {
  if (auto entered = TulkTest::LogIn(console); !entered) {
    return entered;
  }
  return TulkTest::Settled(console, "System Customization");
}

::testing::AssertionResult OpenEntry(TulkTest::TestConsole& console, const std::string& title) {
  if (auto selected = TulkTest::SelectEntry(console, title); !selected) {
    return selected;
  }
  console.Key("Enter");
  return ::testing::AssertionSuccess();
}

std::vector<std::string> EntryTitles(TulkTest::TestConsole& console) {
  std::vector<std::string> titles;
  for (int step = 0; step < 30; ++step) {
    std::string title = TulkTest::RightTitle(console);
    if (std::find(titles.begin(), titles.end(), title) != titles.end()) {
      break;  // the last entry: Down no longer moves, or wrapped round
    }
    titles.push_back(title);
    console.Key("Down");
    if (!console.WaitReady()) {
      break;
    }
  }
  console.Key("Home");
  (void)console.WaitReady();
  return titles;
}

long ResidentKiB(pid_t pid) {
  const std::string status = TulkTest::ProcFile(pid, "status");
  const std::size_t line = status.find("VmRSS:");
  return line == std::string::npos ? 0 : std::strtol(status.c_str() + line + 6, nullptr, 10);
}

::testing::AssertionResult TerminalGivenBack(const TulkTest::TestConsole& console,
                                             const std::string& shownText) {
  std::optional<termios> attributes = console.TerminalAttributes();
  if (!attributes) {
    return ::testing::AssertionFailure() << "the terminal's attributes cannot be read";
  }
  if ((attributes->c_lflag & (ICANON | ECHO)) != (ICANON | ECHO)) {
    return ::testing::AssertionFailure() << "line editing or echo left off";
  }
  if ((attributes->c_iflag & IXON) == 0) {
    return ::testing::AssertionFailure() << "flow control left off";
  }
  if (!console.Cursor().visible) {
    return ::testing::AssertionFailure() << "the cursor was left hidden\n" << console.Dump();
  }
  if (!shownText.empty() && console.Contains(shownText)) {
    return ::testing::AssertionFailure() << "the console's screen was left up\n" << console.Dump();
  }
  return ::testing::AssertionSuccess();
}

std::uint32_t Seed() {
  static const std::uint32_t seed = [] {
    if (const char* text = std::getenv("TULK_RELIABILITY_SEED"); text != nullptr && *text != 0) {
      return static_cast<std::uint32_t>(std::strtoul(text, nullptr, 10));
    }
    return static_cast<std::uint32_t>(std::chrono::steady_clock::now().time_since_epoch().count());
  }();
  return seed;
}

int Scale() {
  const char* text = std::getenv("TULK_RELIABILITY_SCALE");
  const int scale = text == nullptr ? 1 : std::atoi(text);
  return scale < 1 ? 1 : scale;
}

std::string KeyStream::Burst(int most) {
  static const std::array<const char*, 27> kNames = {
      "F1",     "F2",       "F3",     "F4",     "F5",    "F6",    "F7",   "F8",        "F9",
      "F10",    "F11",      "F12",    "Up",     "Down",  "Right", "Left", "Home",      "End",
      "PageUp", "PageDown", "Insert", "Delete", "Enter", "Esc",   "Tab",  "Backspace", "Space"};
  std::uniform_int_distribution<int> count(1, most);
  std::uniform_int_distribution<int> kind(0, 3);
  std::uniform_int_distribution<int> byte(0, 255);
  std::uniform_int_distribution<std::size_t> name(0, kNames.size() - 1);
  std::string burst;
  for (int n = count(engine_); n > 0; --n) {
    if (kind(engine_) == 0) {
      burst += TulkTest::KeyBytes(kNames[name(engine_)]);
      continue;
    }
    int value = byte(engine_);
    while (value == 0x03 || value == 0x1a || value == 0x1c) {
      value = byte(engine_);
    }
    burst += static_cast<char>(value);
  }
  return burst;
}

void Figure(const std::string& name, const std::string& value) {
  std::printf("[ figures  ] %s: %s\n", name.c_str(), value.c_str());
  std::fflush(stdout);
  ::testing::Test::RecordProperty(name, value);
}

}  // namespace Reliability
