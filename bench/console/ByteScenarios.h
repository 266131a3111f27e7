#pragma once
/// The console benchmark's byte figures, on xterm-256color and vt102 at
/// 80x25: for the first screen, a typed character in the login dialog,
/// login to menu, a Down in the menu and a key that ends the dimmed state,
/// the bytes the console sent, the fewest bytes that make the same change
/// (ScreenCost.h) and their ratio.

#include <vector>

#include "ConsoleScenarios.h"

namespace TulkBench {

/// Runs the byte scenarios `settings.byteRuns` times on each terminal.
std::vector<Figure> RunByteScenarios(const BenchSettings& settings);

}  // namespace TulkBench
