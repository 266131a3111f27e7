#pragma once
/// The host's observation-event facility.
///
/// A message starts with the marker "@&!*@*@(", the event id and ")",
/// followed by the English text, which may hold "%s" placeholders:
/// "@&!*@*@(qob.user.tulk.network.restart)Restarting %s". The facility
/// fills the placeholders with the arguments, in order.

extern "C" {

/// Opens the facility. Returns 0 on success or a non-zero error code.
int QobUserLib_Init(void);

/// Posts one event: `message` as above, `arguments` the `count` texts for
/// its placeholders (may be null when `count` is 0). Returns 0 on success;
/// 1 when the facility is not open, 2 when the message lacks the marker
/// and id, 3 when it cannot be delivered.
int QobUserLib_AddQob(const char* message, const char* const* arguments, int count);

/// Closes the facility (harmless when it is not open).
void QobUserLib_Close(void);
}
