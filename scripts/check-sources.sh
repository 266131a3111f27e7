#!/usr/bin/env bash
# Static checks of the sources, run by scripts/test.sh:
#   1. clang-format (the committed .clang-format) on every C++ file: a file
#      that the formatter would change fails the check;
#   2. clang-tidy (the committed .clang-tidy) on every source file under
#      src/ and the src/ headers they include, in parallel, with the
#      compilation database of the default build: any finding fails it.
# Needs a configured default build (build/default/compile_commands.json).
#   scripts/check-sources.sh [--no-tidy]
set -euo pipefail
cd "$(dirname "$0")/.."

run_tidy=1
for argument in "$@"; do
  case "$argument" in
    --no-tidy) run_tidy=0 ;;
    *) echo "usage: scripts/check-sources.sh [--no-tidy]" >&2; exit 2 ;;
  esac
done

echo "== clang-format"
git ls-files -z -- '*.cpp' '*.h' | xargs -0 clang-format --dry-run --Werror

if ((run_tidy)); then
  echo "== clang-tidy (src/)"
  database=build/default/compile_commands.json
  if [[ ! -f $database ]]; then
    echo "missing $database: configure the default build first" >&2
    exit 1
  fi
  run-clang-tidy -p build/default -j "$(nproc)" -quiet \
    "^$PWD/src/.*\.cpp\$" >build/default/clang-tidy.log 2>&1 || {
    grep -E "(warning|error):" build/default/clang-tidy.log | sort -u >&2
    echo "clang-tidy found the problems above (full log: build/default/clang-tidy.log)" >&2
    exit 1
  }
fi
echo "== sources clean"
