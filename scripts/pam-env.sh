#!/usr/bin/env bash
# Prepares console logins through the real PAM library for a demo root, and
# prints the environment (one NAME=value per line) that makes tulk use it:
# pam_wrapper preloaded, with a "tulk" service whose users live in the
# root's etc/pam-wrapper/passdb (pam_matrix). The demo users:
#   root      password "tulk"
#   operator  password "operator"
# A password changed in the console is written back to that file.
#   scripts/pam-env.sh <root>
set -euo pipefail
root=${1:?usage: scripts/pam-env.sh <root>}
multiarch=$(gcc -print-multiarch 2>/dev/null || echo x86_64-linux-gnu)
wrapper=/usr/lib/$multiarch/libpam_wrapper.so
matrix=/usr/lib/$multiarch/pam_wrapper/pam_matrix.so
[[ -f $wrapper && -f $matrix ]] || { echo "pam-env: libpam-wrapper is not installed" >&2; exit 1; }

services=$root/etc/pam-wrapper
mkdir -p "$services"
passdb=$services/passdb
[[ -f $passdb ]] || printf 'root:tulk:tulk\noperator:operator:tulk\n' > "$passdb"
for service in tulk other; do
  for type in auth account password session; do
    printf '%-8s required %s passdb=%s\n' "$type" "$matrix" "$passdb"
  done > "$services/$service"
done
# The console confined to a root reads the root's own PAM configuration.
mkdir -p "$root/etc/pam.d"
cp "$services/tulk" "$services/other" "$root/etc/pam.d/"

echo "LD_PRELOAD=$wrapper"
echo "PAM_WRAPPER=1"
echo "PAM_WRAPPER_SERVICE_DIR=$services"
