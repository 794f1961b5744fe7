#!/usr/bin/env bash
# Checks that every C++ source the project tracks is formatted as
# .clang-format says; with --fix, reformats them instead. Part of ./dev test,
# so a badly formatted file fails the suite before anything is built.
set -euo pipefail
cd "$(dirname "$0")/.."
mapfile -t files < <(git ls-files '*.cpp' '*.h')
if [ "${1:-}" = --fix ]; then
    clang-format -i "${files[@]}"
    exit 0
fi
report=$(mktemp)
trap 'rm -f "$report"' EXIT
if ! clang-format --dry-run --Werror "${files[@]}" 2>"$report"; then
    grep -E '^[^ ].*: (error|warning):' "$report" | cut -d: -f1 | sort -u | sed 's/^/  /' >&2 || true
    echo "error: the files above are not formatted; run ./dev format" >&2
    exit 1
fi
