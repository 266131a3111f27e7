#pragma once
/// Observation events for operator actions that change the host.
///
/// A message is the facility's marker "@&!*@*@(", the event id and ")",
/// then the English text with "%s" placeholders, which the facility fills
/// with the arguments in order. Reporting is best effort: a facility that
/// cannot be opened only loses the event, and nothing here throws. Main
/// thread only.

#include <string>
#include <vector>

namespace Tulk {

/// The facility's marker that starts every message.
inline constexpr char kEventMarker[] = "@&!*@*@(";

/// The console's events, by what happened.
enum class TulkEvent {
  /// qob.user.tulk.login.failed, "Access denied for user %s".
  LoginAccessDenied,
  /// qob.user.tulk.login.failed, "Authentication of user %s failed".
  LoginAuthenticationFailed,
  /// qob.user.tulk.login.passwd.changed, "Login password for user %s
  /// changed".
  PasswordChanged,
  /// qob.user.tulk.network.restart, "Restarting %s" (the interface).
  NetworkRestart,
  /// qob.user.tulk.factory.network.restored, "Restoring factory network
  /// settings".
  FactoryNetworkRestored,
  /// qob.user.tulk.restarting.hostagents, "Restarting host agents".
  RestartingHostAgents,
  /// qob.user.tulk.restore.factory.defaults, "Restoring factory defaults".
  RestoreFactoryDefaults,
  /// qob.user.tulk.reboot.host, "Rebooting host".
  RebootHost,
  /// qob.user.tulk.shutdown.host, "Shutting down host".
  ShutdownHost,
};

/// The event's id, such as "qob.user.tulk.reboot.host".
const char* EventId(TulkEvent event);

/// The event's English text with its placeholders, such as "Restarting %s".
const char* EventText(TulkEvent event);

/// The whole message: marker, id, ")" and text.
std::string EventMessage(TulkEvent event);

/// Opens the facility: logs "Initializing qobuser library", calls
/// QobUserLib_Init and, on a non-zero result, logs "Unable to initialize
/// qobuser library from TULK. Error code: %d" at error level. Returns true
/// when the facility is open.
bool InitEventReporting();

/// Sends one message through QobUserLib_AddQob with `arguments` for its
/// placeholders. The facility must be open; failures are ignored.
void ReportEvent(const std::string& message, const std::vector<std::string>& arguments = {});

/// Closes the facility (QobUserLib_Close).
void CloseEventReporting();

/// True while the facility is open.
bool EventReportingOpen();

/// Posts `event` the way every screen does: when the facility is not
/// already open (it is opened once at start-up, see StartHostServices()),
/// opens it, sends the event only when that succeeded, and closes it again.
/// Returns true when the event was handed to the facility.
bool PostEvent(TulkEvent event, const std::vector<std::string>& arguments = {});

}  // namespace Tulk
