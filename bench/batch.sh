#!/usr/bin/env bash
# Batch mode against separate processes, on the large host, in one run:
# 1000 `network vswitch standard portgroup add` lines (distinct names, all on
# vSwitch0; port groups take no ports) run once as one `orvixcli --batch
# FILE` and once as 1000 processes. Each way starts from a fresh copy of the
# same store. Prints both times and their ratio. Run it through
# `./dev bench` so that everything is built.
#
#   bench/batch.sh [LINES]       (default 1000)
set -euo pipefail
cd "$(dirname "$0")/.."
lines=${1:-1000}
bin=build/default/bin
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
unset ORVIX_HOST_PROFILE ORVIX_HOST_SYNC

export ORVIX_HOST_DB=$work/large.db
"$bin/orvix-bench-make-profile" >"$work/large.json"
"$bin/orvix-hostsim" init --profile "$work/large.json" >/dev/null
for ((i = 0; i < lines; i++)); do
    echo "network vswitch standard portgroup add -v vSwitch0 -p batchPg$i"
done >"$work/lines.txt"

# Seconds since the epoch, with nanoseconds, and the seconds since a start.
now() { date +%s.%N; }
since() { awk -v start="$1" -v end="$(now)" 'BEGIN { printf "%.3f", end - start }'; }

export ORVIX_HOST_DB=$work/batch.db
"$bin/orvix-hostsim" --db "$work/large.db" dump >"$work/dump.json"
"$bin/orvix-hostsim" init --profile "$work/dump.json" >/dev/null
start=$(now)
"$bin/orvixcli" --batch "$work/lines.txt"
batch=$(since "$start")

export ORVIX_HOST_DB=$work/processes.db
"$bin/orvix-hostsim" init --profile "$work/dump.json" >/dev/null
start=$(now)
while read -r -a words; do
    "$bin/orvixcli" "${words[@]}"
done <"$work/lines.txt"
processes=$(since "$start")

# Both ways made the same host.
for db in batch processes; do
    ORVIX_HOST_DB=$work/$db.db "$bin/orvixcli" network vswitch standard portgroup list --formatter=csv |
        grep -c '^batchPg' >"$work/$db.count"
done
cmp -s "$work/batch.count" "$work/processes.count" || {
    echo "batch and processes made different hosts" >&2
    exit 1
}

echo "Large host, $lines x network vswitch standard portgroup add ($(nproc) cores):"
printf '  %-28s %8.3f s\n' "one batch (--batch FILE)" "$batch" "$lines processes" "$processes"
printf '  %-28s %8.1fx\n' "batch speed-up" "$(awk -v p="$processes" -v b="$batch" 'BEGIN { print p / b }')"
