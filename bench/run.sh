#!/usr/bin/env bash
# Times orvixcli commands as whole processes beside a baseline process (one
# that starts, dlopens one shared library and calls one function), measured in
# the same run and interleaved with it. Prints medians and their ratios to the
# baseline, on the default host and on a large one (about 1000 standard
# switches, 4096 ports, 2000 port groups, 64 NICs, 256 interfaces, 10000 routes; made by
# orvix-bench-make-profile). Run it through `./dev bench` so that everything is
# built.
#
#   bench/run.sh [RUNS]        (default 200 runs per command)
set -euo pipefail
cd "$(dirname "$0")/.."
runs=${1:-200}
bin=build/default/bin
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
unset ORVIX_HOST_PROFILE

cli="$bin/orvixcli"
# The switch a run adds and removes again, and the IPv6 setting it turns off
# and on again, so every round finds the same host and every change writes.
scratch="--vswitch-name=benchSwitch"

export ORVIX_HOST_DB=$work/default.db
"$bin/orvix-hostsim" init >/dev/null
echo "Default host ($runs runs each, $(nproc) cores):"
"$bin/orvix-bench-timer" "$runs" \
    "baseline (dlopen + one call)" "$bin/orvix-bench-baseline" \
    "network ip get" "$cli network ip get" \
    "network ip set --ipv6-enabled=false" "$cli network ip set --ipv6-enabled=false" \
    "network ip set --ipv6-enabled=true" "$cli network ip set --ipv6-enabled=true" \
    "--help" "$cli --help" \
    "network vswitch standard list" "$cli network vswitch standard list" \
    "network vswitch standard portgroup list" "$cli network vswitch standard portgroup list" \
    "network vswitch standard add" "$cli network vswitch standard add $scratch" \
    "network vswitch standard remove" "$cli network vswitch standard remove $scratch" \
    "... portgroup policy failover get" "$cli network vswitch standard portgroup policy failover get -p Storage" \
    "network nic list" "$cli network nic list" \
    "network nic get" "$cli network nic get -n hwnic0" \
    "network nic stats get" "$cli network nic stats get -n hwnic0" \
    "network nic up" "$cli network nic up -n hwnic0"

export ORVIX_HOST_DB=$work/large.db
"$bin/orvix-bench-make-profile" >"$work/large.json"
"$bin/orvix-hostsim" init --profile "$work/large.json" >/dev/null
echo
echo "Large host: 1000 switches, 4096 ports, 2000 port groups, 64 NICs, 256 interfaces, 10000 routes ($runs runs each):"
"$bin/orvix-bench-timer" "$runs" \
    "baseline (dlopen + one call)" "$bin/orvix-bench-baseline" \
    "network ip get" "$cli network ip get" \
    "network vswitch standard list" "$cli network vswitch standard list" \
    "network vswitch standard portgroup list" "$cli network vswitch standard portgroup list" \
    "network vswitch standard add" "$cli network vswitch standard add $scratch" \
    "network vswitch standard remove" "$cli network vswitch standard remove $scratch" \
    "... portgroup policy failover get" "$cli network vswitch standard portgroup policy failover get -p vSwitch500-pg1" \
    "network nic list" "$cli network nic list" \
    "network nic get" "$cli network nic get -n hwnic63" \
    "network nic stats get" "$cli network nic stats get -n hwnic63" \
    "network nic up" "$cli network nic up -n hwnic63"
