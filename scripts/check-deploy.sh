#!/usr/bin/env bash
# Checks what a host installs, from a configured and built build folder:
#   1. `cmake --install` into a staging folder puts the program, the PAM
#      service, both systemd units and the manual page where a host finds
#      them, and the units name the installed program;
#   2. `systemd-analyze verify` accepts both units, instantiated, in a root
#      made of the staging folder and the host's own units and tools (any
#      message fails the check: verify itself only warns);
#   3. `systemd-analyze security --offline` rates both units 5.5 or better;
#   4. the manual page renders without a warning.
#
#   scripts/check-deploy.sh [build folder]     (default: build/default)
set -euo pipefail
cd "$(dirname "$0")/.."

build=${1:-build/default}
stage=$(mktemp -d "${TMPDIR:-/tmp}/tulk-stage-XXXXXX")
trap 'rm -rf "$stage"' EXIT
failed=0
fail() {
  echo "check-deploy: $*" >&2
  failed=1
}

# 1. The staged install.
DESTDIR=$stage/install cmake --install "$build" >/dev/null
prefix=$(sed -n 's/^CMAKE_INSTALL_PREFIX:PATH=//p' "$build/CMakeCache.txt")
unit_dir=$(sed -n 's/^TULK_SYSTEMD_UNIT_DIR:PATH=//p' "$build/CMakeCache.txt")
pam_dir=$(sed -n 's/^TULK_PAM_DIR:PATH=//p' "$build/CMakeCache.txt")
installed=$stage/install
for file in "$prefix/sbin/tulk" "$pam_dir/tulk" "$prefix/share/man/man8/tulk.8" \
  "$unit_dir/tulk@.service" "$unit_dir/tulk-serial@.service"; do
  [[ -f $installed$file ]] || fail "not installed: $file"
done
[[ -x $installed$prefix/sbin/tulk ]] || fail "not executable: $prefix/sbin/tulk"
for unit in tulk@.service tulk-serial@.service; do
  grep -q "^ExecStart=$prefix/sbin/tulk\b" "$installed$unit_dir/$unit" ||
    fail "$unit does not start $prefix/sbin/tulk"
done
echo "installed: $(cd "$installed" && find . -type f | sed 's/^\.//' | sort | tr '\n' ' ')"

# 2. A root to verify the units in: the staged files over the host's units
# and the tools the units run.
root=$stage/root
mkdir -p "$root$unit_dir" "$root/usr/bin" "$root/usr/sbin"
cp -a "$unit_dir/." "$root$unit_dir/"
cp -a "$installed/." "$root/"
for tool in kill setterm dmesg stty; do
  cp "$(type -P "$tool")" "$root/usr/bin/"
done
[[ -e $root/bin ]] || ln -s usr/bin "$root/bin"
instances=(tulk@2.service tulk-serial@ttyS0.service)
messages=$(MANPATH=$installed$prefix/share/man systemd-analyze verify --root="$root" "${instances[@]}" 2>&1) ||
  fail "systemd-analyze verify failed"
[[ -z $messages ]] || fail "systemd-analyze verify: $messages"

# 3. Exposure scores.
while read -r line; do
  echo "$line"
done < <(systemd-analyze security --offline=true --root="$root" --threshold=55 --no-pager \
  "${instances[@]}" 2>&1 | grep 'Overall exposure level' || true)
systemd-analyze security --offline=true --root="$root" --threshold=55 --no-pager \
  "${instances[@]}" >/dev/null 2>&1 || fail "a unit is rated above 5.5"

# 4. The manual page.
warnings=$(man --warnings -l "$installed$prefix/share/man/man8/tulk.8" 2>&1 >/dev/null) ||
  fail "man cannot render tulk.8"
[[ -z $warnings ]] || fail "tulk.8: $warnings"

if ((failed)); then
  exit 1
fi
echo "check-deploy: install, units, exposure and manual page are fine"
