#include "ScreenTestSupport.h"

#include <algorithm>
#include <cstdio>
#include <fstream>
#include <iterator>

#include "platform/sim/DemoHost.h"

namespace TulkTest {
namespace {

std::string Trimmed(std::string text) {
  text.erase(text.find_last_not_of(' ') + 1);
  return text;
}

}  // namespace

Json DemoHostState() {
  return Sim::DemoHostState();
}

Options ConsoleOptions(const Json& host, const PamSetup& pam,
                       std::function<void(const std::filesystem::path&)> prepare) {
  Options options;
  options.hostState = host.dump();
  options.pamUsers = pam.users;
  options.pamPolicy = pam.policy;
  options.prepareRoot = [prepare](const std::filesystem::path& root) {
    WriteRootFile(root, "/var/run/brimlo/show-tulk-login");
    if (prepare) {
      prepare(root);
    }
  };
  return options;
}

Options DriverOptions(const Json& host, const std::string& scene) {
  Options options;
  options.program = TULK_TEST_SCREEN_DRIVER;
  options.hostState = host.dump();
  options.env["TULK_SCENE"] = scene;
  options.prepareRoot = [](const std::filesystem::path& root) {
    WriteRootFile(root, "/etc/hosts", kHostsFile);
  };
  return options;
}

::testing::AssertionResult LogIn(TestConsole& console, const std::string& user,
                                 const std::string& password, const std::string& key) {
  if (auto welcome = Settled(console, "Customize System/View Logs"); !welcome) {
    return welcome;
  }
  console.Key(key);
  if (auto shown = Settled(console, "Authentication Required"); !shown) {
    return shown;
  }
  if (console.Contains("Configured Keyboard")) {
    console.Key("Down");  // a local console's dialog starts on the keyboard label
  }
  if (user != "root") {
    console.Type(user);
  }
  console.Key("Down");
  console.Type(password);
  console.Key("Enter");
  return ::testing::AssertionSuccess();
}

::testing::AssertionResult SelectEntry(TestConsole& console, const std::string& title, int cols,
                                       bool up) {
  std::string before;
  for (int step = 0; step < 40; ++step) {
    if (auto ready = console.WaitReady(); !ready) {
      return ready;
    }
    const std::string shown = RightTitle(console, cols);
    if (!shown.empty() && title.rfind(shown, 0) == 0 &&
        (shown.size() == title.size() || title[shown.size()] == ' ')) {
      return ::testing::AssertionSuccess();
    }
    if (step > 0 && shown == before) {
      up = !up;  // the end of a menu that does not wrap
    }
    before = shown;
    console.Key(up ? "Up" : "Down");
  }
  return ::testing::AssertionFailure() << "no entry " << title << "\n" << console.Dump();
}

::testing::AssertionResult OpenMenuEntry(TestConsole& console, const std::string& title) {
  if (auto in = LogIn(console); !in) {
    return in;
  }
  if (auto menu = Settled(console, "System Customization"); !menu) {
    return menu;
  }
  return SelectEntry(console, title);
}

void ReplaceHostState(const TestConsole& console, const Json& host) {
  const std::filesystem::path fresh = console.HostStatePath().string() + ".new";
  std::ofstream(fresh) << host.dump();
  std::filesystem::rename(fresh, console.HostStatePath());
}

Json ReadHostState(const std::filesystem::path& stateFile) {
  std::ifstream in(stateFile);
  return Json::parse(in, nullptr, false);
}

Json HostState(const TestConsole& console) {
  return ReadHostState(console.HostStatePath());
}

void WriteRootFile(const std::filesystem::path& root, const std::string& path,
                   const std::string& text) {
  std::filesystem::path file = root / std::filesystem::path(path).relative_path();
  std::filesystem::create_directories(file.parent_path());
  std::ofstream(file) << text;
}

std::string ReadText(const std::filesystem::path& path) {
  std::ifstream in(path);
  return std::string(std::istreambuf_iterator<char>(in), {});
}

std::string Capture(const std::string& commandLine) {
  std::string output;
  FILE* pipe = popen(commandLine.c_str(), "r");
  if (pipe == nullptr) {
    return output;
  }
  char buffer[256];
  while (std::fgets(buffer, sizeof buffer, pipe) != nullptr) {
    output += buffer;
  }
  pclose(pipe);
  return output;
}

::testing::AssertionResult Settled(TestConsole& console, const std::string& text) {
  if (auto shown = console.WaitForText(text); !shown) {
    return shown;
  }
  if (auto ready = console.WaitReady(); !ready) {
    return ready;
  }
  if (!console.Contains(text)) {
    return ::testing::AssertionFailure() << "\"" << text << "\" was shown, then replaced\n"
                                         << console.Dump();
  }
  return ::testing::AssertionSuccess();
}

::testing::AssertionResult Gone(TestConsole& console, const std::string& text) {
  if (auto gone = console.WaitForTextGone(text); !gone) {
    return gone;
  }
  if (auto ready = console.WaitReady(); !ready) {
    return ready;
  }
  if (console.Contains(text)) {
    return ::testing::AssertionFailure() << "\"" << text << "\" went, then came back\n"
                                         << console.Dump();
  }
  return ::testing::AssertionSuccess();
}

::testing::AssertionResult CursorOn(TestConsole& console, const std::string& label) {
  if (auto ready = console.WaitReady(); !ready) {
    return ready;
  }
  const int row = RowOf(console, label);
  if (row < 0 || console.Cursor().row != row) {
    return ::testing::AssertionFailure() << "the cursor is not on \"" << label << "\"\n"
                                         << console.Dump();
  }
  return ::testing::AssertionSuccess();
}

std::vector<Json> SimRecords(const std::filesystem::path& root, const std::string& file) {
  std::vector<Json> records;
  std::ifstream in(root / "var/log/tulk-sim" / file);
  for (std::string line; std::getline(in, line);) {
    if (!line.empty()) {
      records.push_back(Json::parse(line, nullptr, false));
    }
  }
  return records;
}

std::vector<Json> RecordsWhere(const TestConsole& console, const std::string& file,
                               const std::string& key, const std::string& value) {
  std::vector<Json> matching;
  for (const Json& record : SimRecords(console.Root(), file)) {
    if (record.is_object() && record.value(key, "") == value) {
      matching.push_back(record);
    }
  }
  return matching;
}

std::vector<Json> Events(const TestConsole& console, const std::string& id) {
  return RecordsWhere(console, "events.jsonl", "id", id);
}

std::vector<std::string> CommandLines(const TestConsole& console, const std::string& prefix) {
  std::vector<std::string> lines;
  for (const Json& record : SimRecords(console.Root(), "commands.jsonl")) {
    std::string line;
    for (const Json& word : record.value("argv", Json::array())) {
      line += (line.empty() ? "" : " ") + word.get<std::string>();
    }
    if (line.rfind(prefix, 0) == 0) {
      lines.push_back(line);
    }
  }
  return lines;
}

bool Ran(const TestConsole& console, const std::string& line) {
  const std::vector<std::string> lines = CommandLines(console, line);
  return std::find(lines.begin(), lines.end(), line) != lines.end();
}

std::vector<std::string> LogMessages(const TestConsole& console) {
  std::vector<std::string> messages;
  for (const std::string& line : console.LogLines()) {
    messages.push_back(line.substr(line.find('>') + 1));
  }
  return messages;
}

bool Logged(const TestConsole& console, const std::string& line) {
  const std::vector<std::string> messages = LogMessages(console);
  return std::find(messages.begin(), messages.end(), line) != messages.end();
}

std::vector<std::string> LogLinesWith(const TestConsole& console, const std::string& text) {
  std::vector<std::string> lines;
  for (const std::string& message : LogMessages(console)) {
    if (message.find(text) != std::string::npos) {
      lines.push_back(message);
    }
  }
  return lines;
}

int CountLog(const TestConsole& console, const std::string& line) {
  const std::vector<std::string> lines = console.LogLines();
  return static_cast<int>(std::count(lines.begin(), lines.end(), line));
}

std::string Cells(const TestConsole& console, int row, int column, int count) {
  std::string text;
  for (int c = column; c < column + count; ++c) {
    text += console.At(row, c).text;
  }
  return text;
}

int RowOf(const TestConsole& console, const std::string& text, int rows) {
  for (int row = 0; row < rows; ++row) {
    if (console.Row(row).find(text) != std::string::npos) {
      return row;
    }
  }
  return -1;
}

int MenuRow(const TestConsole& console, const std::string& label) {
  for (int row = 0; row < 25; ++row) {
    if (console.Row(row).substr(0, 40).find(label) != std::string::npos) {
      return row;
    }
  }
  return -1;
}

int ForegroundOf(const TestConsole& console, const std::string& text) {
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

std::string Squeezed(const std::string& text) {
  std::string squeezed;
  for (char c : text) {
    if (c != ' ' || (!squeezed.empty() && squeezed.back() != ' ')) {
      squeezed += c;
    }
  }
  return Trimmed(squeezed);
}

std::string RightTitle(const TestConsole& console, int cols) {
  return Trimmed(Cells(console, 1, cols / 2 + 2, cols / 2 - 3));
}

std::string RightFooter(const TestConsole& console) {
  return Trimmed(Cells(console, 22, 41, 38));
}

std::vector<std::string> RightPane(const TestConsole& console) {
  std::vector<std::string> rows;
  for (int row = 4; row <= 21; ++row) {
    rows.push_back(Trimmed(Cells(console, row, 42, 36)));
  }
  return rows;
}

std::string RightText(const TestConsole& console) {
  std::string text;
  for (const std::string& row : RightPane(console)) {
    text += row + " ";
  }
  return Squeezed(text);
}

}  // namespace TulkTest
