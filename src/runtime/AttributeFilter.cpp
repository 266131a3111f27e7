#include "runtime/AttributeFilter.h"

#include <algorithm>
#include <cstring>
#include <vector>

namespace Tulk {
namespace {

constexpr char kEscape = '\x1b';
constexpr char kShiftOut = '\x0e';
constexpr char kShiftIn = '\x0f';

// A control longer than this is not an attribute control; it goes out as it
// comes instead of being held.
constexpr std::size_t kLongestControl = 64;

bool IsIntermediate(char byte) {
  return byte >= 0x20 && byte <= 0x2f;
}

bool IsParameter(char byte) {
  return byte >= 0x30 && byte <= 0x3f;
}

// The parameters of an SGR as numbers ("" is 0). False on sub-parameters,
// private markers and absurd lengths.
bool Numbers(std::string_view text, std::vector<int>& numbers) {
  numbers.clear();
  int value = 0;
  int digits = 0;
  for (char c : text) {
    if (c == ';') {
      numbers.push_back(value);
      value = 0;
      digits = 0;
      continue;
    }
    if (c < '0' || c > '9' || ++digits > 5) {
      return false;
    }
    value = value * 10 + (c - '0');
  }
  numbers.push_back(value);
  return true;
}

constexpr unsigned Bit(int attribute) {
  return 1U << static_cast<unsigned>(attribute);
}

// An indexed ("5;n") or direct ("2;r;g;b") colour after 38 or 48, as its
// parameter text; advances `at` past it. Empty when malformed.
std::string ExtendedColour(const std::vector<int>& numbers, std::size_t& at) {
  const int base = numbers[at];
  if (at + 2 < numbers.size() && numbers[at + 1] == 5 && numbers[at + 2] <= 255) {
    std::string colour = std::to_string(base) + ";5;" + std::to_string(numbers[at + 2]);
    at += 2;
    return colour;
  }
  if (at + 4 < numbers.size() && numbers[at + 1] == 2 && numbers[at + 2] <= 255 &&
      numbers[at + 3] <= 255 && numbers[at + 4] <= 255) {
    std::string colour = std::to_string(base) + ";2;" + std::to_string(numbers[at + 2]) + ";" +
                         std::to_string(numbers[at + 3]) + ";" + std::to_string(numbers[at + 4]);
    at += 4;
    return colour;
  }
  return {};
}

// Applies an SGR's parameters to `rendition`; false when one of them is
// not understood (the rendition is then of no use).
bool Apply(std::string_view parameters, AttributeFilter::Rendition& rendition) {
  std::vector<int> numbers;
  if (!Numbers(parameters, numbers)) {
    return false;
  }
  for (std::size_t at = 0; at < numbers.size(); ++at) {
    const int p = numbers[at];
    if (p == 0) {
      rendition = AttributeFilter::Rendition{};
      rendition.known = true;
    } else if (p <= 9) {
      rendition.attributes |= Bit(p);
    } else if (p <= 19) {
      rendition.font = std::to_string(p);
    } else if (p == 22) {
      rendition.attributes &= ~(Bit(1) | Bit(2));
    } else if (p == 25) {
      rendition.attributes &= ~(Bit(5) | Bit(6));
    } else if (p == 23 || p == 24 || (p >= 27 && p <= 29)) {
      rendition.attributes &= ~Bit(p - 20);
    } else if ((p >= 30 && p <= 37) || (p >= 90 && p <= 97)) {
      rendition.foreground = std::to_string(p);
    } else if ((p >= 40 && p <= 47) || (p >= 100 && p <= 107)) {
      rendition.background = std::to_string(p);
    } else if (p == 39) {
      rendition.foreground.clear();
    } else if (p == 49) {
      rendition.background.clear();
    } else if (p == 38 || p == 48) {
      std::string colour = ExtendedColour(numbers, at);
      if (colour.empty()) {
        return false;
      }
      (p == 38 ? rendition.foreground : rendition.background) = colour;
    } else {
      return false;
    }
  }
  return true;
}

// SGR controls with `parts` as their parameters, in order; a lone reset as
// "CSI m". A terminal keeps 16 numbers of a control, so more go out as
// several controls.
std::string SgrControl(const std::vector<std::string>& parts) {
  constexpr std::size_t kMostNumbers = 16;
  if (parts.size() == 1 && parts[0] == "0") {
    return "\x1b[m";
  }
  std::string controls;
  std::size_t numbers = kMostNumbers;
  for (const std::string& part : parts) {
    const std::size_t count =
        1 + static_cast<std::size_t>(std::count(part.begin(), part.end(), ';'));
    if (numbers + count > kMostNumbers) {
      controls += controls.empty() ? "\x1b[" : "m\x1b[";
      numbers = 0;
    } else {
      controls += ';';
    }
    controls += part;
    numbers += count;
  }
  return controls + "m";
}

// The primary font (SGR 10). A rendition's font is empty after a reset,
// which leaves the font as it was on some terminals (the Linux console,
// where 10 to 12 choose the character mapping) and makes it the primary one
// on others.
constexpr const char* kPrimaryFont = "10";

// `controls` without terminfo padding ("$<5>", "$<2/*>").
std::string WithoutPadding(std::string_view controls) {
  std::string text;
  for (std::size_t at = 0; at < controls.size(); ++at) {
    if (controls.compare(at, 2, "$<") == 0) {
      const std::size_t end = controls.find('>', at);
      if (end != std::string_view::npos) {
        at = end;
        continue;
      }
    }
    text += controls[at];
  }
  return text;
}

}  // namespace

AttributeFilter::AttributeFilter(bool defaultColours) : defaultColours_(defaultColours) {
}

std::string AttributeFilter::Filter(std::string_view update) {
  out_.clear();
  out_.reserve(update.size());
  for (char byte : update) {
    Byte(byte);
  }
  Send();
  if (!sequence_.empty()) {
    // Cut off: what came goes out now, the rest as it comes.
    out_ += sequence_;
    sequence_.clear();
    passing_ = true;
  }
  std::string out;
  out.swap(out_);
  return out;
}

void AttributeFilter::Forget() {
  MakeUnknown();
}

bool AttributeFilter::Understands(std::string_view controls) {
  AttributeFilter filter(true);
  (void)filter.Filter(WithoutPadding(controls));
  return !filter.unknownControl_ && !filter.passing_ && filter.parse_ == Parse::kGround;
}

bool AttributeFilter::SetsDefaultColours(std::string_view controls) {
  const std::string text = WithoutPadding(controls);
  if (text.size() < 3 || text.compare(0, 2, "\x1b[") != 0 || text.back() != 'm') {
    return false;
  }
  std::vector<int> numbers;
  if (!Numbers(std::string_view(text).substr(2, text.size() - 3), numbers)) {
    return false;
  }
  return numbers == std::vector<int>{39, 49} || numbers == std::vector<int>{49, 39};
}

void AttributeFilter::Byte(char byte) {
  switch (parse_) {
    case Parse::kGround:
      if (byte == kEscape) {
        sequence_.assign(1, byte);
        parse_ = Parse::kEscape;
      } else if (byte == kShiftOut || byte == kShiftIn) {
        wantedCharset_.shifted = byte == kShiftOut ? 1 : 0;
        pending_ = true;
      } else if (byte == '\0' || byte == '\r' || byte == '\b') {
        // Padding and moves: the attributes do not matter to them.
        unknownControl_ = true;
        out_ += byte;
      } else {
        unknownControl_ = true;
        Send();
        out_ += byte;
      }
      return;
    case Parse::kString:
      // A control string (OSC, DCS, ...) goes out as it comes; it ends
      // with BEL or ST, and CAN or SUB cancel it.
      out_ += byte;
      if (byte == '\a' || byte == '\x18' || byte == '\x1a') {
        parse_ = Parse::kGround;
      } else if (byte == kEscape) {
        parse_ = Parse::kStringEscape;
      }
      return;
    case Parse::kStringEscape:
      if (byte == '\\') {
        out_ += byte;
        parse_ = Parse::kGround;
        return;
      }
      // The escape ended the string and starts a control of its own, whose
      // first byte has gone out.
      sequence_.clear();
      parse_ = Parse::kEscape;
      passing_ = true;
      InControl(byte);
      return;
    default:
      InControl(byte);
  }
}

void AttributeFilter::InControl(char byte) {
  bool ends = false;
  bool string = false;
  bool valid = true;
  Parse next = parse_;
  if (parse_ == Parse::kEscape) {
    if (byte == '[') {
      next = Parse::kCsi;
    } else if (byte == ']' || byte == 'P' || byte == '_' || byte == '^' || byte == 'X') {
      string = true;
    } else if (IsIntermediate(byte)) {
      next = Parse::kIntermediate;
    } else {
      ends = byte >= 0x30 && byte <= 0x7e;
      valid = ends;
    }
  } else if (parse_ == Parse::kIntermediate) {
    ends = byte >= 0x30 && byte <= 0x7e;
    valid = ends || IsIntermediate(byte);
  } else {
    ends = byte >= 0x40 && byte <= 0x7e;
    valid = ends || IsParameter(byte) || IsIntermediate(byte);
  }

  if (!valid) {
    // Cut short by another byte: what came goes out as it came.
    unknownControl_ = true;
    if (!passing_) {
      Send();
      out_ += sequence_;
    }
    MakeUnknown();
    passing_ = false;
    sequence_.clear();
    parse_ = Parse::kGround;
    Byte(byte);
    return;
  }
  if (passing_) {
    out_ += byte;
    if (ends || string) {
      MakeUnknown();
      passing_ = false;
      parse_ = string ? Parse::kString : Parse::kGround;
    } else {
      parse_ = next;
    }
    return;
  }
  sequence_ += byte;
  if (ends) {
    Finish();
    sequence_.clear();
    parse_ = Parse::kGround;
  } else if (string) {
    PassDependent();
    sequence_.clear();
    parse_ = Parse::kString;
  } else if (sequence_.size() > kLongestControl) {
    PassDependent();
    sequence_.clear();
    passing_ = true;
    parse_ = next;
  } else {
    parse_ = next;
  }
}

void AttributeFilter::Finish() {
  const char final = sequence_.back();
  if (sequence_[1] != '[') {
    if (sequence_.size() == 3 && sequence_[1] == '(') {
      wantedCharset_.g0 = final;
      pending_ = true;
    } else if (sequence_.size() == 2 && (final == '=' || final == '>')) {
      Pass();  // keypad modes
    } else {
      PassDependent();
      // Restore cursor, full reset, locking shifts, another kind of G0
      // designation: the state is no longer known.
      if ((sequence_.size() == 2 && std::strchr("8cno|}~", final) != nullptr) ||
          sequence_[1] == '(') {
        MakeUnknown();
      }
    }
    return;
  }
  const std::string_view body = std::string_view(sequence_).substr(2, sequence_.size() - 3);
  const char first = body.empty() ? '\0' : body.front();
  const bool marked = first == '<' || first == '=' || first == '>' || first == '?';
  const bool intermediates =
      std::any_of(body.begin(), body.end(), [](char byte) { return IsIntermediate(byte); });
  if (!marked && !intermediates) {
    if (final == 'm') {
      Sgr(body);
      return;
    }
    if (std::strchr("ABCDEFGHdf", final) != nullptr) {
      Pass();  // cursor moves
      return;
    }
  }
  if (first == '?' && !intermediates && (final == 'h' || final == 'l')) {
    std::vector<int> modes;
    const bool read = Numbers(body.substr(1), modes);
    if (read && std::all_of(modes.begin(), modes.end(), [](int mode) {
          return mode == 1 || mode == 7 || mode == 12 || mode == 25 || mode == 2004 ||
                 (mode >= 1000 && mode <= 1006);
        })) {
      Pass();  // cursor keys, wrap, cursor blinking and visibility, mouse
      return;
    }
    PassDependent();
    // The alternate screen saves and restores the state.
    if (!read || std::any_of(modes.begin(), modes.end(),
                             [](int mode) { return mode >= 1047 && mode <= 1049; })) {
      MakeUnknown();
    }
    return;
  }
  PassDependent();
  if ((final == 'u' && !marked && !intermediates) || (final == 'p' && body == "!")) {
    MakeUnknown();  // restore cursor, soft reset
  }
}

void AttributeFilter::Sgr(std::string_view parameters) {
  Rendition wanted = wanted_;
  if (!Apply(parameters, wanted)) {
    PassDependent();
    MakeUnknown();
    return;
  }
  if (!wanted.known) {
    // Nothing to compare with: it goes out as it came.
    Send();
    out_ += sequence_;
    return;
  }
  wanted_ = wanted;
  pending_ = true;
}

void AttributeFilter::Send() {
  if (!pending_) {
    return;
  }
  pending_ = false;
  if (wantedCharset_.g0 != 0 && wantedCharset_.g0 != sentCharset_.g0) {
    out_ += "\x1b(";
    out_ += wantedCharset_.g0;
    sentCharset_.g0 = wantedCharset_.g0;
  }
  if (wantedCharset_.shifted >= 0 && wantedCharset_.shifted != sentCharset_.shifted) {
    out_ += wantedCharset_.shifted == 1 ? kShiftOut : kShiftIn;
    sentCharset_.shifted = wantedCharset_.shifted;
  }
  if (wanted_.known && !Satisfied()) {
    out_ += Change();
    // The primary font stays through a reset on every terminal.
    const bool primary = sent_.known && sent_.font == kPrimaryFont;
    sent_ = wanted_;
    if (primary && sent_.font.empty()) {
      sent_.font = kPrimaryFont;
    }
  }
}

bool AttributeFilter::Satisfied() const {
  // A reset in the stream leaves the primary font as it is everywhere.
  const bool font =
      sent_.font == wanted_.font || (wanted_.font.empty() && sent_.font == kPrimaryFont);
  return sent_.known && font && sent_.attributes == wanted_.attributes &&
         sent_.foreground == wanted_.foreground && sent_.background == wanted_.background;
}

std::string AttributeFilter::Change() const {
  std::vector<std::string> full{"0"};
  for (int attribute = 1; attribute <= 9; ++attribute) {
    if ((wanted_.attributes & Bit(attribute)) != 0) {
      full.push_back(std::to_string(attribute));
    }
  }
  for (const std::string* part : {&wanted_.font, &wanted_.foreground, &wanted_.background}) {
    if (!part->empty()) {
      full.push_back(*part);
    }
  }
  std::string best = SgrControl(full);
  // Switching an attribute off, or the font back to what a reset leaves,
  // takes a reset.
  const bool fontByReset =
      wanted_.font.empty() && !sent_.font.empty() && sent_.font != kPrimaryFont;
  if (!sent_.known || (sent_.attributes & ~wanted_.attributes) != 0 || fontByReset) {
    return best;
  }
  const bool dropsColour = (!sent_.foreground.empty() && wanted_.foreground.empty()) ||
                           (!sent_.background.empty() && wanted_.background.empty());
  if (dropsColour && !defaultColours_) {
    return best;
  }
  std::vector<std::string> step;
  for (int attribute = 1; attribute <= 9; ++attribute) {
    if ((wanted_.attributes & ~sent_.attributes & Bit(attribute)) != 0) {
      step.push_back(std::to_string(attribute));
    }
  }
  if (!wanted_.font.empty() && sent_.font != wanted_.font) {
    step.push_back(wanted_.font);
  }
  if (sent_.foreground != wanted_.foreground) {
    step.push_back(wanted_.foreground.empty() ? "39" : wanted_.foreground);
  }
  if (sent_.background != wanted_.background) {
    step.push_back(wanted_.background.empty() ? "49" : wanted_.background);
  }
  std::string stepControl = SgrControl(step);
  return stepControl.size() < best.size() ? stepControl : best;
}

void AttributeFilter::Pass() {
  unknownControl_ = true;
  out_ += sequence_;
}

void AttributeFilter::PassDependent() {
  Send();
  Pass();
}

void AttributeFilter::MakeUnknown() {
  sent_ = wanted_ = Rendition{};
  sentCharset_ = wantedCharset_ = Charset{};
  pending_ = false;
}

}  // namespace Tulk
