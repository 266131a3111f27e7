#include "NetworkTestSupport.h"

#include "SessionTestSupport.h"

namespace NetworkTest {
namespace {

constexpr int kCols = 80;
constexpr int kRows = 25;

std::string Trim(std::string text) {
  text.erase(text.find_last_not_of(' ') + 1);
  return text;
}

}  // namespace

TulkTest::Options Options(const nlohmann::json& host) {
  return SessionTest::ConsoleOptions(host);
}

std::string RightTitle(const TulkTest::TestConsole& console) {
  std::string text;
  for (int col = kCols / 2 + 2; col < kCols - 1; ++col) {
    text += console.At(1, col).text;
  }
  return Trim(text);
}

std::vector<std::string> RightPane(const TulkTest::TestConsole& console) {
  std::vector<std::string> rows;
  for (int row = 4; row < kRows - 3; ++row) {
    std::string text;
    for (int col = kCols / 2 + 2; col < kCols - 2; ++col) {
      text += console.At(row, col).text;
    }
    rows.push_back(Trim(text));
  }
  return rows;
}

::testing::AssertionResult Select(TulkTest::TestConsole& console, const std::string& label,
                                  bool up) {
  for (int step = 0; step < 20; ++step) {
    if (!console.WaitReady()) {
      break;
    }
    const std::string shown = RightTitle(console);
    if (shown == label) {
      return ::testing::AssertionSuccess();
    }
    console.Key(up ? "Up" : "Down");
  }
  return ::testing::AssertionFailure() << "no entry " << label << "\n" << console.Dump();
}

::testing::AssertionResult OpenMenu(TulkTest::TestConsole& console) {
  if (auto in = SessionTest::LogIn(console); !in) {
    return in;
  }
  if (auto menu = TulkTest::Settled(console, "System Customization"); !menu) {
    return menu;
  }
  return Select(console, "Configure Management Network");
}

::testing::AssertionResult OpenWindow(TulkTest::TestConsole& console) {
  if (auto menu = OpenMenu(console); !menu) {
    return menu;
  }
  console.Key("Enter");
  if (auto window = TulkTest::Settled(console, "Custom DNS Suffixes"); !window) {
    return window;
  }
  return TulkTest::WaitUntil(
      console, [&] { return RightTitle(console) != "Configure Management Network"; },
      "the window's first entry");
}

::testing::AssertionResult OpenDialog(TulkTest::TestConsole& console, const std::string& label,
                                      const std::string& title) {
  if (auto selected = Select(console, label); !selected) {
    return selected;
  }
  console.Key("Enter");
  return TulkTest::Settled(console, title);
}

::testing::AssertionResult CloseDialog(TulkTest::TestConsole& console, const std::string& key,
                                       const std::string& title) {
  console.Key(key);
  return TulkTest::Gone(console, title);
}

::testing::AssertionResult ApplyChanges(TulkTest::TestConsole& console) {
  console.Key("Esc");
  if (auto asked = TulkTest::Settled(console, "Configure Management Network: Confirm"); !asked) {
    return asked;
  }
  console.Type("y");
  if (auto applied = console.WaitForLog("Network settings changed."); !applied) {
    return applied;
  }
  return TulkTest::Settled(console, "System Customization");
}

nlohmann::json HostState(const TulkTest::TestConsole& console) {
  return TulkTest::ReadHostState(console.HostStatePath());
}

std::vector<std::string> LogMessages(const TulkTest::TestConsole& console) {
  std::vector<std::string> messages;
  for (const std::string& line : console.LogLines()) {
    const auto close = line.find('>');
    messages.push_back(close == std::string::npos ? line : line.substr(close + 1));
  }
  return messages;
}

bool Logged(const TulkTest::TestConsole& console, const std::string& line) {
  for (const std::string& message : LogMessages(console)) {
    if (message == line) {
      return true;
    }
  }
  return false;
}

}  // namespace NetworkTest
