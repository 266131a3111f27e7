#pragma once
/// Drops the attribute controls that change nothing from the bytes curses
/// sends to the terminal.
///
/// Curses spells a terminal's attribute controls as its description does,
/// and two of its habits cost bytes on every colour terminal: a colour
/// change sends the foreground and the background although only one of
/// them changed, and entering or leaving the line-drawing set goes through
/// the description's combined attribute control ("sgr"), which resets the
/// colours, so that both go out again. On the menu that is about a third
/// of what the console sends.
///
/// The filter reads the control functions of an update: SGR (CSI ... m),
/// the designation of G0 (ESC ( F), shift out and shift in. It keeps two
/// states, the one the terminal is in (what has been sent) and the one the
/// stream asks for. An attribute control only changes the wanted state;
/// just before anything whose effect depends on it (a character, an erase,
/// a line feed, a control the filter does not know), the differences are
/// sent: the character set, then one SGR with each changed colour or
/// attribute once, or a reset and what the wanted state has on top of it,
/// whichever is shorter. Cursor moves, carriage return, backspace, cursor
/// visibility and padding do not depend on it, so a change that is undone
/// across a move costs nothing. At the end of every update the differences
/// are sent too: the terminal is left exactly as curses meant it
/// (attributes reset, line-drawing set left), for whatever else reaches a
/// serial line between two updates.
///
/// The filter sends only parameters the stream itself used (a colour as
/// curses wrote it: "37", "38;5;123"), "0" for a reset, and "39"/"49" for
/// a default colour where the description's own "op" uses them; several of
/// them go in one SGR, as the description's "sgr" puts them.
///
/// What it does not understand it passes on as it came: an SGR with a
/// parameter it does not know, or with sub-parameters, makes the state
/// unknown, and so does a control that can bring back saved attributes or
/// change the character set by other means (ESC 8, ESC c, CSI u, CSI ! p,
/// the alternate screen's 1047/1048/1049, locking shifts). Control strings
/// (OSC, DCS, ...) go out as they come. Bytes from 0x80 up are taken for
/// UTF-8 text: the console always writes UTF-8, so a lone C1 control never
/// reaches the filter.
/// While the state is unknown every attribute control goes out as it came,
/// until a reset makes the state known again. The state starts unknown,
/// and Forget() makes it unknown after something else wrote to the
/// terminal.

#include <string>
#include <string_view>

namespace Tulk {

class AttributeFilter {
 public:
  /// `defaultColours`: the terminal takes SGR 39 and 49 (the default
  /// foreground and background).
  explicit AttributeFilter(bool defaultColours);

  /// The bytes to send for one update's bytes, `update`. A control that is
  /// cut off at the end is sent as far as it goes, and the rest of it at
  /// the start of the next update.
  std::string Filter(std::string_view update);

  /// Something else wrote to the terminal: its state is no longer known.
  void Forget();

  /// `controls` consists only of attribute controls the filter reads
  /// (SGR with known parameters, G0 designation, shift out and in) and
  /// padding ("$<5>"). Used to decide whether a terminal's description
  /// suits the filter.
  static bool Understands(std::string_view controls);

  /// `controls` is one SGR that sets exactly the default foreground and
  /// background with 39 and 49 (the description's "op").
  static bool SetsDefaultColours(std::string_view controls);

  /// The terminal's state as the filter sees it.
  struct Rendition {
    bool known = false;
    unsigned attributes = 0;  // bit n: SGR n is on (1 to 9)
    std::string font;         // "10" to "19"; "" as a reset leaves it
    std::string foreground;   // "" for the default colour
    std::string background;
    bool operator==(const Rendition&) const = default;
  };
  struct Charset {
    char g0 = 0;       // final byte of the G0 designation, 0 unknown
    int shifted = -1;  // 1 after shift out, 0 after shift in, -1 unknown
    bool operator==(const Charset&) const = default;
  };

 private:
  enum class Parse { kGround, kEscape, kIntermediate, kCsi, kString, kStringEscape };

  void Byte(char byte);
  void InControl(char byte);
  void Finish();
  void Sgr(std::string_view parameters);
  void Send();
  bool Satisfied() const;
  std::string Change() const;
  void Pass();
  void PassDependent();
  void MakeUnknown();

  bool defaultColours_;
  Parse parse_ = Parse::kGround;
  std::string sequence_;         // the control being read
  bool passing_ = false;         // it is going out as it comes
  bool pending_ = false;         // the wanted state may differ from the sent one
  bool unknownControl_ = false;  // a control other than an attribute control
  Rendition sent_, wanted_;
  Charset sentCharset_, wantedCharset_;
  std::string out_;
};

}  // namespace Tulk
