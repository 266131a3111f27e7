#!/usr/bin/env bash
# Installs what is missing, builds TULK and runs it in this terminal on the
# built-in simulated host, confined to a demo root (build/demo-root, or
# TULK_DEMO_ROOT). Changes made in the console persist in the demo root's
# host state; delete the folder to start afresh.
#
#   scripts/demo.sh [--dvs] [vt]
#
# --dvs runs a second demo host, in build/demo-root-dvs, whose management
# network sits on a misconfigured distributed switch: the network restore
# options "Restore DVS" and "Restore Standard Switch" have something to do.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/setup.sh
scripts/build.sh default --target tulk tulk-hosttool >/dev/null

variant=()
default_root=$PWD/build/demo-root
if [[ ${1:-} == --dvs ]]; then
  variant=(--dvs)
  default_root=$PWD/build/demo-root-dvs
  shift
fi
root=${TULK_DEMO_ROOT:-$default_root}
scripts/make-demo-root.sh "${variant[@]}" "$root" >/dev/null

environment=(TULK_ROOT="$root")
if [[ -f $root/var/lib/tulk-sim/host-state.json ]]; then
  environment+=(TULK_HOST_STATE="$root/var/lib/tulk-sim/host-state.json")
fi
if [[ -x scripts/pam-env.sh ]]; then
  # Console logins go through the real PAM library, wrapped so that the
  # demo users live in the demo root (see README: demo users).
  while IFS= read -r line; do environment+=("$line"); done < <(scripts/pam-env.sh "$root")
fi
if locale -a 2>/dev/null | grep -qi '^en_US\.utf-\?8$'; then
  environment+=(LANG=en_US.UTF-8)
fi
exec env "${environment[@]}" build/default/src/tulk "$@"
