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

}  // namespace Tulk
