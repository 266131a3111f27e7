#pragma once
/// The three timeouts the host keeps as advanced options, in seconds
/// (0 = off), and the rule for a timeout the operator types in minutes.
///
/// | Option                                  | Meaning                            | Default |
/// |-----------------------------------------|------------------------------------|---------|
/// | "/UserVars/TaviShellTimeOut"            | login still allowed after enabling | 0       |
/// | "/UserVars/TaviShellInteractiveTimeOut" | idle timeout of shell sessions     | 0       |
/// | "/UserVars/TulkTimeOut"                 | idle time before a console logout  | 600     |
///
/// The read default is what a read yields when the option cannot be read.
/// Options are written with SetAdvancedOption() (host/HostTools.h).
///
/// Decisions of this implementation:
/// - A stored value outside 0 .. 4294967295 cannot be held in seconds of
///   32 bits and reads as unreadable (its read default), as the event loop
///   reads the console timeout.

#include <cstdint>
#include <string_view>

namespace Tulk {

/// The timeouts as the host holds them, in seconds.
struct TimeoutOptions {
  std::uint32_t shellAvailabilitySeconds = 0;
  std::uint32_t shellIdleSeconds = 0;
  std::uint32_t tulkIdleSeconds = 600;
};

/// Reads the three options, each with its read default. Never throws.
TimeoutOptions ReadTimeoutOptions();

/// The largest timeout an operator may set, in minutes (one day).
inline constexpr std::uint32_t kMaxTimeoutMinutes = 1440;

/// What a typed timeout field holds.
struct TimeoutInput {
  enum class Kind {
    /// Nothing typed: the option stays as it is.
    kEmpty,
    /// Above kMaxTimeoutMinutes (or not a number at all).
    kTooLarge,
    /// 0 (off) to kMaxTimeoutMinutes.
    kValid,
  };
  Kind kind = Kind::kEmpty;
  /// The minutes, when kValid.
  std::uint32_t minutes = 0;
};

/// Reads a field of decimal digits as minutes. The fields take digits only
/// and at most five of them, so anything else counts as too large.
TimeoutInput ReadTimeoutInput(std::string_view field);

}  // namespace Tulk
