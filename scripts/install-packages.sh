#!/usr/bin/env bash
# Installs those of the Debian packages named that are missing, with apt-get
# (as root or through sudo). All of its output goes to standard error.
#
#   scripts/install-packages.sh PACKAGE...
set -euo pipefail
missing=()
for p in "$@"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'ok installed' || missing+=("$p")
done
[ ${#missing[@]} -gt 0 ] || exit 0
echo "Installing ${missing[*]}..." >&2
sudo=""
[ "$(id -u)" -eq 0 ] || sudo="sudo"
export DEBIAN_FRONTEND=noninteractive
if ! $sudo apt-get install -y -q "${missing[@]}" >&2; then
  $sudo apt-get update -q >&2
  $sudo apt-get install -y -q "${missing[@]}" >&2
fi
