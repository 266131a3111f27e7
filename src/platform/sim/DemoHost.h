#pragma once
/// The built-in demo host: the state the simulated host starts from when
/// TULK_HOST_STATE is unset.

#include <nlohmann/json.hpp>

namespace Sim {

nlohmann::json DemoHostState();

}  // namespace Sim
