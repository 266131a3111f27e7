#!/usr/bin/env bash
# Installs what building, running and testing TULK needs on Debian 12, and
# generates the en_US.UTF-8 locale. Idempotent: installs only what is
# missing, and runs `apt-get update` once, only when something is missing.
set -euo pipefail

PACKAGES=(
  g++ cmake make pkg-config
  libncurses-dev ncurses-base libpam0g-dev libboost-filesystem-dev libboost-system-dev
  nlohmann-json3-dev libgtest-dev libgmock-dev libvterm-dev libpam-wrapper libbenchmark-dev
  clang libclang-rt-14-dev clang-tidy clang-format
  less openssl openssh-client locales procps
  systemd man-db debootstrap systemd-container
)

SUDO=()
if [[ $(id -u) -ne 0 ]]; then
  if command -v sudo >/dev/null; then
    SUDO=(sudo)
  fi
fi

missing=()
for package in "${PACKAGES[@]}"; do
  if ! dpkg-query -W -f='${Status}' "$package" 2>/dev/null | grep -q "install ok installed"; then
    missing+=("$package")
  fi
done

if ((${#missing[@]})); then
  if [[ $(id -u) -ne 0 && ${#SUDO[@]} -eq 0 ]]; then
    echo "setup: missing packages: ${missing[*]} (run as root to install them)" >&2
    exit 1
  fi
  echo "setup: installing ${missing[*]}"
  export DEBIAN_FRONTEND=noninteractive
  "${SUDO[@]}" apt-get update -qq
  "${SUDO[@]}" apt-get install -y -qq --no-install-recommends "${missing[@]}" >/dev/null
fi

# Line drawing and the block characters need a UTF-8 locale; the console
# asks for en_US.UTF-8 and falls back to C.UTF-8 when it is missing.
if ! locale -a 2>/dev/null | grep -qi '^en_US\.utf-\?8$'; then
  if [[ $(id -u) -eq 0 || ${#SUDO[@]} -gt 0 ]]; then
    "${SUDO[@]}" sed -i 's/^# *\(en_US.UTF-8 UTF-8\)/\1/' /etc/locale.gen
    grep -q '^en_US.UTF-8 UTF-8' /etc/locale.gen ||
      echo 'en_US.UTF-8 UTF-8' | "${SUDO[@]}" tee -a /etc/locale.gen >/dev/null
    "${SUDO[@]}" locale-gen >/dev/null
  else
    echo "setup: en_US.UTF-8 is not generated; the console falls back to C.UTF-8" >&2
  fi
fi
