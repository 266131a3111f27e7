#pragma once
/// The single-instance pid file "/var/run/tulk.pid" (under the host root).

namespace Tulk {

/// Leaves the file alone (and logs "Attempt to run multiple TULK
/// instances, not updating %s") when it names a live process; otherwise
/// (re)writes it with this process's id, in decimal without a newline.
/// Never stops the start-up, and the file is not removed at exit.
///
/// Decisions of this implementation:
/// - Only a regular file is read, opened without following a symbolic
///   link and without blocking (a FIFO in its place cannot hang the
///   start-up). Its text must be a decimal process id from 1 to the
///   largest pid_t, optionally followed by white space; anything else
///   ("4294967295", a 20-digit number, "12abc") names no process, so it
///   cannot stand for a live instance forever. Neither does this process's
///   own id (left by an earlier run whose id came round again). A process
///   that exists but may not be signalled (EPERM) counts as live.
/// - The new file is written beside the old one under a temporary name and
///   renamed over it: a symbolic link in its place is replaced, never
///   followed (its target is not touched), and a reader never sees a
///   half-written id.
void WritePidFile();

/// The process id that `text` names, or 0 when it names none (see
/// WritePidFile()).
long ParsePid(const char* text);

}  // namespace Tulk
