#include "TroubleshootingTestSupport.h"

namespace TroubleshootingTest {

TulkTest::Options DriverOptions(const Json& host, const std::string& scene) {
  TulkTest::Options options;
  options.program = TULK_TEST_TROUBLESHOOTING_DRIVER;
  options.hostState = host.dump();
  options.env["TULK_TROUBLESHOOTING_SCENE"] = scene;
  return options;
}

Json HostWithServices(bool shellRunning, bool sshRunning) {
  Json host = TulkTest::DemoHostState();
  host["services"]["TavShell"] = {{"running", shellRunning}, {"enabled", shellRunning}};
  host["services"]["SSH"] = {{"running", sshRunning}, {"enabled", sshRunning}};
  return host;
}

Json HostState(const TestConsole& console) {
  return TulkTest::ReadHostState(console.HostStatePath());
}

Lines ToolRuns(const TestConsole& console) {
  Lines runs;
  for (const Json& record : TulkTest::SimRecords(console.Root(), "commands.jsonl")) {
    std::string line;
    for (const Json& word : record.value("argv", Json::array())) {
      line += (line.empty() ? "" : " ") + word.get<std::string>();
    }
    runs.push_back(line);
  }
  return runs;
}

Lines ToolRunsStarting(const TestConsole& console, const std::string& prefix) {
  Lines runs;
  for (const std::string& run : ToolRuns(console)) {
    if (run.rfind(prefix, 0) == 0) {
      runs.push_back(run);
    }
  }
  return runs;
}

Lines LogLinesWith(const TestConsole& console, const std::string& text) {
  Lines lines;
  for (const std::string& line : console.LogLines()) {
    if (line.find(text) != std::string::npos) {
      lines.push_back(line.substr(line.find('>') + 1));
    }
  }
  return lines;
}

std::string RightTitle(const TestConsole& console, int cols) {
  std::string text;
  for (int col = cols / 2 + 2; col < cols - 1; ++col) {
    text += console.At(1, col).text;
  }
  return text.substr(0, text.find_last_not_of(' ') + 1);
}

int RowOf(const TestConsole& console, const std::string& text) {
  for (int row = 0; row < 25; ++row) {
    if (console.Row(row).find(text) != std::string::npos) {
      return row;
    }
  }
  return -1;
}

int ColumnOf(const TestConsole& console, int row, const std::string& text) {
  // Cells, not bytes: the box's lines are several bytes each.
  std::string cells;
  for (int col = 0; col < 80; ++col) {
    const std::string cell = console.At(row, col).text;
    cells += cell.size() == 1 ? cell : std::string("?");
  }
  const std::size_t at = cells.find(text);
  return at == std::string::npos ? -1 : static_cast<int>(at);
}

int ForegroundOf(const TestConsole& console, const std::string& text) {
  const int row = RowOf(console, text);
  if (row < 0) {
    return -2;
  }
  const int col = ColumnOf(console, row, text);
  return col < 0 ? -2 : console.At(row, col).fg;
}

bool Greyed(const TestConsole& console, const std::string& label) {
  return ForegroundOf(console, label) == 6;
}

::testing::AssertionResult SelectTitle(TestConsole& console, const std::string& title, int moves) {
  for (int step = 0; step <= moves; ++step) {
    if (RightTitle(console) == title) {
      return ::testing::AssertionSuccess();
    }
    const std::string shown = RightTitle(console);
    console.Key("Down");
    if (!WaitUntil(
            console, [&] { return RightTitle(console) != shown; }, "a move",
            std::chrono::milliseconds(1000))) {
      break;
    }
    console.WaitQuiet(std::chrono::milliseconds(60));
  }
  return ::testing::AssertionFailure() << "no entry " << title << "\n" << console.Dump();
}

}  // namespace TroubleshootingTest
