#pragma once
/// The host's log files that "View System Logs" offers, and the choice of
/// a log by the digit typed.
///
/// A fixed table of seven rows (name, path, whether the file exists):
///
/// | Row | Name                                   | Path                    |
/// |-----|----------------------------------------|-------------------------|
/// | 1   | Syslog                                 | /var/log/syslog.log     |
/// | 2   | Hykernel                               | /var/log/hykernel.log   |
/// | 3   | Config                                 | /var/log/sysboot.log    |
/// | 4   | Management Agent (mgmtd)               | /var/log/mgmtd.log      |
/// | 5   | Helmsman Agent (hlma)                  | /var/log/hlma.log       |
/// | 6   | High Availibility Agent (hagt)         | /var/log/hagt.log       |
/// | 7   | Brimlo Tavi Observation log (qobd)     | /var/log/qobd.log       |
///
/// ("Availibility" is the product's own spelling.) The list on screen
/// numbers only the files that exist, consecutively from 1. A log counts
/// as existing only when it is a regular file (a symbolic link to one
/// counts): the pager cannot show a FIFO or a device, and would hang on it.

#include <array>
#include <cstddef>
#include <optional>
#include <string>

namespace Tulk {

class LogTable {
 public:
  static constexpr std::size_t kRows = 7;

  struct Row {
    const char* name;
    const char* path;
    bool available;
  };

  LogTable();

  /// Asks the file system for each file's status (paths under the host
  /// root; regular files only) and returns the list text: one line
  /// "{color:white}<N> {color:light-grey}name{/color}" per existing file,
  /// N counting the existing files from 1.
  std::string Describe();

  /// The row that `digit` (0 to 9) opens, by the flags of the last
  /// Describe() (ChooseLogRow()).
  std::optional<std::size_t> RowForDigit(int digit) const;

  const std::array<Row, kRows>& Rows() const { return rows_; }
  /// Sets a row's flag as Describe() would (for tests).
  void SetAvailable(std::size_t row, bool available) { rows_[row].available = available; }

 private:
  std::array<Row, kRows> rows_;
};

/// The list text for the flags as they stand (Describe() without asking
/// the file system).
std::string FormatLogList(const std::array<LogTable::Row, LogTable::kRows>& rows);

/// The row (from 0) that `digit` opens: walking the rows with a count c of
/// the existing ones, the row at which c reaches `digit`; when the walk
/// ends without one and c is 6 or less, the row with index c. So 1 to the
/// number of existing logs open those logs in order, while two outcomes
/// are kept as the product has them: 0 opens the first row when that file
/// is missing, and a digit beyond the existing logs opens the row just
/// after position c (the pager then starts on a file that may not exist).
/// With all seven files present such digits open nothing (nullopt).
std::optional<std::size_t> ChooseLogRow(const std::array<bool, LogTable::kRows>& available,
                                        int digit);

}  // namespace Tulk
