#!/usr/bin/env bash
# Shell completion as a user meets it. The scripts orvixcli prints are loaded
# into real shells: bash's completion function is called the way bash calls
# it (COMP_WORDS split at "=" as bash splits them), and interactive bash and
# zsh sessions under tmux are sent Tab. The host object names expected are
# read from the fixture host through ordinary list commands.
#
#   completion.sh BUILD_DIR PROFILE
set -euo pipefail
build=$(cd "$1" && pwd)
profile=$2
bin=$build/bin
work=$(mktemp -d)
socket=
trap 'for s in bash zsh; do tmux -L "orvix-completion-$$-$s" kill-server 2>/dev/null || true; done; rm -rf "$work"' EXIT
export ORVIX_HOST_DB=$work/host.db
"$bin/orvix-hostsim" init --profile "$profile" >/dev/null
"$bin/orvixcli" --completion bash >"$work/orvixcli.bash"
"$bin/orvixcli" --completion zsh >"$work/_orvixcli"

failures=0
fail() {
    echo "FAIL: $*" >&2
    failures=$((failures + 1))
}

# The first column of a listing in csv, without its header.
names_of() {
    "$bin/orvixcli" "$@" --formatter=csv | tail -n +2 | cut -d, -f1
}

# What the bash completion function puts in COMPREPLY, one a line, for the
# words given (the last is the word under the cursor).
bash_offers() {
    bash --norc --noprofile -c '
        source "$1"; shift
        COMP_WORDS=("$@"); COMP_CWORD=$(($# - 1)); COMP_LINE="$*"; COMP_POINT=${#COMP_LINE}
        _orvixcli
        for reply in "${COMPREPLY[@]}"; do printf "%s\n" "$reply"; done' \
        bash "$work/orvixcli.bash" "$bin/orvixcli" "$@"
}

# expect_same WHAT EXPECTED ACTUAL: the two lists hold the same lines.
expect_same() {
    if [ "$(sort <<<"$2")" != "$(sort <<<"$3")" ]; then
        fail "$1: expected [$(tr '\n' ' ' <<<"$2")] got [$(tr '\n' ' ' <<<"$3")]"
    fi
}

nics=$(names_of network nic list)
sriov_nics=$(names_of network sriovnic list)
rulesets=$(names_of network firewall ruleset list)
portgroups=$(names_of network vswitch standard portgroup list)
[ -n "$nics" ] && [ -n "$rulesets" ] && [ -n "$sriov_nics" ] && grep -q ' ' <<<"$portgroups" ||
    { echo "the fixture host needs NICs, SR-IOV NICs, rulesets and a port group with a blank" >&2; exit 1; }

# Namespaces at the top and one level down.
expect_same "top level" "network" "$(bash_offers "")"
expect_same "network v" "$(printf 'vswitch\nvm')" "$(bash_offers network v)"
expect_same "network vswitch standard portgroup" "$(printf 'list\nadd\nremove\nset\npolicy')" \
    "$(bash_offers network vswitch standard portgroup "")"

# A command's options, long and short, without those already given.
offered=$(bash_offers network vswitch standard portgroup add -p Lab "")
expect_same "portgroup add options after -p" "$(printf -- '--vswitch-name\n-v\n--formatter\n--help\n-h')" "$offered"

# Enum values and bool words, in both option forms.
expect_same "load-balancing values" "$(printf 'portid\niphash\nmac\nexplicit')" \
    "$(bash_offers network vswitch standard policy failover set --load-balancing "")"
expect_same "failback=" "$(printf 'true\nfalse')" \
    "$(bash_offers network vswitch standard policy failover set --failback = "")"
expect_same "--formatter=j" "json" "$(bash_offers network nic list --formatter = j)"

# Host objects: NICs by both forms, SR-IOV NICs only under sriovnic, rulesets.
expect_same "nic-name" "$nics" "$(bash_offers network nic get --nic-name "")"
expect_same "nic-name=" "$nics" "$(bash_offers network nic get --nic-name = "")"
expect_same "sriovnic nic-name" "$sriov_nics" "$(bash_offers network sriovnic vf list -n "")"
expect_same "ruleset-id" "$rulesets" "$(bash_offers network firewall ruleset set --ruleset-id "")"
first_ruleset=$(head -n 1 <<<"$rulesets")
expect_same "ruleset-id prefix" "$(grep "^${first_ruleset:0:4}" <<<"$rulesets")" \
    "$(bash_offers network firewall ruleset set -r "${first_ruleset:0:4}")"

# A name with a blank comes back escaped for the command line, and a word
# typed with a backslash still matches it.
blank_group=$(grep ' ' <<<"$portgroups" | head -n 1)
expect_same "escaped port group" "$(printf '%q' "$blank_group")" \
    "$(bash_offers network vswitch standard portgroup remove -p "$(printf '%q' "${blank_group%% *}") ")"

# A host that cannot be read offers nothing and prints nothing.
offered=$(ORVIX_HOST_DB=/proc/version bash_offers network nic get -n "" 2>&1)
expect_same "unreadable host" "" "$offered"

# Interactive shells: type, press Tab, read the screen.
# start_shell SHELL ARGS...: each shell has its own tmux server.
# A shell may drop what is typed before it first prompts, so nothing is typed
# until its prompt shows (a loaded machine can take seconds to get there).
start_shell() {
    socket=orvix-completion-$$-$1
    tmux -L "$socket" -f /dev/null new-session -d -x 200 -y 50 \
        env -i HOME="$work" TERM=xterm PATH="$bin:/usr/bin:/bin" ORVIX_HOST_DB="$ORVIX_HOST_DB" "$@"
    for _ in $(seq 100); do
        [ -n "$(tmux -L "$socket" capture-pane -p -t 0 | tr -d '[:space:]')" ] && return 0
        sleep 0.1
    done
    fail "$1 did not prompt"
}
type_keys() { tmux -L "$socket" send-keys -t 0 "$@"; }
# screen_shows TEXT: waits up to 10 s for TEXT on the screen (whose lines
# tmux gives without their trailing blanks).
screen_shows() {
    for _ in $(seq 100); do
        tmux -L "$socket" capture-pane -p -t 0 | grep -qF -- "$1" && return 0
        sleep 0.1
    done
    return 1
}
sriov_nic=$(head -n 1 <<<"$sriov_nics")

start_shell bash --norc --noprofile
type_keys "PS1='$ '; source $work/orvixcli.bash; echo loaded" Enter
screen_shows loaded || fail "bash did not load the script"
type_keys "orvixcli network vswitch standard portgroup add --vsw" Tab
screen_shows "add --vswitch-name" || fail "bash: Tab did not complete --vswitch-name"
type_keys C-u "orvixcli network sriovnic vf list --nic-name=" Tab
screen_shows "--nic-name=$sriov_nic" || fail "bash: Tab did not complete the SR-IOV NIC"

start_shell zsh -f
type_keys "PS1='%% '; fpath=($work \$fpath); autoload -Uz compinit; compinit -u -d $work/zcompdump; echo loaded" Enter
screen_shows loaded || fail "zsh did not load compinit"
type_keys "orvixcli network fire" Tab
screen_shows "network firewall" || fail "zsh: Tab did not complete the firewall namespace"
type_keys C-u "orvixcli network sriovnic vf list --nic-name=" Tab
screen_shows "--nic-name=$sriov_nic" || fail "zsh: Tab did not complete the SR-IOV NIC"
# Ambiguous: the first Tab inserts what the NICs' names share, the second
# lists them all below the line.
type_keys C-u "orvixcli network nic get -n " Tab
sleep 1
type_keys Tab
screen_shows "$(tail -n 1 <<<"$nics")" || fail "zsh: Tab did not list the NICs"

if [ "$failures" -gt 0 ]; then
    echo "$failures completion check(s) failed" >&2
    exit 1
fi
echo "completion: all checks passed"
