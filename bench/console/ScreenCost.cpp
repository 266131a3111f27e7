#include "ScreenCost.h"

#include <algorithm>
#include <map>
#include <string>
#include <vector>

namespace TulkBench {
namespace {

using TulkTest::Cell;

// Markers for the terminal's default colours once reverse video has been
// resolved (a reversed default foreground shows as the background).
constexpr int kDefaultForeground = -101;
constexpr int kDefaultBackground = -102;

struct Sgr {
  int fg = -1;
  int bg = -1;
  bool bold = false;
  bool underline = false;
  bool reverse = false;
  friend bool operator==(const Sgr&, const Sgr&) = default;
};

struct Look {
  int fg = 0;
  int bg = 0;
  bool bold = false;
  bool underline = false;
  friend bool operator==(const Look&, const Look&) = default;
};

bool IsBlank(const std::string& text) {
  return text.empty() || text == " ";
}

Sgr StateOf(const Cell& cell) {
  return Sgr{cell.fg, cell.bg, cell.bold, cell.underline, cell.reverse};
}

Look LookOf(const std::string& text, const Sgr& sgr) {
  int fg = sgr.fg == -1 ? kDefaultForeground : sgr.fg;
  int bg = sgr.bg == -1 ? kDefaultBackground : sgr.bg;
  if (sgr.reverse) {
    std::swap(fg, bg);
  }
  if (IsBlank(text)) {
    return Look{0, bg, false, sgr.underline};
  }
  return Look{fg, bg, sgr.bold, sgr.underline};
}

std::u32string Decode(const std::string& text) {
  std::u32string out;
  for (std::size_t i = 0; i < text.size();) {
    unsigned char lead = static_cast<unsigned char>(text[i]);
    int length = lead < 0x80 ? 1 : lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
    char32_t code = length == 1 ? lead : lead & (0x3F >> (length - 1));
    for (std::size_t k = 1; k < static_cast<std::size_t>(length) && i + k < text.size(); ++k) {
      code = (code << 6) | (static_cast<unsigned char>(text[i + k]) & 0x3F);
    }
    out += code;
    i += static_cast<std::size_t>(length);
  }
  return out;
}

// The line-drawing set's key for a character (0 when it has none).
char LineSetKey(const std::string& text) {
  static const std::map<char32_t, char> kKeys = {
      {U'\u2500', 'q'}, {U'\u2502', 'x'}, {U'\u250C', 'l'}, {U'\u2510', 'k'}, {U'\u2514', 'm'},
      {U'\u2518', 'j'}, {U'\u251C', 't'}, {U'\u2524', 'u'}, {U'\u252C', 'w'}, {U'\u2534', 'v'},
      {U'\u253C', 'n'}, {U'\u2592', 'a'}, {U'\u25C6', '`'}, {U'\u00B0', 'f'}, {U'\u00B1', 'g'},
      {U'\u2264', 'y'}, {U'\u2265', 'z'}, {U'\u03C0', '{'}, {U'\u2260', '|'}, {U'\u00A3', '}'},
      {U'\u00B7', '~'}};
  std::u32string code = Decode(text);
  if (code.size() != 1) {
    return 0;
  }
  auto found = kKeys.find(code[0]);
  return found == kKeys.end() ? 0 : found->second;
}

struct State {
  int row = 0;
  int col = 0;
  bool positionKnown = false;
  Sgr sgr;
  bool sgrKnown = false;
  bool lineSet = false;
  int bytes = 0;
};

class Encoder {
 public:
  explicit Encoder(const TerminalProfile& profile) : p_(profile) {}

  // Attributes and colours from the state's to `to`: the cheapest of
  // switching only what changed, resetting and setting what is needed, and
  // setting all attributes at once ("sgr").
  int SgrCost(const State& state, const Sgr& to) const {
    if (state.sgrKnown && state.sgr == to) {
      return 0;
    }
    const Sgr plain;
    int reset = p_.Cost("sgr0") + (state.lineSet ? p_.Cost("smacs") : 0) + OnCost(plain, to) +
                ColourCost(plain, to);
    int all = p_.SetAttributesCost(to.underline, to.reverse, to.bold, state.lineSet) +
              ColourCost(plain, to);
    int best = std::min(reset, all);
    if (state.sgrKnown) {
      best = std::min(best,
                      OffCost(state.sgr, to) + OnCost(state.sgr, to) + ColourCost(state.sgr, to));
    }
    if (p_.combinedSgr) {
      best = std::min(best, CombinedCost(state, to));
    }
    return best;
  }

  // One SGR with every change as a parameter: from the state, when nothing
  // is switched off, or from a reset ("0") and what `to` has on top of it.
  // It leaves the line-drawing set as it is.
  int CombinedCost(const State& state, const Sgr& to) const {
    std::vector<std::string> fromReset{"0"};
    if (!Changes(Sgr{}, to, fromReset)) {
      return kImpossible;
    }
    int best = TerminalProfile::CombinedCost(fromReset);
    const Sgr& from = state.sgr;
    const bool switchesOff = (from.bold && !to.bold) || (from.reverse && !to.reverse) ||
                             (from.underline && !to.underline);
    const bool defaultsColour = (from.fg >= 0 && to.fg < 0) || (from.bg >= 0 && to.bg < 0);
    if (state.sgrKnown && !switchesOff && (!defaultsColour || p_.defaultColourParameters)) {
      std::vector<std::string> changes;
      if (Changes(from, to, changes)) {
        best = std::min(best, TerminalProfile::CombinedCost(changes));
      }
    }
    return best;
  }

  // The SGR parameters that turn `from` into `to`, nothing being switched
  // off; false for a colour the profile has no parameter for.
  bool Changes(const Sgr& from, const Sgr& to, std::vector<std::string>& parameters) const {
    if (to.bold && !from.bold) {
      parameters.push_back("1");
    }
    if (to.underline && !from.underline) {
      parameters.push_back("4");
    }
    if (to.reverse && !from.reverse) {
      parameters.push_back("7");
    }
    auto colour = [&](int wanted, int had, const std::map<int, std::string>& texts,
                      const char* byDefault) {
      if (wanted == had) {
        return true;
      }
      if (wanted < 0) {
        parameters.push_back(byDefault);
        return true;
      }
      auto found = texts.find(wanted);
      if (found == texts.end()) {
        return false;
      }
      parameters.push_back(found->second);
      return true;
    };
    return colour(to.fg, from.fg, p_.foregroundParameters, "39") &&
           colour(to.bg, from.bg, p_.backgroundParameters, "49");
  }

  int MoveCost(const State& state, int row, int col) const {
    int best = row == 0 && col == 0 && p_.Has("home") ? p_.Cost("home") : p_.Cost("cup", row, col);
    if (!state.positionKnown) {
      return best;
    }
    if (row == state.row) {
      return std::min(best, Horizontal(state.col, col));
    }
    // Down or up in the same column, then along the row; or (down) carriage
    // returns and line feeds, then along the row.
    const int rows = row - state.row;
    const bool lineFeedDown =
        p_.capabilities.count("cud1") != 0 && p_.capabilities.at("cud1") == "\n";
    int vertical = p_.Cost("vpa", row);
    if (rows > 0) {
      vertical =
          std::min(vertical, lineFeedDown ? p_.Cost("cud", rows) : Repeated("cud", "cud1", rows));
      best = std::min(best, 2 * rows + Horizontal(0, col));
    } else {
      vertical = std::min(vertical, Repeated("cuu", "cuu1", -rows));
    }
    return std::min(best, vertical + Horizontal(state.col, col));
  }

  // Writes `cell` at the cursor. `next` is the cell written after it, if
  // any: a line character goes out in the line-drawing set when that pays
  // (it is already in use, or the next one is a line character too) and as
  // UTF-8 otherwise.
  void Emit(State& state, const Cell& cell, const Cell* next) const {
    const Sgr wanted = StateOf(cell);
    if (!(IsBlank(cell.text) && state.sgrKnown &&
          LookOf(cell.text, state.sgr) == LookOf(cell.text, wanted))) {
      state.bytes += SgrCost(state, wanted);
      state.sgr = wanted;
      state.sgrKnown = true;
    }
    if (IsBlank(cell.text)) {
      state.bytes += 1;
    } else if (InLineSet(cell.text)) {
      const bool run = next != nullptr && InLineSet(next->text);
      const int utf8 = static_cast<int>(cell.text.size());
      if (state.lineSet) {
        state.bytes += 1;
      } else if (run || p_.Cost("smacs") + 1 + p_.Cost("rmacs") < utf8) {
        state.bytes += p_.Cost("smacs") + 1;
        state.lineSet = true;
      } else {
        state.bytes += utf8;
      }
    } else {
      LeaveLineSet(state);
      state.bytes += static_cast<int>(cell.text.size());
    }
    ++state.col;
  }

  void LeaveLineSet(State& state) const {
    if (state.lineSet) {
      state.bytes += p_.Cost("rmacs");
      state.lineSet = false;
    }
  }

  void MoveTo(State& state, int row, int col) const {
    state.bytes += MoveCost(state, row, col);
    state.row = row;
    state.col = col;
    state.positionKnown = true;
  }

  void SetSgr(State& state, const Sgr& wanted) const {
    state.bytes += SgrCost(state, wanted);
    state.sgr = wanted;
    state.sgrKnown = true;
  }

  // The erase colours: the current background with bce, the default one
  // otherwise.
  Sgr EraseState(const Sgr& wanted) const { return p_.bce ? wanted : Sgr{}; }

  bool CanErase(const Cell& blank) const {
    return IsBlank(blank.text) &&
           LookOf(" ", EraseState(StateOf(blank))) == LookOf(" ", StateOf(blank));
  }

  bool InLineSet(const std::string& text) const {
    char key = LineSetKey(text);
    return key != 0 && p_.lineSetKeys.find(key) != std::string::npos;
  }

  const TerminalProfile& Profile() const { return p_; }

 private:
  int Repeated(const char* many, const char* one, int count) const {
    int best = p_.Cost(many, count);
    if (count <= 8 && p_.Has(one)) {
      best = std::min(best, count * p_.Cost(one));
    }
    return best;
  }

  int Horizontal(int from, int to) const {
    if (from == to) {
      return 0;
    }
    int best = p_.Cost("hpa", to);
    best = std::min(
        best, to > from ? Repeated("cuf", "cuf1", to - from) : Repeated("cub", "cub1", from - to));
    best = std::min(best, p_.Cost("cr") + (to == 0 ? 0 : Repeated("cuf", "cuf1", to)));
    return best;
  }

  int OnCost(const Sgr& from, const Sgr& to) const {
    int cost = 0;
    if (to.bold && !from.bold) {
      cost += p_.Cost("bold");
    }
    if (to.reverse && !from.reverse) {
      cost += p_.Cost("rev");
    }
    if (to.underline && !from.underline) {
      cost += p_.Cost("smul");
    }
    return std::min(cost, kImpossible);
  }

  // Only underline has its own "off" control in terminfo; anything else
  // switched off needs a reset.
  int OffCost(const Sgr& from, const Sgr& to) const {
    if ((from.bold && !to.bold) || (from.reverse && !to.reverse)) {
      return kImpossible;
    }
    return from.underline && !to.underline ? p_.Cost("rmul") : 0;
  }

  int ColourCost(const Sgr& from, const Sgr& to) const {
    if (from.fg == to.fg && from.bg == to.bg) {
      return 0;
    }
    if (!p_.colours) {
      return kImpossible;
    }
    int cost = 0;
    Sgr now = from;
    if ((to.fg < 0 && now.fg >= 0) || (to.bg < 0 && now.bg >= 0)) {
      cost += p_.Cost("op");
      now.fg = -1;
      now.bg = -1;
    }
    if (to.fg != now.fg) {
      cost += p_.Cost("setaf", to.fg);
    }
    if (to.bg != now.bg) {
      cost += p_.Cost("setab", to.bg);
    }
    return std::min(cost, kImpossible);
  }

  const TerminalProfile& p_;
};

// Paints the cells of `row` from `from` on that differ from what `shown`
// holds; returns the state after.
State PaintRow(const Encoder& encoder, State state, const Screen& target,
               const std::vector<Cell>& shown, int row, int from) {
  const TerminalProfile& profile = encoder.Profile();
  auto changed = [&](int col) {
    return !LooksSame(shown[static_cast<std::size_t>(col)], target.At(row, col));
  };
  auto nextCell = [&](int col) -> const Cell* {
    return col + 1 < target.cols ? &target.At(row, col + 1) : nullptr;
  };
  // Gets to `to` on the row: moves there, or writes the unchanged cells in
  // between when that is cheaper.
  auto reach = [&](State at, int to) {
    if (at.positionKnown && at.row == row && at.col < to) {
      State rewrite = at;
      for (int c = at.col; c < to; ++c) {
        encoder.Emit(rewrite, target.At(row, c), nextCell(c));
      }
      encoder.MoveTo(at, row, to);
      return rewrite.bytes < at.bytes ? rewrite : at;
    }
    encoder.MoveTo(at, row, to);
    return at;
  };
  int col = from;
  while (col < target.cols && !changed(col)) {
    ++col;
  }
  while (col < target.cols) {
    state = reach(state, col);
    // A run of equal cells from here, up to the last changed one in it:
    // written one by one, repeated, or (blanks) erased.
    const Cell& first = target.At(row, col);
    int run = 1;
    for (int k = 1; col + k < target.cols && target.At(row, col + k).text == first.text &&
                    LooksSame(target.At(row, col + k), first);
         ++k) {
      if (changed(col + k)) {
        run = k + 1;
      }
    }
    int next = col + run;
    while (next < target.cols && !changed(next)) {
      ++next;
    }
    State plain = state;
    encoder.Emit(plain, first, nextCell(col));
    State repeated = plain;
    for (int k = 1; k < run; ++k) {
      encoder.Emit(plain, target.At(row, col + k), nextCell(col + k));
    }
    if (profile.Has("rep") && run > 1 && !encoder.InLineSet(first.text) && first.text.size() == 1) {
      repeated.bytes += profile.Cost("rep", first.text[0], run) - 1;  // the first is counted
      repeated.col = col + run;
      if (repeated.bytes < plain.bytes) {
        plain = repeated;
      }
    }
    if (next < target.cols) {
      plain = reach(plain, next);
    }
    if (profile.Has("ech") && encoder.CanErase(first) && run > 1) {
      State erased = state;
      const Sgr wanted = StateOf(first);
      if (!(erased.sgrKnown && LookOf(" ", erased.sgr) == LookOf(" ", wanted))) {
        encoder.SetSgr(erased, wanted);
      }
      erased.bytes += profile.Cost("ech", run);
      if (next < target.cols) {
        erased = reach(erased, next);
      }
      if (erased.bytes < plain.bytes) {
        plain = erased;
      }
    }
    state = plain;
    col = next;
  }
  return state;
}

// Paints a row, or erases its rest first when that is cheaper.
State UpdateRow(const Encoder& encoder, const State& state, const Screen& target,
                const std::vector<Cell>& shown, int row) {
  int first = 0;
  while (first < target.cols &&
         LooksSame(shown[static_cast<std::size_t>(first)], target.At(row, first))) {
    ++first;
  }
  if (first == target.cols) {
    return state;
  }
  State best = PaintRow(encoder, state, target, shown, row, first);
  if (!encoder.Profile().Has("el")) {
    return best;
  }
  // Erase to the end of the row in the colours of one of its blanks.
  std::map<std::pair<int, int>, int> blanks;  // look -> a column
  for (int col = first; col < target.cols; ++col) {
    const Cell& cell = target.At(row, col);
    if (encoder.CanErase(cell)) {
      Look look = LookOf(" ", StateOf(cell));
      blanks[{look.bg, look.underline ? 1 : 0}] = col;
    }
  }
  for (const auto& [look, column] : blanks) {
    const Cell& blank = target.At(row, column);
    State erased = state;
    encoder.MoveTo(erased, row, first);
    encoder.SetSgr(erased, encoder.EraseState(StateOf(blank)));
    erased.bytes += encoder.Profile().Cost("el");
    std::vector<Cell> cleared = shown;
    for (int col = first; col < target.cols; ++col) {
      cleared[static_cast<std::size_t>(col)] = blank;
    }
    erased = PaintRow(encoder, erased, target, cleared, row, first);
    if (erased.bytes < best.bytes) {
      best = erased;
    }
  }
  return best;
}

State PaintScreen(const Encoder& encoder, State state, const Screen& target,
                  const std::vector<Cell>& shown) {
  for (int row = 0; row < target.rows; ++row) {
    const auto start = static_cast<std::ptrdiff_t>(row) * target.cols;
    std::vector<Cell> line(shown.begin() + start, shown.begin() + start + target.cols);
    state = UpdateRow(encoder, state, target, line, row);
  }
  return state;
}

}  // namespace

Screen BlankScreen(int rows, int cols) {
  Screen screen;
  screen.rows = rows;
  screen.cols = cols;
  screen.cells.assign(static_cast<std::size_t>(rows) * static_cast<std::size_t>(cols),
                      Cell{" ", -1, -1});
  screen.cursor = TulkTest::CursorState{0, 0, true};
  return screen;
}

bool LooksSame(const Cell& a, const Cell& b) {
  if (IsBlank(a.text) != IsBlank(b.text) || (!IsBlank(a.text) && a.text != b.text)) {
    return false;
  }
  return LookOf(a.text, StateOf(a)) == LookOf(b.text, StateOf(b));
}

bool SameScreen(const Screen& a, const Screen& b) {
  if (a.rows != b.rows || a.cols != b.cols) {
    return false;
  }
  for (std::size_t i = 0; i < a.cells.size(); ++i) {
    if (!LooksSame(a.cells[i], b.cells[i])) {
      return false;
    }
  }
  if (a.cursor.visible != b.cursor.visible) {
    return false;
  }
  return !a.cursor.visible || (a.cursor.row == b.cursor.row && a.cursor.col == b.cursor.col);
}

int FewestBytes(const Screen& before, const Screen& after, const TerminalProfile& profile) {
  Encoder encoder(profile);
  // The encoder knows where it left the cursor, and it left the
  // attributes reset (as curses does after every update).
  State start;
  start.row = before.cursor.row;
  start.col = before.cursor.col;
  start.positionKnown = true;
  start.sgrKnown = true;

  State best = PaintScreen(encoder, start, after, before.cells);
  // Or clear the whole screen first, in the default colours or (bce) in
  // those of the most common blank.
  std::vector<Cell> candidates = {Cell{" ", -1, -1}};
  if (profile.bce) {
    std::map<int, std::pair<int, std::size_t>> counts;  // background -> count, a cell
    for (std::size_t i = 0; i < after.cells.size(); ++i) {
      if (IsBlank(after.cells[i].text)) {
        auto& entry = counts[LookOf(" ", StateOf(after.cells[i])).bg];
        entry.first += 1;
        entry.second = i;
      }
    }
    auto most = std::max_element(counts.begin(), counts.end(), [](const auto& a, const auto& b) {
      return a.second.first < b.second.first;
    });
    if (most != counts.end()) {
      candidates.push_back(after.cells[most->second.second]);
    }
  }
  if (profile.Has("ed")) {
    for (const Cell& blank : candidates) {
      State cleared = start;
      encoder.MoveTo(cleared, 0, 0);
      encoder.SetSgr(cleared, encoder.EraseState(StateOf(blank)));
      cleared.bytes += profile.Cost("ed");
      const Cell erased = profile.bce ? blank : Cell{" ", -1, -1};
      cleared = PaintScreen(encoder, cleared, after, std::vector<Cell>(after.cells.size(), erased));
      if (cleared.bytes < best.bytes) {
        best = cleared;
      }
    }
  }

  // The update ends with the attributes reset and the line-drawing set
  // left, so that whatever else reaches the line before the next update (a
  // kernel message on a serial console) comes out legible.
  if (!(best.sgr == Sgr{}) || best.lineSet) {
    const std::string& reset =
        profile.capabilities.count("sgr0") != 0 ? profile.capabilities.at("sgr0") : std::string();
    const bool resetLeavesSet =
        profile.Has("rmacs") && reset.find(profile.capabilities.at("rmacs")) != std::string::npos;
    State byReset = best;
    byReset.bytes += best.sgr == Sgr{} ? 0 : profile.Cost("sgr0");
    if (best.lineSet && !(resetLeavesSet && !(best.sgr == Sgr{}))) {
      encoder.LeaveLineSet(byReset);
    }
    if (profile.combinedSgr) {
      // "\e[m", and leaving the set on its own.
      State combined = best;
      combined.bytes += best.sgr == Sgr{} ? 0 : TerminalProfile::CombinedCost({"0"});
      if (best.lineSet) {
        encoder.LeaveLineSet(combined);
      }
      byReset.bytes = std::min(byReset.bytes, combined.bytes);
    }
    best.bytes = byReset.bytes;
  }
  if (after.cursor.visible) {
    best.bytes += encoder.MoveCost(best, after.cursor.row, after.cursor.col);
    if (!before.cursor.visible) {
      best.bytes += profile.Has("cnorm") ? profile.Cost("cnorm") : 0;
    }
  } else if (before.cursor.visible) {
    best.bytes += profile.Has("civis") ? profile.Cost("civis") : 0;
  }
  return best.bytes;
}

}  // namespace TulkBench
