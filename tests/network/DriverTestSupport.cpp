#include "DriverTestSupport.h"

#include <algorithm>

namespace DriverTest {

TulkTest::Options DriverOptions(const nlohmann::json& host, const std::string& scene) {
  TulkTest::Options options;
  options.program = TULK_TEST_NETWORK_DRIVER;
  options.hostState = host.dump();
  options.env["TULK_NETWORK_SCENE"] = scene;
  options.prepareRoot = [](const std::filesystem::path& root) {
    TulkTest::WriteRootFile(root, "/etc/hosts", kHostsFile);
  };
  return options;
}

nlohmann::json HostState(const TulkTest::TestConsole& console) {
  return TulkTest::ReadHostState(console.HostStatePath());
}

std::vector<std::string> Commands(const TulkTest::TestConsole& console) {
  std::vector<std::string> lines;
  for (const nlohmann::json& record : TulkTest::SimRecords(console.Root(), "commands.jsonl")) {
    std::string line;
    for (const nlohmann::json& word : record.value("argv", nlohmann::json::array())) {
      line += (line.empty() ? "" : " ") + word.get<std::string>();
    }
    lines.push_back(line);
  }
  return lines;
}

std::vector<nlohmann::json> Events(const TulkTest::TestConsole& console, const std::string& id) {
  std::vector<nlohmann::json> matching;
  for (const nlohmann::json& record : TulkTest::SimRecords(console.Root(), "events.jsonl")) {
    if (record.value("id", "") == id) {
      matching.push_back(record);
    }
  }
  return matching;
}

int RowOf(const TulkTest::TestConsole& console, const std::string& text) {
  const std::string screen = console.Screen();
  int row = 0;
  for (std::size_t start = 0; start < screen.size(); ++row) {
    const std::size_t end = screen.find('\n', start);
    if (screen.substr(start, end - start).find(text) != std::string::npos) {
      return row;
    }
    if (end == std::string::npos) {
      break;
    }
    start = end + 1;
  }
  return -1;
}

std::string Cells(const TulkTest::TestConsole& console, int row, int column, int count) {
  std::string text;
  for (int c = column; c < column + count; ++c) {
    text += console.At(row, c).text;
  }
  return text.substr(0, text.find_last_not_of(' ') + 1);
}

std::string Squeezed(const std::string& text) {
  std::string squeezed;
  for (char c : text) {
    if (c != ' ' || (!squeezed.empty() && squeezed.back() != ' ')) {
      squeezed += c;
    }
  }
  return squeezed.substr(0, squeezed.find_last_not_of(' ') + 1);
}

std::string RightText(const TulkTest::TestConsole& console) {
  std::string text;
  for (int row = 4; row <= 21; ++row) {
    text += Cells(console, row, 42, 37) + " ";
  }
  return Squeezed(text);
}

std::string RightTitle(const TulkTest::TestConsole& console) {
  return Cells(console, 1, 42, 37);
}

std::string RightFooter(const TulkTest::TestConsole& console) {
  return Cells(console, 22, 41, 38);
}

const std::vector<std::string> kRestoreLabels = {"Create Standard Switch",
                                                 "Create Port Group",
                                                 "Migrate Hykernel NIC to Standard Switch",
                                                 "Restore Network Settings",
                                                 "Restore Standard Switch",
                                                 "Restore DVS"};

::testing::AssertionResult SelectEntry(TulkTest::TestConsole& console, const std::string& title,
                                       const std::vector<std::string>& labels) {
  // A long label is shown up to the last word that fits the right title.
  const auto shows = [](const std::string& shown, const std::string& label) {
    return !shown.empty() && label.rfind(shown, 0) == 0 &&
           (shown.size() == label.size() || label[shown.size()] == ' ');
  };
  const auto complete = [&](const std::string& shown) {
    return std::any_of(labels.begin(), labels.end(),
                       [&](const std::string& label) { return shows(shown, label); });
  };
  if (!WaitUntil(
          console, [&] { return complete(RightTitle(console)); }, "a menu entry")) {
    return ::testing::AssertionFailure() << "no menu";
  }
  for (std::size_t step = 0; step <= labels.size(); ++step) {
    const std::string shown = RightTitle(console);
    if (shows(shown, title)) {
      return ::testing::AssertionSuccess();
    }
    console.Key("Down");
    if (!WaitUntil(
            console,
            [&] {
              const std::string now = RightTitle(console);
              return now != shown && complete(now);
            },
            "the selection to move", std::chrono::seconds(2))) {
      break;
    }
  }
  return ::testing::AssertionFailure() << "no entry " << title << "\n" << console.Dump();
}

}  // namespace DriverTest
