#!/usr/bin/env bash
# Builds the release configuration and runs every benchmark:
#   - the whole console in a pseudo-terminal (bench/console): start-up to a
#     settled screen, peak memory (in the menu with the demo's PAM set-up),
#     idle cost, the lone Esc, and on xterm-256color and vt102 the bytes of
#     the first screen, a typed character, login to menu, a Down in the menu
#     and a key that ends the dimmed state, each against the fewest bytes
#     that make the same change (bench/console/ScreenCost.h);
#   - the management network window the same way (bench/network): its draw,
#     the bytes of each move against the fewest possible, an apply's cost;
#   - Google Benchmark suites of the renderer, host layer, simulated host and
#     menu (bench/render, bench/host, bench/platform, bench/screens).
# Output format: the console benchmark prints "figure median min max unit"
# lines; the others print Google Benchmark's console table.
#   scripts/bench.sh [--runs N] [--byte-runs N] [--idle-seconds S]
set -euo pipefail
cd "$(dirname "$0")/.."
scripts/setup.sh
scripts/build.sh default >/dev/null

echo "== console"
build/default/bench/console/tulk-console-bench "$@"
echo "== network"
build/default/bench/network/tulk-network-bench
for suite in build/default/bench/render/* build/default/bench/host/* \
             build/default/bench/platform/* build/default/bench/screens/*; do
  if [[ -f $suite && -x $suite ]]; then
    echo "== $(basename "$suite")"
    "$suite" --benchmark_min_time=0.2
  fi
done
