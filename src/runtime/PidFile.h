#pragma once
/// The single-instance pid file "/var/run/tulk.pid" (under the host root).

namespace Tulk {

/// Leaves the file alone (and logs "Attempt to run multiple TULK
/// instances, not updating %s") when it names a live process; otherwise
/// (re)writes it with this process's id, in decimal without a newline.
/// Never stops the start-up, and the file is not removed at exit.
void WritePidFile();

}  // namespace Tulk
