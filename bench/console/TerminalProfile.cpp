#include "TerminalProfile.h"

#include <curses.h>
#include <term.h>

#include <cstring>
#include <stdexcept>

namespace TulkBench {
namespace {

const char* String(const char* name) {
  char* value = tigetstr(name);
  // terminfo marks a name that is not a string capability with (char*) -1.
  const auto notString = reinterpret_cast<char*>(-1);  // NOLINT(performance-no-int-to-ptr)
  return value == notString ? nullptr : value;
}

// The capabilities the cost model uses.
constexpr const char* kNames[] = {
    "cup",   "home",  "hpa",   "vpa",  "cuf",   "cuf1",  "cub",   "cub1", "cud",   "cud1",
    "cuu",   "cuu1",  "cr",    "ech",  "el",    "ed",    "rep",   "sgr",  "sgr0",  "bold",
    "rev",   "smul",  "rmul",  "smso", "rmso",  "setaf", "setab", "op",   "smacs", "rmacs",
    "cnorm", "civis", "smcup", "smkx", "enacs", "initc", "clear"};

// The palette entries the console redefines (colour number, red, green and
// blue in thousandths), as its start-up sets them.
struct PaletteEntry {
  int colour, red, green, blue;
};
constexpr PaletteEntry kPalette[] = {{3, 1000, 800, 0},
                                     {6, 334, 334, 334},
                                     {2, 667, 667, 667},
                                     {7, 1000, 1000, 1000},
                                     {1, 1000, 0, 0}};

}  // namespace

int CapabilityLength(const char* capability) {
  if (capability == nullptr) {
    return 0;
  }
  int length = 0;
  for (const char* at = capability; *at != '\0'; ++at) {
    if (at[0] == '$' && at[1] == '<') {
      const char* end = std::strchr(at, '>');
      if (end != nullptr) {
        at = end;
        continue;
      }
    }
    ++length;
  }
  return length;
}

bool TerminalProfile::Has(const std::string& name) const {
  auto found = capabilities.find(name);
  return found != capabilities.end() && !found->second.empty();
}

int TerminalProfile::Cost(const std::string& name, int p1, int p2) const {
  auto found = capabilities.find(name);
  if (found == capabilities.end() || found->second.empty()) {
    return kImpossible;
  }
  const std::string& text = found->second;
  if (text == "\n") {
    return 2;
  }
  if (text.find('%') == std::string::npos) {
    return CapabilityLength(text.c_str());
  }
  return CapabilityLength(tiparm(text.c_str(), p1, p2, 0, 0, 0, 0, 0, 0, 0));
}

int TerminalProfile::SetAttributesCost(bool underline, bool reverse, bool bold,
                                       bool lineSet) const {
  auto found = capabilities.find("sgr");
  if (found == capabilities.end() || found->second.empty()) {
    return kImpossible;
  }
  return CapabilityLength(tiparm(found->second.c_str(), 0, underline ? 1 : 0, reverse ? 1 : 0, 0, 0,
                                 bold ? 1 : 0, 0, 0, lineSet ? 1 : 0));
}

int TerminalProfile::CombinedCost(const std::vector<std::string>& parameters) {
  int cost = 3;  // CSI and the final "m"; a lone reset is "CSI m"
  if (parameters.size() == 1 && parameters[0] == "0") {
    return cost;
  }
  for (std::size_t i = 0; i < parameters.size(); ++i) {
    cost += static_cast<int>(parameters[i].size()) + (i == 0 ? 0 : 1);
  }
  return cost;
}

namespace {

// The parameters of `control` when it is one SGR ("\e[...m"); otherwise
// empty.
std::string SgrParameters(const char* control) {
  const std::string text = control != nullptr ? control : "";
  if (text.size() < 4 || text.compare(0, 2, "\x1b[") != 0 || text.back() != 'm' ||
      text.find_first_not_of("0123456789;", 2) != text.size() - 1) {
    return {};
  }
  return text.substr(2, text.size() - 3);
}

// The description's "sgr" with bold and reverse on holds one SGR with both
// (next to other controls, such as a shift into the line-drawing set).
bool SgrCombines(const std::string& sgr) {
  const std::string text = tiparm(sgr.c_str(), 0, 0, 1, 0, 0, 1, 0, 0, 0);
  const std::size_t start = text.find("\x1b[");
  const std::size_t end = start == std::string::npos ? start : text.find('m', start);
  if (end == std::string::npos) {
    return false;
  }
  const std::string parameters = SgrParameters(text.substr(start, end + 1 - start).c_str());
  return parameters.find(';') != std::string::npos;
}

}  // namespace

TerminalProfile ReadTerminalProfile(const std::string& term) {
  TERMINAL* previous = cur_term;
  int error = 0;
  if (setupterm(term.c_str(), -1, &error) != OK) {
    set_curterm(previous);
    throw std::runtime_error("no terminfo description for " + term);
  }
  TerminalProfile profile;
  profile.term = term;
  for (const char* name : kNames) {
    if (const char* value = String(name); value != nullptr) {
      profile.capabilities[name] = value;
    }
  }
  profile.colours = tigetflag("ccc") > 0 && profile.Has("initc");
  profile.bce = tigetflag("bce") > 0;
  if (const char* acsc = String("acsc"); acsc != nullptr && profile.Has("smacs")) {
    for (std::size_t i = 0; acsc[i] != '\0' && acsc[i + 1] != '\0'; i += 2) {
      profile.lineSetKeys += acsc[i];
    }
  }
  for (const char* name : {"smcup", "smkx", "civis", "enacs"}) {
    if (profile.Has(name)) {
      profile.setup += profile.Cost(name);
    }
  }
  if (profile.colours) {
    const std::string& initc = profile.capabilities["initc"];
    for (const PaletteEntry& entry : kPalette) {
      profile.setup += CapabilityLength(
          tiparm(initc.c_str(), entry.colour, entry.red, entry.green, entry.blue, 0, 0, 0, 0, 0));
    }
  }
  if (profile.Has("sgr") && SgrCombines(profile.capabilities["sgr"])) {
    profile.combinedSgr = true;
    for (int colour = 0; profile.colours && colour < 256 && profile.combinedSgr; ++colour) {
      std::string foreground = SgrParameters(tiparm(profile.capabilities["setaf"].c_str(), colour));
      std::string background = SgrParameters(tiparm(profile.capabilities["setab"].c_str(), colour));
      profile.combinedSgr = !foreground.empty() && !background.empty();
      profile.foregroundParameters[colour] = foreground;
      profile.backgroundParameters[colour] = background;
    }
    profile.defaultColourParameters = profile.capabilities["op"] == "\x1b[39;49m";
  }
  TERMINAL* read = cur_term;
  set_curterm(previous);
  del_curterm(read);
  return profile;
}

}  // namespace TulkBench
