#pragma once
/// The shape of the simulated host's state document: which sections and
/// fields exist, their types, the mode words and the address texts.
///
/// Every section is optional; within a known section a field of the wrong
/// type, a missing `name`, an unknown mode word or an address text that does
/// not parse is refused with its path. Unknown fields are ignored.

#include <nlohmann/json.hpp>

namespace Sim {

/// Validates a parsed state document; throws StateError (SimHost.h) naming
/// the first problem ("network.pnics[1].linkUp must be a boolean").
void ValidateState(const nlohmann::json& state);

}  // namespace Sim
