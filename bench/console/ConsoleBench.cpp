// Whole-binary measurements of the real tulk in a pseudo-terminal (80x25,
// TERM=xterm-256color): start-up to a settled screen, peak memory, bytes
// written per key, how soon a key (and a lone Esc) is answered, and the
// cost of idling. Output: one line per figure,
// "name  median  min  max  unit", stable for scripts.
//
//   tulk-console-bench [--runs N] [--idle-seconds S]

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <string>
#include <thread>
#include <vector>

#include "ConsoleScenarios.h"
#include "ProcessProbe.h"
#include "TestConsole.h"

namespace {

using Clock = std::chrono::steady_clock;
using TulkBench::Figure;

void Print(const Figure& figure) {
  std::vector<double> values = figure.values;
  if (values.empty()) {
    std::printf("%-32s %10s\n", figure.name.c_str(), "n/a");
    return;
  }
  std::sort(values.begin(), values.end());
  double median = values.size() % 2 == 1
                      ? values[values.size() / 2]
                      : (values[values.size() / 2 - 1] + values[values.size() / 2]) / 2;
  std::printf("%-32s %10.2f %10.2f %10.2f  %s\n", figure.name.c_str(), median, values.front(),
              values.back(), figure.unit.c_str());
}

}  // namespace

int main(int argc, char** argv) {
  TulkBench::BenchSettings settings;
  for (int i = 1; i + 1 < argc; i += 2) {
    if (std::strcmp(argv[i], "--runs") == 0) {
      settings.runs = std::atoi(argv[i + 1]);
    } else if (std::strcmp(argv[i], "--idle-seconds") == 0) {
      settings.idleSeconds = std::atoi(argv[i + 1]);
    }
  }
  std::printf("tulk console benchmark: 80x25, TERM=xterm-256color, %d runs, %d s idle\n",
              settings.runs, settings.idleSeconds);
  std::printf("%-32s %10s %10s %10s  %s\n", "figure", "median", "min", "max", "unit");
  for (const Figure& figure : TulkBench::RunScenarios(settings)) {
    Print(figure);
  }
  return 0;
}
