#include "KeyNames.h"

#include <cstdio>
#include <map>
#include <stdexcept>

namespace TulkTest {

std::string KeyBytes(std::string_view name) {
  static const std::map<std::string, std::string, std::less<>> kKeys = {
      {"F1", "\x1bOP"},      {"F2", "\x1bOQ"},      {"F3", "\x1bOR"},      {"F4", "\x1bOS"},
      {"F5", "\x1b[15~"},    {"F6", "\x1b[17~"},    {"F7", "\x1b[18~"},    {"F8", "\x1b[19~"},
      {"F9", "\x1b[20~"},    {"F10", "\x1b[21~"},   {"F11", "\x1b[23~"},   {"F12", "\x1b[24~"},
      {"Up", "\x1bOA"},      {"Down", "\x1bOB"},    {"Right", "\x1bOC"},   {"Left", "\x1bOD"},
      {"Home", "\x1bOH"},    {"End", "\x1bOF"},     {"PageUp", "\x1b[5~"}, {"PageDown", "\x1b[6~"},
      {"Insert", "\x1b[2~"}, {"Delete", "\x1b[3~"}, {"Enter", "\r"},       {"Esc", "\x1b"},
      {"Tab", "\t"},         {"Backspace", "\x7f"}, {"Space", " "},
  };
  auto found = kKeys.find(name);
  if (found == kKeys.end()) {
    throw std::invalid_argument("unknown key name: " + std::string(name));
  }
  return found->second;
}

std::string VisibleBytes(std::string_view bytes) {
  std::string text;
  for (char c : bytes) {
    const auto byte = static_cast<unsigned char>(c);
    if (byte >= 0x20 && byte < 0x7f) {
      text += c;
    } else {
      char hex[8];
      (void)std::snprintf(hex, sizeof hex, "\\x%02x", byte);
      text += hex;
    }
  }
  return text;
}

}  // namespace TulkTest
