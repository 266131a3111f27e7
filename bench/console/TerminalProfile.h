#pragma once
/// A terminal's own controls and what each costs in bytes, read from its
/// terminfo description. The cost model (ScreenCost.h) builds the cheapest
/// update from these controls only, as any program that drives the
/// terminal through its description must.

#include <map>
#include <string>
#include <vector>

namespace TulkBench {

struct TerminalProfile {
  std::string term;
  /// The console draws in colour here: the description can redefine its
  /// palette. Otherwise the console draws in monochrome (standout).
  bool colours = false;
  /// Erasing fills with the current background (bce); otherwise erased
  /// cells take the default background.
  bool bce = false;
  /// The string capabilities by terminfo name ("cup", "setaf", "smacs",
  /// ...), as the description holds them.
  std::map<std::string, std::string> capabilities;
  /// The description's attribute controls are ECMA-48 SGR, and its own
  /// "sgr" puts several parameters in one control: a program may then send
  /// several changes as one SGR ("\e[37;42m"), a reset as "\e[m".
  bool combinedSgr = false;
  /// The SGR parameter of each colour by number, foreground and background
  /// ("37", "38;5;123"), where combinedSgr holds.
  std::map<int, std::string> foregroundParameters, backgroundParameters;
  /// "op" is "\e[39;49m": the default colours are SGR 39 and 49.
  bool defaultColourParameters = false;
  /// The keys of the line-drawing set ("q" the horizontal line, ...).
  std::string lineSetKeys;
  /// Bytes of the set-up the console cannot do without before its first
  /// screen: the alternate screen (smcup), keypad transmit mode (smkx),
  /// the hidden cursor (civis), the line-drawing set's designation (enacs)
  /// and, in colour, the five palette entries the console redefines
  /// (initc).
  int setup = 0;

  /// The terminal has capability `name`.
  bool Has(const std::string& name) const;
  /// Bytes capability `name` sends with the given parameters (padding
  /// left out); a huge number when the terminal lacks it. A capability
  /// that is a line feed costs two bytes: the terminal line turns it into
  /// carriage return and line feed.
  int Cost(const std::string& name, int p1 = 0, int p2 = 0) const;
  /// Bytes of "sgr" setting exactly these attributes (and the line-drawing
  /// set on or off); a huge number when the terminal has no "sgr".
  int SetAttributesCost(bool underline, bool reverse, bool bold, bool lineSet) const;
  /// Bytes of one SGR with these parameters (combinedSgr).
  static int CombinedCost(const std::vector<std::string>& parameters);
};

/// Reads the profile of `term` from the terminfo database. Throws
/// std::runtime_error when the description cannot be read.
TerminalProfile ReadTerminalProfile(const std::string& term);

/// Length of a terminfo string without its padding ("$<5>").
int CapabilityLength(const char* capability);

/// A cost that stands for "cannot be done".
inline constexpr int kImpossible = 1 << 24;

}  // namespace TulkBench
