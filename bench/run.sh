#!/usr/bin/env bash
# Times orvixcli commands as whole processes beside a baseline process (one
# that starts, dlopens one shared library and calls one function), measured in
# the same run and interleaved with it. Prints medians and their ratios to the
# baseline. Run it through `./dev bench` so that everything is built.
#
#   bench/run.sh [RUNS]        (default 200 runs per command)
set -euo pipefail
cd "$(dirname "$0")/.."
runs=${1:-200}
bin=build/default/bin
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

export ORVIX_HOST_DB=$work/default.db
unset ORVIX_HOST_PROFILE
"$bin/orvix-hostsim" init >/dev/null

echo "Default host ($runs runs each, $(nproc) cores):"
"$bin/orvix-bench-timer" "$runs" \
    "baseline (dlopen + one call)" "$bin/orvix-bench-baseline" \
    "orvixcli network ip get" "$bin/orvixcli network ip get" \
    "orvixcli network ip set --ipv6-enabled=true" "$bin/orvixcli network ip set --ipv6-enabled=true" \
    "orvixcli --help" "$bin/orvixcli --help"
