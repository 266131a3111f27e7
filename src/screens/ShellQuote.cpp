#include "screens/ShellQuote.h"

#include <cctype>

namespace Tulk {

std::string ShellQuote(std::string_view word) {
  bool plain = !word.empty();
  for (char c : word) {
    const bool safe = std::isalnum(static_cast<unsigned char>(c)) != 0 ||
                      std::string_view("/._-+:,@%=").find(c) != std::string_view::npos;
    plain = plain && safe;
  }
  if (plain) {
    return std::string(word);
  }
  std::string quoted = "'";
  for (char c : word) {
    if (c == '\'') {
      quoted += "'\\''";
    } else {
      quoted += c;
    }
  }
  return quoted + "'";
}

}  // namespace Tulk
