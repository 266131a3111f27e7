#!/usr/bin/env bash
# Checks that the source folders include one another only downwards:
#   runtime, render  <- toolkit
#   runtime, render  <- host <- platform (the host-control API)
#   host, toolkit    <- network, restore, troubleshooting <- screens
# and that only host reaches the host-control API's operations: the screen
# folders may use its plain value types (addresses, IP configurations) and
# nothing else of it.
# Prints every include that points the wrong way; exits 1 if there is one.
set -euo pipefail
cd "$(dirname "$0")/../src"

declare -A allowed=(
  [runtime]="runtime include"
  [render]="render runtime include"
  [toolkit]="toolkit render runtime include"
  [host]="host render runtime include platform"
  [network]="network host toolkit render runtime include"
  [restore]="restore host toolkit render runtime include"
  [troubleshooting]="troubleshooting host toolkit render runtime include"
  [screens]="screens network restore troubleshooting host toolkit render runtime include"
)

# The host-control API's value types: plain records that do not touch the
# host.
value_types=" IpAddress.h IpConfig.h Ipv6Network.h MacAddress.h NicTeamingPolicy.h "
screen_folders=" network restore troubleshooting screens "

status=0
for folder in "${!allowed[@]}"; do
  [[ -d $folder ]] || continue
  while IFS=: read -r file line include; do
    target=${include#*\"}
    header=${target##*/}
    header=${header%\"}
    target=${target%%/*}
    if [[ $target == platform && $screen_folders == *" $folder "* &&
          ${include#*\"} == platform/api/* && $value_types == *" $header "* ]]; then
      continue
    fi
    if [[ " ${allowed[$folder]} " != *" $target "* ]]; then
      echo "layer violation: $file:$line includes \"${include#*\"}" >&2
      status=1
    fi
  done < <(grep -rn '^#include "[a-z]*/' "$folder" | sed 's/:#include /:/' || true)
done
exit $status
