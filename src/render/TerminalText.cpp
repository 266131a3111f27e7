#include "render/TerminalText.h"

#include <cstdint>

namespace Tulk {
namespace {

enum class Kind { kKeep, kBlank, kDrop };

bool IsBidiControl(std::uint32_t code) {
  return code == 0x061C || code == 0x200E || code == 0x200F || (code >= 0x202A && code <= 0x202E) ||
         (code >= 0x2066 && code <= 0x2069);
}

// Decodes the UTF-8 sequence at `text[at]`: its length in bytes (1 for an
// invalid byte) and what becomes of it.
Kind Classify(std::string_view text, std::size_t at, std::size_t& length) {
  const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[at + i]); };
  const unsigned char lead = byte(0);
  length = 1;
  if (lead < 0x80) {
    return (lead < 0x20 || lead == 0x7F) ? Kind::kBlank : Kind::kKeep;
  }
  std::size_t count = 0;
  std::uint32_t code = 0;
  std::uint32_t least = 0;
  if (lead >= 0xC2 && lead <= 0xDF) {
    count = 2;
    code = lead & 0x1Fu;
    least = 0x80;
  } else if (lead >= 0xE0 && lead <= 0xEF) {
    count = 3;
    code = lead & 0x0Fu;
    least = 0x800;
  } else if (lead >= 0xF0 && lead <= 0xF4) {
    count = 4;
    code = lead & 0x07u;
    least = 0x10000;
  } else {
    return Kind::kBlank;
  }
  if (at + count > text.size()) {
    return Kind::kBlank;
  }
  for (std::size_t i = 1; i < count; ++i) {
    if ((byte(i) & 0xC0u) != 0x80u) {
      return Kind::kBlank;
    }
    code = (code << 6) | (byte(i) & 0x3Fu);
  }
  if (code < least || code > 0x10FFFF || (code >= 0xD800 && code <= 0xDFFF)) {
    return Kind::kBlank;
  }
  length = count;
  if (code <= 0x9F) {
    return Kind::kBlank;  // C1 controls
  }
  return IsBidiControl(code) ? Kind::kDrop : Kind::kKeep;
}

}  // namespace

bool IsTerminalSafe(std::string_view text) {
  for (std::size_t at = 0, length = 0; at < text.size(); at += length) {
    if (Classify(text, at, length) != Kind::kKeep) {
      return false;
    }
  }
  return true;
}

std::string TerminalSafe(std::string_view text) {
  std::string safe;
  safe.reserve(text.size());
  for (std::size_t at = 0, length = 0; at < text.size(); at += length) {
    switch (Classify(text, at, length)) {
      case Kind::kKeep:
        safe.append(text.substr(at, length));
        break;
      case Kind::kBlank:
        safe += ' ';
        break;
      case Kind::kDrop:
        break;
    }
  }
  return safe;
}

}  // namespace Tulk
