#pragma once
/// The process's entry and exit: start-up in its fixed order, the run of
/// the welcome screen, and the teardown.

#include <cstdint>
#include <functional>
#include <optional>

namespace Tulk {

/// What the start-up needs from the layers above the runtime. The
/// executable registers them; the runtime knows neither the host-control
/// library nor the screens.
struct ConsoleHooks {
  /// Step 1: the platform's preference library (Preference_Init). May end
  /// the process with a one-line error on standard error.
  std::function<void()> preferenceInit;
  /// Step 4 and every login: reads "/UserVars/TulkTimeOut" (nullopt when
  /// it cannot be read).
  std::function<std::optional<std::uint32_t>()> readIdleTimeout;
  /// Step 8: passes the product identity to the platform's logging library
  /// (Log_SetProductInfo, Log_InitWithSyslogSimpleInt).
  std::function<void()> initProductLogging;
  /// After start-up: further one-time set-up of the layers above (event
  /// facility, value providers of the markup renderer).
  std::function<void()> afterStartup;
  /// Steps 15 to 17: builds the welcome screen, runs it with RunFrame, logs
  /// a host-control exception that escapes it, and destroys it.
  std::function<void()> runWelcome;
  /// SIGUSR1: the smart-card check of the login.
  std::function<void()> smartCardCheck;
};

/// Runs the console: start-up steps 1 to 14, the welcome screen, teardown.
/// Returns 0; most endings are exit(0) calls from the key loop. A terminal
/// type that curses cannot use (an unknown or empty TERM) ends the start-up
/// with exit status 1 and the error line "Error opening terminal: %s." in
/// the system log, since standard error is silenced by then.
int ConsoleMain(int argc, char** argv, const ConsoleHooks& hooks);

}  // namespace Tulk
