#!/usr/bin/env bash
# Installs a build tree under a scratch prefix and runs the installed
# orvixcli there, with nothing of the build tree on any search path: the
# installed programs must find their libraries and plug-ins by themselves.
#
#   scripts/check-install.sh BUILD_DIR
set -euo pipefail
build=${1:?usage: check-install.sh BUILD_DIR}
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
cmake --install "$build" --prefix "$work/prefix" >/dev/null
# Moving the installation proves that nothing points back at the prefix.
mv "$work/prefix" "$work/moved"
export ORVIX_HOST_DB=$work/host.db
unset ORVIX_PLUGIN_PATH ORVIX_HOST_PROFILE
out=$(env -u LD_LIBRARY_PATH "$work/moved/bin/orvixcli" network vswitch standard list --formatter=json)
grep -q '"Name": "vSwitch0"' <<<"$out" || { echo "installed orvixcli printed: $out" >&2; exit 1; }
dump=$("$work/moved/bin/orvix-hostsim" dump)
grep -q '"format": "orvix-host-profile"' <<<"$dump" || { echo "installed orvix-hostsim dumped: $dump" >&2; exit 1; }
# No installed program or library may still look for libraries in the
# build tree.
for file in "$work"/moved/bin/* "$work"/moved/lib/orvixcli/*.so "$work"/moved/lib/orvixcli/plugins/*.so; do
    if readelf -d "$file" | grep -E 'R(UN)?PATH' | grep -qF "$(cd "$build" && pwd)"; then
        echo "$file: its run path names the build tree" >&2
        exit 1
    fi
done
echo "installed tree runs"
