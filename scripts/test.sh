#!/usr/bin/env bash
# Installs what is missing, builds, and runs the whole test suite:
#   1. default build (warnings as errors): unit and screen tests, the
#      reliability suite one test at a time (where answer times and memory
#      growth are measured), then
#      clang-format and clang-tidy on the sources (scripts/check-sources.sh),
#      then the installation: staged install, systemd units verified and
#      rated, manual page (scripts/check-deploy.sh), and the console under
#      systemd in a Debian 12 container: ten Ctrl-C, the sandbox's
#      operations (scripts/check-container.sh; as root only);
#   2. sanitizer build (AddressSanitizer + UndefinedBehaviorSanitizer): the
#      same tests again, then the reliability suite on it, one test at a
#      time (random keys on every screen, sizes and signals, kill -9 during
#      state writes, hostile host values; scripts/reliability.sh runs it
#      longer);
#   3. a short libFuzzer run of every fuzz target (60 s each when CI=true,
#      10 s otherwise; TULK_FUZZ_SECONDS overrides).
# Each test run gets a private TMPDIR and fails when it leaves a pam_wrapper
# folder (/tmp/pam.X, few and shared by the machine) or a process behind.
# Options: --no-asan and --no-fuzz skip steps 2 and 3, --no-reliability
# the reliability suite, --no-tidy the
# clang-tidy part of step 1, --no-container the container check (for quick
# local runs).
set -euo pipefail
cd "$(dirname "$0")/.."

run_asan=1
run_fuzz=1
run_container=1
run_reliability=1
check_options=()
for argument in "$@"; do
  case "$argument" in
    --no-asan) run_asan=0 ;;
    --no-fuzz) run_fuzz=0 ;;
    --no-tidy) check_options=(--no-tidy) ;;
    --no-container) run_container=0 ;;
    --no-reliability) run_reliability=0 ;;
    *) echo "usage: scripts/test.sh [--no-asan] [--no-fuzz] [--no-tidy] [--no-container] [--no-reliability]" >&2; exit 2 ;;
  esac
done

# Fails when a pam_wrapper folder naming the run's TMPDIR, or a process
# whose working folder lies in it, is left (the harness runs each console
# in its test folder there).
check_leftovers() {
  local scratch=$1 left=0 folder process cwd
  for folder in /tmp/pam.*; do
    if [[ -d $folder ]] && grep -qsF "$scratch/" "$folder"/*; then
      echo "left behind: $folder" >&2
      left=1
    fi
  done
  for process in /proc/[0-9]*; do
    cwd=$(readlink "$process/cwd" 2>/dev/null) || continue
    if [[ $cwd == "$scratch"/* ]]; then
      echo "left running: ${process#/proc/} ($(cat "$process/comm" 2>/dev/null))" >&2
      left=1
    fi
  done
  if ((left)); then
    echo "the tests left pam_wrapper folders or processes behind" >&2
    return 1
  fi
}

# ctest with the given arguments, in a private TMPDIR, then the check above.
run_ctest() {
  local scratch
  scratch=$(mktemp -d "${TMPDIR:-/tmp}/tulk-ctest-XXXXXX")
  TMPDIR=$scratch ctest "$@"
  check_leftovers "$scratch"
  rm -rf "$scratch"
}

scripts/setup.sh
jobs=$(nproc)

echo "== layers: includes point downwards only"
scripts/check-layers.sh

echo "== default build: unit and screen tests"
scripts/build.sh default
run_ctest --preset default -j "$jobs"
if ((run_reliability)); then
  echo "== reliability suite (default build, one test at a time)"
  run_ctest --preset reliability
fi
scripts/check-sources.sh "${check_options[@]}"
echo "== installation: staged install, systemd units, manual page"
scripts/check-deploy.sh build/default
if ((run_container)); then
  if [[ $(id -u) -eq 0 ]]; then
    echo "== the console under systemd in a Debian 12 container"
    scripts/check-container.sh
  else
    echo "== container check skipped: it needs root"
  fi
fi

if ((run_asan)); then
  echo "== sanitizer build (ASan + UBSan): unit and screen tests"
  scripts/build.sh asan
  ASAN_OPTIONS=detect_leaks=1:abort_on_error=1 UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1 \
    run_ctest --preset asan -j "$jobs"
  if ((run_reliability)); then
    echo "== reliability suite (sanitizer build, one test at a time)"
    ASAN_OPTIONS=detect_leaks=1:abort_on_error=1 UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1 \
      run_ctest --preset reliability-asan
  fi
fi

if ((run_fuzz)) && [[ -x scripts/run-fuzzers.sh ]]; then
  if [[ ${CI:-} == true ]]; then
    seconds=${TULK_FUZZ_SECONDS:-60}
  else
    seconds=${TULK_FUZZ_SECONDS:-10}
  fi
  echo "== fuzzing, ${seconds} s per target"
  scripts/run-fuzzers.sh "$seconds"
fi

echo "== all tests passed"
