#include "ControlStream.h"

#include <array>

namespace TulkTest {
namespace {

// SGR parameters the filter reads, and some it does not.
constexpr std::array<const char*, 40> kParameters = {
    "",   "0",  "1",  "2",   "3",   "4",        "5",       "7",          "8",  "9",
    "10", "11", "22", "23",  "24",  "25",       "27",      "28",         "29", "30",
    "32", "33", "36", "37",  "39",  "40",       "42",      "43",         "46", "47",
    "49", "90", "97", "100", "107", "38;5;200", "48;5;17", "38;2;1;2;3", "21", "4:3"};

class Reader {
 public:
  explicit Reader(std::string_view bytes) : bytes_(bytes) {}
  bool More() const { return at_ < bytes_.size(); }
  unsigned Next() { return More() ? static_cast<unsigned char>(bytes_[at_++]) : 0U; }
  int Below(int limit) { return static_cast<int>(Next() % static_cast<unsigned>(limit)); }

 private:
  std::string_view bytes_;
  std::size_t at_ = 0;
};

std::string Sgr(Reader& in) {
  std::string control = "\x1b[";
  // At most three: fifteen numbers, below the sixteen libvterm keeps.
  const int count = 1 + in.Below(3);
  for (int i = 0; i < count; ++i) {
    control += (i == 0 ? "" : ";");
    control += kParameters[static_cast<std::size_t>(in.Below(kParameters.size()))];
  }
  return control + "m";
}

// The controls a choice picks among, by choice; empty for those built from
// later bytes (text, SGR, moves).
const std::array<std::vector<std::string>, 16>& Choices() {
  static const std::array<std::vector<std::string>, 16> kChoices = {{
      {},
      // A Unicode line character, which curses writes outside the
      // line-drawing set only. (libvterm does not translate ASCII that
      // follows other UTF-8 in the same write through the set.)
      {"\x1b(B\u2502", "\x1b(B\u2510"},
      {},
      {},
      // Curses' combined attribute control: a designation and a reset.
      {"\x1b(0\x1b[0m", "\x1b(B\x1b[m"},
      {"\x1b(0", "\x1b(B"},
      {"\x0e", "\x0f"},
      {},
      {"\x1b[K", "\x1b[1K", "\x1b[2K", "\x1b[J", "\x1b[4X", "\x1b[M", "\x1b[L", "\x1b[2@",
       "\x1b[P"},
      {"\n"},
      {"\x1b[?25l", "\x1b[?25h", "\x1b[?7h", "\x1b[?1049h", "\x1b[?1049l", "\x1b[?6h"},
      {"\x1b"
       "7",
       "\x1b"
       "8",
       "\x1b[s", "\x1b[u"},
      {"\x1b]2;\x1b[31mtitle\a", "\x1b]4;1;rgb:ff/00/00\x1b\\"},
      {"x\x1b[3b", "\t"},
      {"\x1b[!p",
       "\x1b"
       "c"},
      {"\r\n"},
  }};
  return kChoices;
}

std::string Text(Reader& in) {
  static constexpr char kText[] = "abq xlkjm-|";
  std::string text;
  for (int count = 1 + in.Below(8); count > 0; --count) {
    text += kText[in.Below(sizeof kText - 1)];
  }
  return text;
}

std::string Move(Reader& in, int rows, int cols) {
  const std::string row = std::to_string(1 + in.Below(rows));
  const std::string col = std::to_string(1 + in.Below(cols));
  switch (in.Below(7)) {
    case 0:
      return "\x1b[" + row + ";" + col + "H";
    case 1:
      return "\x1b[" + col + "G";
    case 2:
      return "\x1b[" + row + "d";
    case 3:
      return "\x1b[" + std::to_string(in.Below(5)) + "C";
    case 4:
      return "\x1b[" + std::to_string(in.Below(5)) + "D";
    case 5:
      return "\r";
    default:
      return "\b";
  }
}

}  // namespace

std::vector<std::string> ControlStream(std::string_view choices, int rows, int cols) {
  Reader in(choices);
  std::vector<std::string> pieces;
  while (in.More()) {
    const int choice = in.Below(16);
    const std::vector<std::string>& fixed = Choices()[static_cast<std::size_t>(choice)];
    if (choice == 0) {
      pieces.push_back(Text(in));
    } else if (choice == 2 || choice == 3) {
      pieces.push_back(Sgr(in));
    } else if (choice == 7) {
      pieces.push_back(Move(in, rows, cols));
    } else if (fixed.size() == 1) {
      pieces.push_back(fixed[0]);
    } else {
      pieces.push_back(fixed[static_cast<std::size_t>(in.Below(static_cast<int>(fixed.size())))]);
    }
  }
  return pieces;
}

}  // namespace TulkTest
