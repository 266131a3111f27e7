#!/usr/bin/env bash
# The reliability suite as a longer soak: random keys on every screen,
# every size and signal in every place, kill -9 during state writes and
# hostile host values, with the work multiplied by SCALE (default 10: a
# million key bytes and 2,000 kill -9 runs), on the default build or, with
# --asan, on the sanitizer build. Prints the figures of each test.
#   scripts/reliability.sh [--asan] [SCALE] [SEED]
set -euo pipefail
cd "$(dirname "$0")/.."

preset=default
if [[ ${1:-} == --asan ]]; then
  preset=asan
  shift
fi
export TULK_RELIABILITY_SCALE=${1:-10}
if [[ -n ${2:-} ]]; then
  export TULK_RELIABILITY_SEED=$2
fi

scripts/build.sh "$preset"
export ASAN_OPTIONS=detect_leaks=1:abort_on_error=1
export UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1
scratch=$(mktemp -d "${TMPDIR:-/tmp}/tulk-reliability-XXXXXX")
trap 'rm -rf "$scratch"' EXIT
if [[ $preset == asan ]]; then
  TMPDIR=$scratch ctest --preset reliability-asan
else
  TMPDIR=$scratch ctest --preset reliability
fi
