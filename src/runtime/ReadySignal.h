#pragma once
/// Test seam: tells a test harness each time the console has finished a
/// key's work and waits for the next key.
///
/// When TULK_READY_FD names an open pipe or socket (not 0, 1 or 2) at
/// start-up, PollInput() writes one record to it just before it blocks in
/// the key read: the screen has been sent to the terminal, curses holds no
/// key, and no key, signal or other input waits on the descriptors the read
/// covers. A record is 8 bytes, the CLOCK_MONOTONIC time in nanoseconds
/// (native byte order) taken before that last check. Input written before
/// the time a record carries has been read and handled; a harness that
/// notes when it sent its last key waits for a record with a later time.
///
/// Unset, empty, not a number, a closed descriptor or one of another kind:
/// nothing is written, ever. The descriptor is made non-blocking (a harness
/// that stops reading loses records rather than freezing the console) and
/// is not passed on to the programs the console runs.

#include <poll.h>

namespace Tulk {

/// Called by the key read before it blocks on `fds`. With the seam off,
/// returns 0 at once. With it on, checks `fds` without waiting: returns
/// poll()'s positive result (revents filled in, no record written) when
/// something is pending, otherwise writes a record and returns 0.
int AnnounceReady(pollfd* fds, nfds_t count);

}  // namespace Tulk
