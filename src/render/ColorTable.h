#pragma once
/// The colour names markup may use ("{color:white}", "{bgcolor:yellow}")
/// and the curses colour number each stands for.
///
/// Names are matched exactly and case-sensitively; a name not in the table
/// (such as "black>") is not a colour.

#include <optional>
#include <string_view>

namespace Tulk {

class ColorTable {
 public:
  /// The colour number of `name`: "white" 7, "black" 0, "dark-grey" 6,
  /// "light-grey" 2, "yellow" 3, "red" 1; nullopt for any other name.
  std::optional<int> Find(std::string_view name) const;
};

}  // namespace Tulk
