#!/usr/bin/env bash
# Builds the libFuzzer targets with clang, AddressSanitizer and
# UndefinedBehaviorSanitizer (the "fuzz" preset) and runs each target for the
# given number of seconds (default 60). Exits non-zero when a target finds a
# crash, a hang or a sanitizer error; the reproducer is left in the build
# folder's artifacts directory.
#
#   scripts/run-fuzzers.sh [seconds-per-target]
#
# TULK_FUZZ_BUILD_DIR overrides the build folder (default build/fuzz).
set -euo pipefail

seconds="${1:-60}"
root="$(cd "$(dirname "$0")/.." && pwd)"
build="${TULK_FUZZ_BUILD_DIR:-$root/build/fuzz}"
targets=(fuzz_markup_layout fuzz_input_field fuzz_attribute_filter)

cd "$root"
cmake --preset fuzz -B "$build" >/dev/null
cmake --build "$build" -j2 --target "${targets[@]}"

export ASAN_OPTIONS="${ASAN_OPTIONS:-abort_on_error=1:detect_leaks=1}"
export UBSAN_OPTIONS="${UBSAN_OPTIONS:-halt_on_error=1:print_stacktrace=1}"
status=0
for target in "${targets[@]}"; do
  name="${target#fuzz_}"
  corpus="$build/corpus/$name"
  artifacts="$build/artifacts/$name/"
  mkdir -p "$corpus" "$artifacts"
  echo "== $target: ${seconds}s"
  if ! "$build/fuzz/$target" -max_total_time="$seconds" -timeout=10 -rss_limit_mb=2048 \
      -print_final_stats=1 -artifact_prefix="$artifacts" "$corpus" "$root/fuzz/seeds/$name"; then
    echo "!! $target failed; reproducers in $artifacts" >&2
    status=1
  fi
done
exit "$status"
