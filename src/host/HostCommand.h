#pragma once
/// Running one of the host's own programs through the host-control
/// library's execution call (HykCtl_Exec), for work done on a worker
/// thread while the screen goes on reading keys.

#include <string>

namespace Tulk {

/// Runs `commandLine` (program and arguments separated by single blanks, no
/// shell) and waits for it. An absolute program path is taken under the
/// host root (HostPath()); its output is discarded. Returns the exit status
/// (0 to 255), or -1 when the program ended by a signal or could not be
/// started; the latter logs the library's message ("Cannot run %s: %s") at
/// error level. Safe to call from any thread; never throws.
int RunHostCommandLine(const std::string& commandLine) noexcept;

}  // namespace Tulk
