#include "ControlStream.h"

#include <array>
#include <utility>

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

std::string Csi(const std::string& parameters, char final) {
  return "\x1b[" + parameters + final;
}

}  // namespace

std::vector<std::string> ControlStream(std::string_view choices, int rows, int cols) {
  Reader in(choices);
  std::vector<std::string> pieces;
  while (in.More()) {
    std::string out;
    switch (in.Below(16)) {
      case 0: {
        static constexpr char kText[] = "abq xlkjm-|";
        const int count = 1 + in.Below(8);
        for (int i = 0; i < count; ++i) {
          out += kText[in.Below(sizeof kText - 1)];
        }
        break;
      }
      case 1:
        // A Unicode line character, which curses writes outside the
        // line-drawing set only. (libvterm does not translate ASCII that
        // follows other UTF-8 in the same write through the set.)
        out += in.Below(2) == 0 ? "\x1b(B\u2502" : "\x1b(B\u2510";
        break;
      case 2:
      case 3:
        out += Sgr(in);
        break;
      case 4:
        // Curses' combined attribute control: a designation and a reset.
        out += in.Below(2) == 0 ? "\x1b(0\x1b[0m" : "\x1b(B\x1b[m";
        break;
      case 5:
        out += in.Below(2) == 0 ? "\x1b(0" : "\x1b(B";
        break;
      case 6:
        out += in.Below(2) == 0 ? "\x0e" : "\x0f";
        break;
      case 7: {
        const std::string row = std::to_string(1 + in.Below(rows));
        const std::string col = std::to_string(1 + in.Below(cols));
        static constexpr std::array<const char*, 7> kMoves = {"H", "G", "d", "C", "D", "\r", "\b"};
        const std::string move = kMoves[static_cast<std::size_t>(in.Below(kMoves.size()))];
        out += move == "H"   ? Csi(row + ";" + col, 'H')
               : move == "G" ? Csi(col, 'G')
               : move == "d" ? Csi(row, 'd')
               : move == "C" ? Csi(std::to_string(in.Below(5)), 'C')
               : move == "D" ? Csi(std::to_string(in.Below(5)), 'D')
                             : move;
        break;
      }
      case 8: {
        static constexpr std::array<const char*, 9> kErases = {"\x1b[K", "\x1b[1K", "\x1b[2K",
                                                               "\x1b[J", "\x1b[4X", "\x1b[M",
                                                               "\x1b[L", "\x1b[2@", "\x1b[P"};
        out += kErases[static_cast<std::size_t>(in.Below(kErases.size()))];
        break;
      }
      case 9:
        out += "\n";
        break;
      case 10: {
        static constexpr std::array<const char*, 6> kModes = {
            "\x1b[?25l", "\x1b[?25h", "\x1b[?7h", "\x1b[?1049h", "\x1b[?1049l", "\x1b[?6h"};
        out += kModes[static_cast<std::size_t>(in.Below(kModes.size()))];
        break;
      }
      case 11: {
        static constexpr std::array<const char*, 4> kSaves = {
            "\x1b"
            "7",
            "\x1b"
            "8",
            "\x1b[s", "\x1b[u"};
        out += kSaves[static_cast<std::size_t>(in.Below(kSaves.size()))];
        break;
      }
      case 12:
        out += in.Below(2) == 0 ? "\x1b]2;\x1b[31mtitle\a" : "\x1b]4;1;rgb:ff/00/00\x1b\\";
        break;
      case 13:
        out += in.Below(2) == 0 ? "x\x1b[3b" : "\t";
        break;
      case 14:
        out += in.Below(2) == 0 ? "\x1b[!p"
                                : "\x1b"
                                  "c";
        break;
      default:
        out += "\r\n";
        break;
    }
    pieces.push_back(std::move(out));
  }
  return pieces;
}

}  // namespace TulkTest
