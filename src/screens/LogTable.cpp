#include "screens/LogTable.h"

#include <sys/stat.h>

#include "runtime/HostPath.h"

namespace Tulk {

LogTable::LogTable()
    : rows_{{
          {"Syslog", "/var/log/syslog.log", false},
          {"Hykernel", "/var/log/hykernel.log", false},
          {"Config", "/var/log/sysboot.log", false},
          {"Management Agent (mgmtd)", "/var/log/mgmtd.log", false},
          {"Helmsman Agent (hlma)", "/var/log/hlma.log", false},
          {"High Availibility Agent (hagt)", "/var/log/hagt.log", false},
          {"Brimlo Tavi Observation log (qobd)", "/var/log/qobd.log", false},
      }} {
}

std::string LogTable::Describe() {
  for (Row& row : rows_) {
    struct stat status {};
    row.available = stat(HostPath(row.path).c_str(), &status) == 0 && S_ISREG(status.st_mode);
  }
  return FormatLogList(rows_);
}

std::optional<std::size_t> LogTable::RowForDigit(int digit) const {
  std::array<bool, kRows> available{};
  for (std::size_t i = 0; i < kRows; ++i) {
    available[i] = rows_[i].available;
  }
  return ChooseLogRow(available, digit);
}

std::string FormatLogList(const std::array<LogTable::Row, LogTable::kRows>& rows) {
  std::string text;
  int number = 1;
  for (const LogTable::Row& row : rows) {
    if (!row.available) {
      continue;
    }
    text += "{color:white}<" + std::to_string(number++) + "> {color:light-grey}" + row.name +
            "{/color}\n";
  }
  return text;
}

std::optional<std::size_t> ChooseLogRow(const std::array<bool, LogTable::kRows>& available,
                                        int digit) {
  std::size_t count = 0;
  for (std::size_t row = 0; row < LogTable::kRows; ++row) {
    if (available[row]) {
      ++count;
    }
    if (count == static_cast<std::size_t>(digit)) {
      return row;
    }
  }
  if (count <= 6) {
    return count;
  }
  return std::nullopt;
}

}  // namespace Tulk
