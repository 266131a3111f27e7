#include "SessionTestSupport.h"

#include <algorithm>

namespace SessionTest {

TulkTest::Options ConsoleOptions(const nlohmann::json& host, const PamSetup& pam,
                                 std::function<void(const std::filesystem::path&)> prepare) {
  TulkTest::Options options;
  options.hostState = host.dump();
  options.pamUsers = pam.users;
  options.pamPolicy = pam.policy;
  options.prepareRoot = [prepare](const std::filesystem::path& root) {
    TulkTest::WriteRootFile(root, "/var/run/brimlo/show-tulk-login");
    if (prepare) {
      prepare(root);
    }
  };
  return options;
}

std::filesystem::path PasswordFile(const TulkTest::TestConsole& console) {
  return console.PamPasswordFile();
}

::testing::AssertionResult LogIn(TulkTest::TestConsole& console, const std::string& user,
                                 const std::string& password, const std::string& key) {
  if (auto welcome = Settled(console, "Customize System/View Logs"); !welcome) {
    return welcome;
  }
  console.Key(key);
  if (auto shown = Settled(console, "Authentication Required"); !shown) {
    return shown;
  }
  if (user != "root") {
    console.Type(user);
  }
  console.Key("Down");
  console.Type(password);
  console.Key("Enter");
  return ::testing::AssertionSuccess();
}

std::vector<nlohmann::json> RecordsWhere(const TulkTest::TestConsole& console,
                                         const std::string& file, const std::string& key,
                                         const std::string& value) {
  std::vector<nlohmann::json> matching;
  for (const nlohmann::json& record : TulkTest::SimRecords(console.Root(), file)) {
    if (record.is_object() && record.value(key, "") == value) {
      matching.push_back(record);
    }
  }
  return matching;
}

std::vector<std::string> CommandLines(const TulkTest::TestConsole& console) {
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

int CountLog(const TulkTest::TestConsole& console, const std::string& line) {
  const std::vector<std::string> lines = console.LogLines();
  return static_cast<int>(std::count(lines.begin(), lines.end(), line));
}

::testing::AssertionResult CursorOn(TulkTest::TestConsole& console, const std::string& label) {
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

int RowOf(const TulkTest::TestConsole& console, const std::string& text, int rows) {
  for (int row = 0; row < rows; ++row) {
    if (console.Row(row).find(text) != std::string::npos) {
      return row;
    }
  }
  return -1;
}

}  // namespace SessionTest

namespace SessionTest {

std::string Cells(const TulkTest::TestConsole& console, int row, int column, int count) {
  std::string text;
  for (int c = column; c < column + count; ++c) {
    text += console.At(row, c).text;
  }
  return text;
}

}  // namespace SessionTest
