#!/usr/bin/env bash
# Times orvixcli commands as whole processes beside a baseline process (one
# that starts, dlopens one shared library and calls one function), measured in
# the same run and interleaved with it. Prints medians and their ratios to the
# baseline, on the default host and on a large one (1000 standard and 8
# distributed switches, 4096 ports, 2000 port groups, 64 NICs, 256 interfaces
# on 16 netstacks, 10000 routes, 2000 neighbors, 5000 connections, 500 VMs;
# made by orvix-bench-make-profile). Run it through `./dev bench` so that
# everything is built.
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
    "network nic up" "$cli network nic up -n hwnic0" \
    "network ip interface list" "$cli network ip interface list" \
    "network ip interface ipv4 get" "$cli network ip interface ipv4 get" \
    "network ip netstack list" "$cli network ip netstack list" \
    "network ip interface add" "$cli network ip interface add -p Storage -i pld200" \
    "network ip interface remove" "$cli network ip interface remove -i pld200" \
    "network ip route ipv4 list" "$cli network ip route ipv4 list" \
    "network ip route ipv6 list" "$cli network ip route ipv6 list" \
    "network ip neighbor list" "$cli network ip neighbor list" \
    "network ip connection list" "$cli network ip connection list" \
    "network ip dns server list" "$cli network ip dns server list" \
    "network ip route ipv4 add" "$cli network ip route ipv4 add -n 198.51.100.128/25 -g 192.0.2.1" \
    "network ip route ipv4 remove" "$cli network ip route ipv4 remove -n 198.51.100.128/25 -g 192.0.2.1" \
    "network firewall get" "$cli network firewall get" \
    "network firewall ruleset list" "$cli network firewall ruleset list" \
    "network firewall ruleset rule list" "$cli network firewall ruleset rule list" \
    "... ruleset allowedip add" "$cli network firewall ruleset allowedip add -r sshServer -i 203.0.113.250" \
    "... ruleset allowedip remove" "$cli network firewall ruleset allowedip remove -r sshServer -i 203.0.113.250"

# The kernel's own listing of as many routes, for comparison: a network
# namespace made for this run (and deleted with it) holding 10000 routes on
# its loopback device. Needs root and iproute2; skipped otherwise.
kernel=()
if [[ $(id -u) == 0 ]] && command -v ip >/dev/null && ip netns add "orvixbench$$" 2>/dev/null; then
    netns=orvixbench$$
    trap 'ip netns delete "$netns" 2>/dev/null; rm -rf "$work"' EXIT
    for ((i = 0; i < 10000; i++)); do
        echo "route add 10.$((i / 256)).$((i % 256)).0/24 dev lo"
    done >"$work/routes.batch"
    if ip -n "$netns" link set lo up && ip -n "$netns" -batch "$work/routes.batch" &&
        [[ $(ip -n "$netns" route show | wc -l) -ge 10000 ]]; then
        kernel=("ip route show (10000 routes, own namespace)" "ip -n $netns route show")
    else
        echo "(no kernel routing comparison: the namespace's routes could not be set up)" >&2
    fi
fi

export ORVIX_HOST_DB=$work/large.db
"$bin/orvix-bench-make-profile" >"$work/large.json"
"$bin/orvix-hostsim" init --profile "$work/large.json" >/dev/null
echo
echo "Large host: 1000 standard and 8 distributed switches, 4096 ports, 500 VMs, 2000 port groups, 64 NICs, 256 interfaces, 16 netstacks, 10000 routes, 2000 neighbors, 5000 connections, 200 firewall rulesets with 5000 rules ($runs runs each):"
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
    "network nic up" "$cli network nic up -n hwnic63" \
    "network ip interface list" "$cli network ip interface list" \
    "network ip interface ipv4 get" "$cli network ip interface ipv4 get" \
    "network ip netstack list" "$cli network ip netstack list" \
    "network ip interface remove" "$cli network ip interface remove -i pld255" \
    "network ip interface add" "$cli network ip interface add -p vSwitch255-pg0 -N stack15 -i pld255" \
    "${kernel[@]}" \
    "network ip route ipv4 list" "$cli network ip route ipv4 list" \
    "network ip route ipv6 list" "$cli network ip route ipv6 list" \
    "network ip neighbor list" "$cli network ip neighbor list" \
    "network ip connection list" "$cli network ip connection list" \
    "network ip dns server list" "$cli network ip dns server list" \
    "network ip route ipv4 add" "$cli network ip route ipv4 add -n 203.0.113.128/25 -g 198.51.100.2" \
    "network ip route ipv4 remove" "$cli network ip route ipv4 remove -n 203.0.113.128/25 -g 198.51.100.2" \
    "network firewall get" "$cli network firewall get" \
    "network firewall ruleset list" "$cli network firewall ruleset list" \
    "network firewall ruleset rule list" "$cli network firewall ruleset rule list" \
    "... ruleset allowedip add" "$cli network firewall ruleset allowedip add -r ruleset199 -i 203.0.113.250" \
    "... ruleset allowedip remove" "$cli network firewall ruleset allowedip remove -r ruleset199 -i 203.0.113.250"

# Ports, VMs and distributed switches: the single-port command looks its port
# up directly, so it should cost the same on both hosts; the listings walk
# every port once. On the large host switch n (the 1000 standard ones, then
# dvSwitch0 to dvSwitch7) has the port ids from (n + 2) * 2^16 + 1 on: the
# port timed is DV port 40 of dvSwitch7, a VM port; world 3000200 (vm200) has
# ports on four standard switches and on dvSwitch3.
export ORVIX_HOST_DB=$work/default.db
echo
echo "Ports, VMs and distributed switches, default host ($runs runs each):"
"$bin/orvix-bench-timer" "$runs" \
    "baseline (dlopen + one call)" "$bin/orvix-bench-baseline" \
    "network vm list" "$cli network vm list" \
    "network vm port list" "$cli network vm port list -w 1049601" \
    "network port stats get" "$cli network port stats get -p 67108870" \
    "network vswitch dvs orvix list" "$cli network vswitch dvs orvix list"
export ORVIX_HOST_DB=$work/large.db
echo
echo "Ports, VMs and distributed switches, large host: 8 distributed switches, 500 VMs, 4096 ports ($runs runs each):"
"$bin/orvix-bench-timer" "$runs" \
    "baseline (dlopen + one call)" "$bin/orvix-bench-baseline" \
    "network vm list" "$cli network vm list" \
    "network vm port list" "$cli network vm port list -w 3000200" \
    "network port stats get" "$cli network port stats get -p $(((1000 + 7 + 2) * 65536 + 41))" \
    "network vswitch dvs orvix list" "$cli network vswitch dvs orvix list"
echo
bench/batch.sh
