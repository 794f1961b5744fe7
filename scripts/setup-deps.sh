#!/usr/bin/env bash
# Installs the Debian packages the build and the tests need. Quick when
# everything is already there: it only asks dpkg, and runs apt-get only for
# what is missing.
set -euo pipefail

packages=(
  build-essential cmake ninja-build pkg-config
  libboost-dev
  libsqlite3-dev nlohmann-json3-dev
  libgtest-dev libgmock-dev libexpat1-dev
  clang-format
  clang-14 libclang-rt-14-dev
  bash-completion zsh tmux groff man-db
  dpkg-dev file lintian graphviz
)

missing=()
installed=$(dpkg-query -W -f='${Package} ${Status}\n' "${packages[@]}" 2>/dev/null | awk '$NF == "installed" {print $1}' || true)
for p in "${packages[@]}"; do
  grep -qx "$p" <<<"$installed" || missing+=("$p")
done

if [ "${#missing[@]}" -gt 0 ]; then
  echo "Installing: ${missing[*]}" >&2
  if [ "$(id -u)" -ne 0 ]; then
    echo "error: missing packages and not root; run as root or install: ${missing[*]}" >&2
    exit 1
  fi
  export DEBIAN_FRONTEND=noninteractive
  apt-get update -qq
  apt-get install -y -qq --no-install-recommends "${missing[@]}" >/dev/null
fi
