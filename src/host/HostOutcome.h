#pragma once
/// The outcome of a host change, as a plain record: whether it was made,
/// and when not, the host's own failure text for the operator.

#include <string>
#include <utility>

namespace Tulk {

struct HostOutcome {
  /// True when the host made the change.
  bool ok = true;
  /// The host-control library's message when it did not (empty otherwise).
  std::string error;

  /// A change that was made.
  static HostOutcome Done() { return {}; }
  /// A change the host refused with `message`.
  static HostOutcome Failed(std::string message) { return {false, std::move(message)}; }
};

}  // namespace Tulk
