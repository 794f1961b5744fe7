#!/usr/bin/env bash
# Builds the Debian package, checks it with lintian, installs it on this
# machine, runs the installed programs with an empty environment and purges
# the package again, leaving the machine as it found it.
#
#   tests/package/check-package.sh SOURCE_DIR
#
# Exit status 77 (a skipped test) when not root or without dpkg.
set -euo pipefail
source_dir=${1:?usage: check-package.sh SOURCE_DIR}
store=/var/lib/orvixcli/host.db

if [ "$(id -u)" -ne 0 ]; then
    echo "skipped: installing a package needs root" >&2
    exit 77
fi
if ! command -v dpkg >/dev/null; then
    echo "skipped: dpkg is missing" >&2
    exit 77
fi
# An installation the test did not make holds someone's host: never purge it.
status=$(dpkg-query -W -f='${db:Status-Status}' orvixcli 2>/dev/null || true)
if [ -n "$status" ] && [ "$status" != not-installed ]; then
    echo "the orvixcli package is on this machine already ($status); remove it first (dpkg --purge orvixcli)" >&2
    exit 1
fi

fail() {
    echo "FAILED: $*" >&2
    exit 1
}

deb=$("$source_dir/dev" package | tail -n 1)
[ -f "$deb" ] || fail "./dev package printed no package: '$deb'"
case "$(basename "$deb")" in
orvixcli_*_amd64.deb) ;;
*) fail "unexpected package name $deb" ;;
esac

# Errors fail the test; warnings and notes are shown for the record.
echo "lintian $(basename "$deb"):"
lintian --fail-on error --display-info --tag-display-limit 0 "$deb" || fail "lintian found errors"

work=$(mktemp -d)
cleanup() {
    dpkg --purge orvixcli >/dev/null 2>&1 || true
    rm -rf "$work"
}
trap cleanup EXIT
dpkg -i "$deb" >"$work/dpkg.log" 2>&1 || { cat "$work/dpkg.log" >&2; fail "dpkg -i"; }
[ -f "$store" ] || fail "installing did not make the host store $store"

# Nothing of the build tree or of this shell may help the installed programs.
run() {
    (cd / && env -i "$@")
}
out=$(run /usr/bin/orvixcli network ip get) || fail "orvixcli network ip get: status $?"
grep -q '^   IPv6 Enabled: \(true\|false\)$' <<<"$out" || fail "orvixcli network ip get printed: $out"
out=$(run orvixcli network vswitch standard list --formatter=json 2>&1) || fail "vswitch standard list: $out"
grep -q '"Name": "vSwitch0"' <<<"$out" || fail "vswitch standard list printed: $out"
[ "$(run /usr/bin/orvix-hostsim path)" = "$store" ] || fail "orvix-hostsim path is not $store"
run /usr/bin/orvix-hostsim graph >"$work/host.dot" || fail "orvix-hostsim graph"
dot -Tsvg "$work/host.dot" >/dev/null 2>"$work/dot.err" && [ ! -s "$work/dot.err" ] || fail "dot: $(cat "$work/dot.err")"
# A change goes to the machine's host and is seen by the next process.
run /usr/bin/orvixcli network vswitch standard add --vswitch-name=PackageTest || fail "vswitch standard add"
run /usr/bin/orvixcli network vswitch standard list | grep -q 'PackageTest' || fail "the new switch is not listed"
# Every installed library is one of ours in the private folder.
for file in $(dpkg -L orvixcli | grep '\.so$'); do
    case "$file" in /usr/lib/orvixcli/*) ;; *) fail "library outside /usr/lib/orvixcli: $file" ;; esac
done

dpkg --purge orvixcli >"$work/dpkg.log" 2>&1 || { cat "$work/dpkg.log" >&2; fail "dpkg --purge"; }
[ ! -e /usr/bin/orvixcli ] || fail "/usr/bin/orvixcli is left after purging"
[ ! -e /var/lib/orvixcli ] || fail "/var/lib/orvixcli is left after purging: $(ls -A /var/lib/orvixcli)"
echo "package $(basename "$deb") installs, runs with an empty environment and purges cleanly"
