// Whole-binary measurements of the real tulk in a pseudo-terminal at 80x25:
// start-up to a settled screen, how soon a key (and a lone Esc) is answered, peak memory (in the
// menu with the demo's PAM set-up), the cost of idling and of a repaint (xterm-256color), and the
// bytes of the first screen, a typed character, login to menu, a Down in the menu and a key that
// ends the dimmed state, each against the fewest bytes that make the same change (ScreenCost.h), on
// xterm-256color and vt102. Output: one line per figure, "name  median  min  max  unit", stable for
// scripts.
//
//   tulk-console-bench [--runs N] [--byte-runs N] [--idle-seconds S]
//                      [--only bytes|process] [--tulk PATH]
//
// --tulk measures another build of the console (an older one, say) with the
// same yardstick.
//
// With TULK_BENCH_TRACE set, every measured key's bytes (escaped) and the
// cells it changed go to standard error.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include "ByteScenarios.h"
#include "ConsoleScenarios.h"

namespace {

using TulkBench::Figure;

void Print(const Figure& figure) {
  std::vector<double> values = figure.values;
  if (values.empty()) {
    std::printf("%-44s %10s\n", figure.name.c_str(), "n/a");
    return;
  }
  std::sort(values.begin(), values.end());
  double median = values.size() % 2 == 1
                      ? values[values.size() / 2]
                      : (values[values.size() / 2 - 1] + values[values.size() / 2]) / 2;
  std::printf("%-44s %10.2f %10.2f %10.2f  %s\n", figure.name.c_str(), median, values.front(),
              values.back(), figure.unit.c_str());
}

}  // namespace

int main(int argc, char** argv) {
  TulkBench::BenchSettings settings;
  std::string only;
  for (int i = 1; i + 1 < argc; i += 2) {
    if (std::strcmp(argv[i], "--runs") == 0) {
      settings.runs = std::atoi(argv[i + 1]);
    } else if (std::strcmp(argv[i], "--byte-runs") == 0) {
      settings.byteRuns = std::atoi(argv[i + 1]);
    } else if (std::strcmp(argv[i], "--idle-seconds") == 0) {
      settings.idleSeconds = std::atoi(argv[i + 1]);
    } else if (std::strcmp(argv[i], "--tulk") == 0) {
      settings.program = argv[i + 1];
    } else if (std::strcmp(argv[i], "--only") == 0) {
      only = argv[i + 1];
    }
  }
  std::printf("tulk console benchmark: 80x25, %d runs (%d for bytes), %d s idle\n", settings.runs,
              settings.byteRuns, settings.idleSeconds);
  std::printf("%-44s %10s %10s %10s  %s\n", "figure", "median", "min", "max", "unit");
  if (only != "bytes") {
    for (const Figure& figure : TulkBench::RunScenarios(settings)) {
      Print(figure);
    }
  }
  if (only != "process") {
    for (const Figure& figure : TulkBench::RunByteScenarios(settings)) {
      Print(figure);
    }
  }
  return 0;
}
