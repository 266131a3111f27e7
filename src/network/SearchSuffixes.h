#pragma once
/// Search suffixes as the operator types them: names separated by blanks
/// or commas, in any mix ("lab.example.net, example.net  corp.net").

#include <string>
#include <string_view>
#include <vector>

namespace Tulk {

/// The names of `text` in order: split at white space and commas, empty
/// pieces dropped.
std::vector<std::string> SplitSuffixes(std::string_view text);

/// The names joined with ", " (how the window shows them).
std::string JoinSuffixes(const std::vector<std::string>& names);

}  // namespace Tulk
