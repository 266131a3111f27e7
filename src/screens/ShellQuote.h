#pragma once
/// Quoting for the command lines the screens hand to "/bin/sh -c".

#include <string>
#include <string_view>

namespace Tulk {

/// `word` as one shell word: unchanged when it holds only letters, digits
/// and "/._-+:,@%=", otherwise in single quotes (a quote inside written as
/// '\''). So a host path under a plain root reads exactly as the path.
std::string ShellQuote(std::string_view word);

}  // namespace Tulk
