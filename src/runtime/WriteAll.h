#pragma once
/// Writing every byte to a descriptor.

#include <string_view>

namespace Tulk {

/// Writes all of `bytes` to `fd`: again after an interruption or a short
/// write, after waiting for room on a non-blocking descriptor. False when
/// the descriptor fails (a hung-up terminal, a full disk).
bool WriteAll(int fd, std::string_view bytes);

}  // namespace Tulk
