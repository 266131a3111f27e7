#pragma once
/// The console's system log.
///
/// Lines go to syslog(3). When the environment variable TULK_LOG_FILE is
/// set, every line that syslog accepts is also appended to that file as
/// "<N>message": N is the priority value including the facility as syslog
/// would send it (LOG_USER when the caller gives none), the message carries
/// no ident and no pid. Tests read that copy; without the variable only the
/// system log is written. Safe to call from any thread.

#include <cstdarg>

namespace Tulk {

/// Opens the system log with ident "TULK", LOG_PID and LOG_USER, and sets
/// the log mask to 127 (emergency to informational; debug is dropped).
void OpenSystemLog();

/// Logs one line at the given syslog priority (optionally with a facility).
void Log(int priority, const char* format, ...) __attribute__((format(printf, 2, 3)));
void LogV(int priority, const char* format, va_list args) __attribute__((format(printf, 2, 0)));

/// Logs "<call> with errno(<errno>): <strerror>" at error priority.
void LogErrno(const char* call);

}  // namespace Tulk
