#!/usr/bin/env bash
# The generated manual pages: groff reads every one without a single warning,
# man renders them, and together they document every command of the tree
# with its options, as help lists them.
#
#   manpages.sh BUILD_DIR
set -euo pipefail
build=$(cd "$1" && pwd)
pages=$build/share/man/man8
cli=$build/bin/orvixcli
failures=0
fail() {
    echo "FAIL: $*" >&2
    failures=$((failures + 1))
}

shopt -s nullglob
all=("$pages"/*.8)
[ "${#all[@]}" -gt 1 ] || { echo "no manual pages in $pages" >&2; exit 1; }
for page in "${all[@]}"; do
    warnings=$(groff -man -ww -z "$page" 2>&1) || fail "groff failed on ${page##*/}"
    [ -z "$warnings" ] || fail "groff warns on ${page##*/}: $warnings"
    gz=$build/docs/man8/${page##*/}.gz
    cmp -s <(gzip -dc "$gz") "$page" || fail "${gz##*/} does not hold ${page##*/}"
done

# Rendered as a reader sees them, every page in one text.
rendered=$(for page in "${all[@]}"; do MANWIDTH=200 man -l "$page" 2>&1; done)

# Every command of the tree, walked through help, appears with its path and
# every option with its long name, hyphens intact.
walk() {
    local help
    help=$("$cli" "$@" --help)
    if grep -q '^Cmd options:\|^Description:' <<<"$help"; then
        grep -qF -- "orvixcli $*" <<<"$rendered" || fail "command '$*' is in no page"
        while read -r option; do
            grep -qF -- "$option" <<<"$rendered" || fail "option $option of '$*' is in no page"
        done < <(grep -o -- '--[a-zA-Z0-9-]*' <<<"$(sed -n '/^Cmd options:/,$p' <<<"$help")" | sort -u)
        commands=$((commands + 1))
        return
    fi
    local child
    for child in $(sed -n '/^Available \(Namespaces\|Commands\):/,/^$/p' <<<"$help" | awk 'NF && !/:$/ {print $1}'); do
        walk "$@" "$child"
    done
}
commands=0
walk network
[ "$commands" -ge 100 ] || fail "only $commands commands found through help"

# The program's page has the sections a reader looks for.
program=$(MANWIDTH=200 man -l "$pages/orvixcli.8")
for section in SYNOPSIS OPTIONS FORMATTERS "EXIT STATUS" ENVIRONMENT FILES "SEE ALSO"; do
    grep -q "^$section" <<<"$program" || fail "orvixcli(8) has no $section section"
done

if [ "$failures" -gt 0 ]; then
    echo "$failures manual page check(s) failed" >&2
    exit 1
fi
echo "manual pages: ${#all[@]} pages, $commands commands, no warnings"
