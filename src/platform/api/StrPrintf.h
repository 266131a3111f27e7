#pragma once
/// printf-style formatting into a std::string.

#include <string>

namespace HostMgr::Misc {

/// The text printf would write for `format` and the arguments, of any
/// length.
std::string StrPrintf(const char* format, ...) __attribute__((format(printf, 1, 2)));

}  // namespace HostMgr::Misc
