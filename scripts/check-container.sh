#!/usr/bin/env bash
# Boots a Debian 12 container under systemd (debootstrap, systemd-nspawn)
# with the console installed by `cmake --install` and running in its shipped
# serial-line unit on the container's console, confined to a demo root of
# the simulated host, and checks on the real service manager that:
#   1. the console survives ten Ctrl-C in a row: after each one the unit
#      starts a new console process, which draws the welcome screen again,
#      and the unit ends active with ten restarts and no start limit hit;
#   2. a restart leaves nothing behind: a tool that ignores SIGTERM and
#      SIGHUP, still running when the unit's main process ends, is gone
#      before the next start;
#   3. the unit's sandbox leaves the host operations working: a process in
#      the same sandbox writes /etc/hosts and its backup, changes a user's
#      password through PAM (chpasswd over common-password), starts and stops
#      a service through systemctl, runs the pager on a terminal, and finally
#      powers the container off.
# Run as root. The first run downloads Debian 12 (about 250 MB, kept in
# build/container/debian12 for later runs; --fresh builds it again).
#
#   scripts/check-container.sh [--fresh]
set -euo pipefail
cd "$(dirname "$0")/.."
here=$PWD

fresh=0
for argument in "$@"; do
  case "$argument" in
    --fresh) fresh=1 ;;
    *) echo "usage: scripts/check-container.sh [--fresh]" >&2; exit 2 ;;
  esac
done
if [[ $(id -u) -ne 0 ]]; then
  echo "check-container: run as root (debootstrap and systemd-nspawn need it)" >&2
  exit 1
fi

started=$SECONDS
say() { printf '[%3ds] %s\n' $((SECONDS - started)) "$*"; }
die() {
  say "FAILED: $*"
  [[ -f ${out:-} ]] && say "the console's output is kept in $out"
  exit 1
}

# What the check needs (debootstrap, systemd-nspawn), the console and the
# simulated host's tool.
say "building"
scripts/setup.sh >/dev/null
scripts/build.sh default --target tulk tulk-hosttool >/dev/null

# A pristine Debian 12 with systemd, and the libraries the console needs.
cache=build/container/debian12
if ((fresh)) || [[ ! -f $cache/.complete ]]; then
  say "debootstrap of Debian 12 into $cache"
  rm -rf "$cache"
  mkdir -p "$(dirname "$cache")"
  debootstrap --variant=minbase \
    --include=systemd,systemd-sysv,dbus,libncursesw6,libboost-filesystem1.74.0,less,procps \
    bookworm "$cache" http://deb.debian.org/debian >build/container/debootstrap.log 2>&1 ||
    die "debootstrap failed (build/container/debootstrap.log)"
  touch "$cache/.complete"
fi

# This run's copy of it, with the console installed and enabled.
root=build/container/run
rm -rf "$root"
cp -a "$cache" "$root"
DESTDIR=$here/$root cmake --install build/default >/dev/null
TULK_HOSTTOOL=$here/build/default/src/platform/tulk-hosttool \
  scripts/make-demo-root.sh "$here/$root/var/lib/tulk-demo" >/dev/null
unit=tulk-serial@console.service
mkdir -p "$root/etc/systemd/system/$unit.d"
cat >"$root/etc/systemd/system/$unit.d/demo-host.conf" <<'EOF'
[Service]
Environment=TULK_ROOT=/var/lib/tulk-demo
Environment=TULK_HOST_STATE=/var/lib/tulk-demo/var/lib/tulk-sim/host-state.json
EOF
systemctl --root="$root" --quiet enable "$unit"
systemctl --root="$root" --quiet mask console-getty.service

# The same unit with other programs in place of the console: instance
# "stray" leaves a hung tool behind and ends; instance "probe" runs the
# sandbox probe; instance "power" powers the container off.
cat >"$root/usr/local/sbin/tulk-sandbox-probe" <<'EOF'
#!/bin/sh
set -e
printf '192.0.2.9\tprobe.example\n' >>/etc/hosts
cp /etc/hosts /etc/hosts.backup
grep -q probe.example /etc/hosts.backup
echo "probe: /etc/hosts and its backup written"
before=$(grep '^probe:' /etc/shadow)
echo 'probe:Fresh-Pass-42' | chpasswd
[ "$(grep '^probe:' /etc/shadow)" != "$before" ]
echo "probe: password changed through PAM"
systemctl start tulk-probe-idle.service
systemctl is-active --quiet tulk-probe-idle.service
systemctl stop tulk-probe-idle.service
! systemctl is-active --quiet tulk-probe-idle.service
echo "probe: a service started and stopped"
printf 'q' | script -qec 'TERM=vt100 less /etc/os-release' /dev/null >/dev/null
echo "probe: the pager ran on a terminal"
echo "probe: all fine"
EOF
cat >"$root/usr/local/sbin/tulk-hung-tool" <<'EOF'
#!/bin/sh
# Leaves behind a tool that ignores SIGTERM and SIGHUP, and ends.
sh -c 'trap "" TERM HUP; exec sleep 1000' &
echo $! >/run/tulk-stray.pid
sleep 1
EOF
chmod 755 "$root/usr/local/sbin/tulk-sandbox-probe" "$root/usr/local/sbin/tulk-hung-tool"
# A drop-in for the serial unit's instance: the unit's own sandbox with
# another program; a oneshot one runs once and is not restarted.
serial_drop_in() {
  local instance=$1 program=$2 oneshot=$3
  local folder="$root/etc/systemd/system/tulk-serial@$instance.service.d"
  mkdir -p "$folder"
  {
    echo "[Service]"
    if ((oneshot)); then
      printf 'Type=oneshot\nRestart=no\n'
    fi
    printf 'StandardInput=null\nStandardOutput=journal\nExecStartPre=\nExecStart=\nExecStart=%s\n' \
      "$program"
  } >"$folder/$instance.conf"
}
serial_drop_in stray /usr/local/sbin/tulk-hung-tool 0
serial_drop_in probe /usr/local/sbin/tulk-sandbox-probe 1
serial_drop_in power "/bin/systemctl poweroff" 1
cat >"$root/etc/systemd/system/tulk-probe-idle.service" <<'EOF'
[Service]
ExecStart=/bin/sleep infinity
EOF
chroot "$root" useradd --no-create-home probe

# Boot. nspawn wants a terminal for the container's console: script gives
# it one and passes on what is written into the fifo (the keys).
work=$(mktemp -d "${TMPDIR:-/tmp}/tulk-container-XXXXXX")
fifo=$work/keys
out=$here/build/container/console.out
mkfifo "$fifo"
say "booting the container"
script -qfec "systemd-nspawn -q -D '$here/$root' -b --register=no --keep-unit \
  --console=interactive -E TERM=vt220" /dev/null <"$fifo" >"$out" 2>&1 &
script_pid=$!
exec 3>"$fifo"
cleanup() {
  exec 3>&- || true
  if kill -0 "$script_pid" 2>/dev/null; then
    kill "$script_pid" 2>/dev/null || true
    sleep 2
    kill -9 "$script_pid" 2>/dev/null || true
  fi
  rm -rf "$work"
}
trap cleanup EXIT

# The container's init: the first process named systemd below the script.
leader=
descendants() {
  local child
  for child in $(ps -o pid= --ppid "$1"); do
    echo "$child"
    descendants "$child"
  done
}
for _ in $(seq 100); do
  for pid in $(descendants "$script_pid"); do
    if [[ $(cat "/proc/$pid/comm" 2>/dev/null) == systemd ]]; then
      leader=$pid
      break 2
    fi
  done
  sleep 0.2
done
[[ -n $leader ]] || die "the container did not start"
inside() { nsenter -t "$leader" -m -u -i -n -p -- "$@"; }
show() { inside systemctl show -P "$2" "$1" 2>/dev/null || true; }
welcomes() { grep -ao 'To manage this host' "$out" | wc -l; }

wait_for() { # seconds, description, condition...
  local seconds=$1 what=$2
  shift 2
  local deadline=$((SECONDS + seconds))
  until "$@"; do
    ((SECONDS < deadline)) || die "timed out waiting for $what"
    sleep 0.2
  done
}
console_up() { # the unit runs a new process and its welcome screen is drawn
  local pid
  pid=$(show "$unit" MainPID)
  [[ $(show "$unit" ActiveState) == active && -n $pid && $pid != 0 && $pid != "$1" ]] &&
    (($(welcomes) > $2))
}

wait_for 120 "the first welcome screen" console_up 0 0
pid=$(show "$unit" MainPID)
say "the console runs (pid $pid) and shows the welcome screen"

for round in $(seq 10); do
  seen=$(welcomes)
  printf '\003' >&3
  wait_for 30 "the console after Ctrl-C number $round" console_up "$pid" "$seen"
  new=$(show "$unit" MainPID)
  say "Ctrl-C $round: pid $pid ended, pid $new shows the welcome screen"
  pid=$new
done
restarts=$(show "$unit" NRestarts)
state=$(show "$unit" ActiveState)/$(show "$unit" SubState)
result=$(show "$unit" Result)
say "after ten Ctrl-C: $state, result $result, $restarts restarts"
[[ $restarts == 10 && $state == active/running && $result == success ]] ||
  die "the unit did not come back ten times"

say "a hung tool left behind by the unit's program"
stray=tulk-serial@stray.service
stray_pid() { inside cat /run/tulk-stray.pid 2>/dev/null || true; }
has_stray() { [[ -n $(stray_pid) ]]; }
restarted() { [[ $(show "$stray" NRestarts) -ge 1 ]] && has_stray; }
gone() { ! inside kill -0 "$1" 2>/dev/null; }
inside systemctl start "$stray"
wait_for 30 "the hung tool" has_stray
first=$(stray_pid)
inside rm -f /run/tulk-stray.pid
wait_for 60 "the unit's restart" restarted
gone "$first" || die "the hung tool $first outlived the restart"
second=$(stray_pid)
inside systemctl stop "$stray"
gone "$second" || die "the hung tool $second outlived the stop"
say "the hung tools $first and $second ended with the unit's restart and stop"

say "the sandbox probe"
if ! inside systemctl start tulk-serial@probe.service; then
  inside journalctl --no-pager -o cat -u tulk-serial@probe.service | sed 's/^/    /'
  die "an operation failed inside the console's sandbox"
fi
inside journalctl --no-pager -o cat -u tulk-serial@probe.service | grep '^probe:' | sed 's/^/    /'

say "power off from inside the sandbox"
inside systemctl start --no-block tulk-serial@power.service
for _ in $(seq 150); do
  kill -0 "$script_pid" 2>/dev/null || break
  sleep 0.2
done
if kill -0 "$script_pid" 2>/dev/null; then
  die "the container did not power off"
fi
wait "$script_pid" || die "the container did not power off cleanly"
say "the container powered off; all checks passed"
rm -rf "$root"
