#!/usr/bin/env bash
# Installs the Debian 12 packages that building and testing OESDK needs (the list is
# scripts/debian-packages.txt). Only packages that are not installed yet are fetched, so this is
# cheap to run again. Runs apt-get as root, or through sudo for other users; never asks questions.
#
# usage: scripts/setup-debian.sh [--native]
#   --native   only what the native build, its tests and the command-line tool need; without it,
#              also the sanitizer toolchain, the MinGW-w64 cross compiler and wine
set -euo pipefail

here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
case ${1:-} in
"") sections='native|all' ;;
--native) sections='native' ;;
*)
  echo "usage: scripts/setup-debian.sh [--native]" >&2
  exit 2
  ;;
esac
# Package names from the chosen [sections] of the list, comments and blank lines dropped.
mapfile -t packages < <(sed -e 's/#.*//' -e 's/[[:space:]]//g' "$here/debian-packages.txt" |
  awk -v want="^($sections)\$" '/^\[.*\]$/ { on = (substr($0, 2, length($0) - 2) ~ want); next } on && NF')

missing=()
for p in "${packages[@]}"; do
  status=$(dpkg-query -W -f='${Status}' "$p" 2>/dev/null || true)
  [ "$status" = "install ok installed" ] || missing+=("$p")
done
if [ ${#missing[@]} -eq 0 ]; then
  echo "setup-debian: all ${#packages[@]} packages are installed"
  exit 0
fi
echo "setup-debian: installing ${#missing[@]} of ${#packages[@]} packages: ${missing[*]}"

sudo=()
if [ "$(id -u)" -ne 0 ]; then
  if ! command -v sudo >/dev/null; then
    echo "setup-debian: not root and no sudo; install as root: apt-get install ${missing[*]}" >&2
    exit 1
  fi
  sudo=(sudo)
fi
apt=("${sudo[@]}" env DEBIAN_FRONTEND=noninteractive apt-get -q -o DPkg::Lock::Timeout=600
     -o Acquire::Retries=3 -o Dpkg::Use-Pty=0)

# apt's per-package chatter goes to a log that is shown only when something fails.
log=$(mktemp "${TMPDIR:-/tmp}/oesdk-apt.XXXXXX")
trap 'rm -f "$log"' EXIT
if ! { "${apt[@]}" update && "${apt[@]}" install -y --no-install-recommends "${missing[@]}"; } \
    >"$log" 2>&1 </dev/null; then
  cat "$log" >&2
  echo "setup-debian: apt-get failed" >&2
  exit 1
fi
grep -E '^[0-9]+ upgraded, [0-9]+ newly installed' "$log" || true
