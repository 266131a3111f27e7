#pragma once
/// The host-control calls of the console's start-up.

#include <cstdint>
#include <optional>

namespace Tulk {

/// The platform's preference library (start-up step 1).
void InitPreferences();

/// Passes the product identity to the platform's logging library
/// (start-up step 8): Log_SetProductInfo with the four ProductState_
/// values, then Log_InitWithSyslogSimpleInt("TULK", Log_CfgInterface(),
/// "TULK").
void InitProductLogging();

/// "/UserVars/TulkTimeOut" in seconds; nullopt when it cannot be read or is
/// not a valid number of seconds.
std::optional<std::uint32_t> ReadTulkTimeout();

/// One-time set-up of the host services after the console's start-up
/// (before the welcome screen): registers the renderer's host values
/// (RegisterHostValueProviders), opens the observation-event facility for
/// the whole run (closed again at process exit; events are still posted,
/// each opening it, when it could not be opened here) and writes the audit
/// record "product.issue".
void StartHostServices();

}  // namespace Tulk
