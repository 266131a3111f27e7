#!/bin/sh
# Builds a host root for running the console against the simulated host:
#
#   scripts/make-demo-root.sh /tmp/tulk-demo
#   TULK_ROOT=/tmp/tulk-demo build/default/src/tulk
#
# The root gets the simulated host tools (tulk-hosttool --install), the
# seven system logs, the support pages, a self-signed host certificate, SSH
# host keys, the console-login marker and its own copy of the demo host's
# state (var/lib/tulk-sim/host-state.json), which the console and the tools
# then change, so changes persist across runs. Running the script again
# refreshes the tools and leaves everything else as it is; --fresh-state
# puts the demo host's state back. --dvs makes the state it writes (a new
# root, or with --fresh-state) the variant whose management network sits
# on a misconfigured distributed switch ("tulk-hosttool --demo-state dvs").
#
# The tool is taken from TULK_HOSTTOOL, else from the newest build folder
# of this checkout.
set -eu

usage() {
  echo "usage: $0 [--fresh-state] [--dvs] <root>" >&2
  exit 2
}

fresh=0
variant=
while [ $# -gt 1 ]; do
  case $1 in
    --fresh-state) fresh=1 ;;
    --dvs) variant=dvs ;;
    *) usage ;;
  esac
  shift
done
[ $# -eq 1 ] || usage
root=$1
case $root in
  /) echo "$0: refusing to use the real root" >&2; exit 1 ;;
  /*) ;;
  *) root=$(pwd)/$root ;;
esac

here=$(cd "$(dirname "$0")/.." && pwd)
tool=${TULK_HOSTTOOL:-}
if [ -z "$tool" ]; then
  tool=$(ls -t "$here"/build/*/src/platform/tulk-hosttool "$here"/build*/src/platform/tulk-hosttool \
    2>/dev/null | head -n 1 || true)
fi
if [ -z "$tool" ] || [ ! -x "$tool" ]; then
  echo "$0: tulk-hosttool not found; build it (cmake --build <dir> --target tulk-hosttool)" \
    "or set TULK_HOSTTOOL" >&2
  exit 1
fi

mkdir -p "$root"
"$tool" --install "$root"

# The host state.
state=$root/var/lib/tulk-sim/host-state.json
if [ $fresh -eq 1 ] || [ ! -f "$state" ]; then
  "$tool" --demo-state $variant > "$state.new"
  mv "$state.new" "$state"
fi

# Console login is allowed.
mkdir -p "$root/var/run/brimlo"
: > "$root/var/run/brimlo/show-tulk-login"

# The name table.
if [ ! -f "$root/etc/hosts" ]; then
  cat > "$root/etc/hosts" <<'HOSTS'
# Do not remove the following line, or various programs
# that require network functionality will fail.
127.0.0.1	localhost.localdomain localhost
::1	localhost.localdomain localhost
10.20.30.41	tavi-01.lab.example.net tavi-01
HOSTS
fi

# The system logs of the log viewer.
log() {
  file=$root/var/log/$1
  shift
  [ -f "$file" ] || printf '%s\n' "$@" > "$file"
}
log syslog.log \
  "2026-11-20T08:14:02Z syslog[2101]: starting up" \
  "2026-11-20T08:14:05Z mgmtd[2240]: Management agent started, listening on port 443" \
  "2026-11-20T08:14:07Z hlma[2262]: Helmsman agent connected to 10.20.30.5" \
  "2026-11-20T09:02:41Z sshd[3120]: SSH service is disabled" \
  "2026-11-21T06:00:01Z crond[1840]: running periodic backup.sh 0"
log hykernel.log \
  "2026-11-20T08:13:40.112Z cpu0:1)Boot Successful" \
  "2026-11-20T08:13:51.004Z cpu3:2098)hynic0: link up, 10000 Mbps, full duplex" \
  "2026-11-20T08:13:51.009Z cpu3:2098)hynic1: link up, 10000 Mbps, full duplex" \
  "2026-11-20T08:13:51.120Z cpu5:2098)hynic2: link down" \
  "2026-11-20T08:13:52.400Z cpu1:2110)hyk0: IPv4 10.20.30.41/24 on Management Network"
log sysboot.log \
  "2026-11-20T08:13:44Z sysboot: loading kernel modules" \
  "2026-11-20T08:13:49Z sysboot: restoring network configuration" \
  "2026-11-20T08:13:55Z sysboot: starting services" \
  "2026-11-20T08:14:09Z sysboot: boot completed in 29 seconds"
log mgmtd.log \
  "2026-11-20T08:14:05.311Z info mgmtd[2240] [Originator@brimlo] Management agent 8.1.0 build-24519031" \
  "2026-11-20T08:14:06.002Z info mgmtd[2240] Inventory loaded: 2 virtual machines, 2 switches" \
  "2026-11-21T07:45:12.884Z warning mgmtd[2251] Datastore usage above 80%"
log hlma.log \
  "2026-11-20T08:14:07.540Z hlma: registered with Helmsman at 10.20.30.5" \
  "2026-11-20T08:19:07.542Z hlma: heartbeat ok"
log hagt.log \
  "2026-11-20T08:14:12Z hagt: High Availibility agent waiting for cluster configuration"
log qobd.log \
  "2026-11-20T08:14:03.001Z qobd: observation daemon started" \
  "2026-11-20T08:14:03.220Z qobd: event qob.system.boot posted"

# Support information pages: "#" starts a comment, "$" ends a page.
support=$root/etc/brimlo/support
if [ ! -f "$support" ]; then
  cat > "$support" <<'SUPPORT'
# Support information shown by "View Support Information".
{color:white}Host{/color}
Name: {hostname}
Management address: {ip}
Product: {tavproduct} {tavversion}
Memory: {memory}
$
{color:white}Hardware{/color}
Service tag: {servicetag}
Asset tag: {assettag}
BIOS: {BIOSversion}
BMC: {BMCversion}
CPLD: {CPLDversion}
PLSA: {PLSAversion}
$
{color:white}SSL certificate thumbprints{/color}
SHA-1: {ssl-thumbprint-sha-1}
SHA-256: {ssl-thumbprint-sha-256}
SHA-512: {ssl-thumbprint-sha-512}
$
{color:white}SSH host keys{/color}
RSA: {ssh-rsa-fingerprint}
DSA: {ssh-dsa-fingerprint}
SUPPORT
fi

# The host certificate and the SSH host keys.
mkdir -p "$root/etc/brimlo/ssl" "$root/etc/ssh"
if [ ! -f "$root/etc/brimlo/ssl/host.crt" ]; then
  openssl req -x509 -newkey rsa:2048 -nodes -days 3650 \
    -subj "/O=Brimlo/CN=tavi-01.lab.example.net" \
    -keyout "$root/etc/brimlo/ssl/host.key" -out "$root/etc/brimlo/ssl/host.crt" \
    >/dev/null 2>&1
fi
if [ ! -f "$root/etc/ssh/ssh_host_rsa_key" ]; then
  ssh-keygen -q -t rsa -b 3072 -N '' -C root@tavi-01 -f "$root/etc/ssh/ssh_host_rsa_key"
fi
# Newer ssh-keygen builds cannot make DSA keys any more; the key is then
# left missing and the console shows an empty DSA fingerprint.
if [ ! -f "$root/etc/ssh/ssh_host_dsa_key" ]; then
  ssh-keygen -q -t dsa -N '' -C root@tavi-01 -f "$root/etc/ssh/ssh_host_dsa_key" \
    >/dev/null 2>&1 || echo "note: ssh-keygen cannot make DSA keys; no DSA host key" >&2
fi

echo "demo root ready: TULK_ROOT=$root"
