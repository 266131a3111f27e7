#pragma once
// Helpers of the troubleshooting screen tests: the driver program
// (TroubleshootingDriver.cpp) on a chosen host, the simulated host's
// records and the screen's colours.

#include <string>
#include <vector>

#include "ScreenTestSupport.h"

namespace TroubleshootingTest {

using Json = nlohmann::json;
using Lines = std::vector<std::string>;
using TulkTest::Gone;
using TulkTest::Settled;
using TulkTest::TestConsole;

/// The driver opening `scene` ("window", "shell-timeouts", "tulk-timeout",
/// "agents") on `host`.
inline TulkTest::Options DriverOptions(const Json& host, const std::string& scene = "window") {
  TulkTest::Options options;
  options.program = TULK_TEST_TROUBLESHOOTING_DRIVER;
  options.hostState = host.dump();
  options.env["TULK_TROUBLESHOOTING_SCENE"] = scene;
  return options;
}

/// The demo host with the shell and SSH running (and enabled) or not.
inline Json HostWithServices(bool shellRunning, bool sshRunning) {
  Json host = TulkTest::DemoHostState();
  host["services"]["TavShell"] = {{"running", shellRunning}, {"enabled", shellRunning}};
  host["services"]["SSH"] = {{"running", sshRunning}, {"enabled", sshRunning}};
  return host;
}

/// The tool runs whose argv, joined by blanks, starts with `prefix`.
inline Lines ToolRuns(const TestConsole& console, const std::string& prefix = "") {
  Lines runs;
  for (const Json& record : TulkTest::SimRecords(console.Root(), "commands.jsonl")) {
    std::string line;
    for (const Json& word : record["argv"]) {
      line += (line.empty() ? "" : " ") + word.get<std::string>();
    }
    if (line.rfind(prefix, 0) == 0) {
      runs.push_back(line);
    }
  }
  return runs;
}

/// The system-log lines holding `text`, without their "<N>".
inline Lines LogLinesWith(const TestConsole& console, const std::string& text) {
  Lines lines;
  for (const std::string& line : console.LogLines()) {
    if (line.find(text) != std::string::npos) {
      lines.push_back(line.substr(line.find('>') + 1));
    }
  }
  return lines;
}

/// The foreground colour of the first cell of `text` (-2: not shown).
inline int ForegroundOf(const TestConsole& console, const std::string& text) {
  for (int row = 0; row < 25; ++row) {
    std::string cells;  // one byte a cell: the box's lines take several
    for (int col = 0; col < 80; ++col) {
      const std::string cell = console.At(row, col).text;
      cells += cell.size() == 1 ? cell : std::string("?");
    }
    if (const std::size_t col = cells.find(text); col != std::string::npos) {
      return console.At(row, static_cast<int>(col)).fg;
    }
  }
  return -2;
}

/// Presses Down until row 1 (the titles) shows `title`, at most `moves`
/// times.
inline ::testing::AssertionResult SelectTitle(TestConsole& console, const std::string& title,
                                              int moves = 5) {
  for (int step = 0; step < moves && console.Row(1).find(title) == std::string::npos; ++step) {
    console.Key("Down");
    console.WaitReady();
  }
  if (console.Row(1).find(title) == std::string::npos) {
    return ::testing::AssertionFailure() << "no entry " << title << "\n" << console.Dump();
  }
  return ::testing::AssertionSuccess();
}

}  // namespace TroubleshootingTest
