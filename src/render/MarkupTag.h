#pragma once
/// The parts of a markup tag (the text between "{" and "}" split at its
/// first colon), and the walk over marked-up text that both the layout and
/// the paint pass use, so that they always agree on what is a tag.

#include <cstddef>
#include <string_view>

namespace Tulk {

struct MarkupTag {
  /// The text before the first colon (the whole text when there is none).
  std::string_view name;
  /// The text after the first colon (the whole text when there is none, so
  /// a tag without a colon matches no tag that takes a value).
  std::string_view value;
  /// The tag text had a colon.
  bool hasValue = false;

  /// Splits a tag text at its first colon.
  static MarkupTag Split(std::string_view text) {
    std::string_view::size_type colon = text.find(':');
    if (colon == std::string_view::npos) {
      return MarkupTag{text, text, false};
    }
    return MarkupTag{text.substr(0, colon), text.substr(colon + 1), true};
  }
};

/// Walks marked-up text: `onTag` gets the text of every "{...}", `onText`
/// every other character. An unclosed "{" ends the text (the rest is never
/// shown). `onText` returns false to stop the walk; the result is false
/// when it was stopped that way.
template <typename OnTag, typename OnText>
bool ScanMarkup(std::string_view text, OnTag&& onTag, OnText&& onText) {
  std::size_t i = 0;
  while (i < text.size()) {
    if (text[i] == '{') {
      std::size_t close = text.find('}', i + 1);
      if (close == std::string_view::npos) {
        break;
      }
      onTag(text.substr(i + 1, close - i - 1));
      i = close + 1;
      continue;
    }
    if (!onText(text[i])) {
      return false;
    }
    ++i;
  }
  return true;
}

}  // namespace Tulk
