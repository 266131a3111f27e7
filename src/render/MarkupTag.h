#pragma once
/// The parts of a markup tag: the text between "{" and "}" split at its
/// first colon.

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

}  // namespace Tulk
