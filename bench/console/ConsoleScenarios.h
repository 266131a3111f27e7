#pragma once
/// The measured scenarios of the console benchmark.

#include <string>
#include <vector>

namespace TulkBench {

struct BenchSettings {
  int runs = 20;
  int idleSeconds = 10;
  /// Runs of the byte scenarios (their figures hardly vary).
  int byteRuns = 5;
  /// The console binary to measure; empty: the tulk of this build.
  std::string program;
};

/// One measured figure with its samples.
struct Figure {
  std::string name;
  std::string unit;
  std::vector<double> values;
};

/// Runs every scenario and returns its figures in a fixed order.
std::vector<Figure> RunScenarios(const BenchSettings& settings);

}  // namespace TulkBench
