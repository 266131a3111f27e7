#pragma once
/// Which keys an input field takes: a set of printable characters and a set
/// of editing keys, as data. Keys a filter refuses never reach the field.
///
/// Editing keys:
/// - full set: Backspace (the terminal's key and Ctrl-H, code 8), Delete,
///   Left, Right, Home, End;
/// - login set: Left, Right, Home, Backspace (the terminal's key) and End
///   only, the keys the login dialog has always passed on.
///
/// The filters the screens use:
///
/// | Filter        | Characters                                 | Editing |
/// |---------------|--------------------------------------------|---------|
/// | kAnyText      | every printable byte (0x20 to 0x7E)         | full    |
/// | kLoginText    | every printable byte                        | login   |
/// | kDigits       | 0-9                                         | full    |
/// | kIpv4         | 0-9 .                                       | full    |
/// | kDnsServer    | 0-9 a-f A-F . :                             | full    |
/// | kIpv6Network  | 0-9 a-f A-F : / .                           | full    |
/// | kHostName     | letters 0-9 - .                             | full    |
/// | kSuffixes     | letters 0-9 blank . , -                     | full    |
/// | kPingAddress  | letters 0-9 . : %                           | full    |
/// | kSwitchName   | letters 0-9 - _ .                           | full    |
///
/// Letters are the ASCII letters whatever the locale.

#include <string_view>

namespace Tulk {

struct KeyFilter {
  /// Character classes a filter may take.
  enum Class : unsigned {
    kClassDigits = 1U << 0,
    kClassLetters = 1U << 1,
    kClassHexLetters = 1U << 2,
    kClassPrintable = 1U << 3,
  };
  /// Which editing keys a filter takes.
  enum class Editing { kFull, kLogin };

  /// Sum of Class bits.
  unsigned classes;
  /// Further printable characters taken.
  std::string_view punctuation;
  Editing editing;

  /// Whether the field takes `key` (a curses key code or a byte).
  bool Accepts(int key) const;
  /// Whether `key` is one of the editing keys of `editing`.
  static bool IsEditingKey(int key, Editing editing);
};

// clang-format off
inline constexpr KeyFilter kAnyText{KeyFilter::kClassPrintable, "", KeyFilter::Editing::kFull};
inline constexpr KeyFilter kLoginText{KeyFilter::kClassPrintable, "", KeyFilter::Editing::kLogin};
inline constexpr KeyFilter kDigits{KeyFilter::kClassDigits, "", KeyFilter::Editing::kFull};
inline constexpr KeyFilter kIpv4{KeyFilter::kClassDigits, ".", KeyFilter::Editing::kFull};
inline constexpr KeyFilter kDnsServer{KeyFilter::kClassDigits | KeyFilter::kClassHexLetters, ".:",
                                      KeyFilter::Editing::kFull};
inline constexpr KeyFilter kIpv6Network{KeyFilter::kClassDigits | KeyFilter::kClassHexLetters,
                                        ":/.", KeyFilter::Editing::kFull};
inline constexpr KeyFilter kHostName{KeyFilter::kClassDigits | KeyFilter::kClassLetters, "-.",
                                     KeyFilter::Editing::kFull};
inline constexpr KeyFilter kSuffixes{KeyFilter::kClassDigits | KeyFilter::kClassLetters, " .,-",
                                     KeyFilter::Editing::kFull};
/// An address to ping, IPv4 or IPv6, with an optional "%zone" (an
/// interface name).
inline constexpr KeyFilter kPingAddress{KeyFilter::kClassDigits | KeyFilter::kClassLetters, ".:%",
                                        KeyFilter::Editing::kFull};
/// A standard switch's name.
inline constexpr KeyFilter kSwitchName{KeyFilter::kClassDigits | KeyFilter::kClassLetters, "-_.",
                                       KeyFilter::Editing::kFull};
// clang-format on

}  // namespace Tulk
