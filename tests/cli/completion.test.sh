#!/usr/bin/env bash
# Shell completion: the bash script driven on real command lines (the words
# bash hands to the completion function, the replies it gets back), the
# hidden --complete-names entry on the host, and the other shells' scripts.
. "$CLI_TEST_LIB"

SCRIPT="$CLI_TEST_DIR/completion.bash"

# Runs the completion of a command line whose words are the arguments, the
# last one being the word under the cursor ("" for a new word), with the
# built haldencli as the program word. OUT holds the replies, one a line.
complete_words() {
  LAST_COMMAND="completion of: haldencli $*"
  OUT=$(bash --norc -c '
    source "$0" || exit 3
    COMP_WORDS=("$@")
    COMP_CWORD=$(( ${#COMP_WORDS[@]} - 1 ))
    COMP_LINE="$*"
    COMP_POINT=${#COMP_LINE}
    COMPREPLY=()
    _haldencli haldencli "${COMP_WORDS[COMP_CWORD]}" "${COMP_WORDS[COMP_CWORD-1]}"
    (( ${#COMPREPLY[@]} == 0 )) || printf "%s\n" "${COMPREPLY[@]}"
  ' "$SCRIPT" "$HALDENCLI" "$@" 2>"$CLI_TEST_DIR/stderr")
  STATUS=$?
  ERR=$(cat "$CLI_TEST_DIR/stderr")
}

check "the script registers its function and holds the options a command takes from the host"
cli --completion bash
expect_status 0
expect_stderr_empty
printf '%s\n' "$OUT" >"$SCRIPT"
expect_stdout_matches "^    'network ip netstack set'\) _haldencli_type=command; _haldencli_list=\('--netstack' '-N' .*'--ipv6enabled' '-i'\) ;;$"
run bash --norc -c 'source "$1" && complete -p haldencli' _ "$SCRIPT"
expect_status 0
expect_stdout "complete -F _haldencli haldencli"

check "an unknown shell is refused as a usage error"
cli --completion tcsh
expect_status 2
expect_stderr_first_line "Error: Unknown shell 'tcsh' for --completion; choose bash, zsh or fish."
expect_stdout_empty
cli --completion bash network
expect_status 2

check "namespaces and commands complete level by level"
complete_words network vs
expect_stdout "vswitch"
complete_words network vswitch st
expect_stdout "standard"
complete_words network vswitch standard portgroup a
expect_stdout "add"
complete_words network firewall ""
expect_stdout_contains "ruleset"
expect_stdout_contains "get"
complete_words network nosuch ""
expect_stdout_empty
expect_stderr_empty

check "a command's long and short options complete"
complete_words network vswitch standard portgroup add --v
expect_stdout "--vswitch-name"
complete_words network vswitch standard portgroup add -
expect_stdout_contains "--portgroup-name"
expect_stdout_contains "-v"
expect_stdout_contains "--help"
complete_words network vswitch standard portgroup add --portgroup-name pg ""
expect_stdout_contains "--vswitch-name"

check "enumerated values complete: string enums and booleans"
complete_words network nic set --duplex ""
expect_stdout "full
half"
complete_words network nic set -n pnet0 --duplex h
expect_stdout "half"
complete_words network firewall ruleset set --enabled ""
expect_stdout "true
false"
complete_words network firewall ruleset set --enabled = t
expect_stdout "true"

check "the tool's own options and their values complete before the path"
complete_words --f
expect_stdout "--formatter
--force"
complete_words --formatter j
expect_stdout "json"
complete_words --formatter = ""
expect_stdout_contains "keyvalue"
complete_words --completion ""
expect_stdout "bash
zsh
fish"
complete_words --formatter json ne
expect_stdout "network"
mkdir -p "$CLI_TEST_DIR/jobs.d" && : >"$CLI_TEST_DIR/jobs.d/nightly.txt"
complete_words --batch "$CLI_TEST_DIR/jobs.d/ni"
expect_stdout "$CLI_TEST_DIR/jobs.d/nightly.txt"

check "host object names complete from the current host"
cli network vswitch standard list
expect_status 0
complete_words network vswitch standard portgroup add --vswitch-name ""
expect_stdout "switch0"
complete_words network ip interface ipv4 get -i ""
expect_stdout_contains "tsl0"
complete_words network firewall ruleset set --ruleset-id ss
expect_stdout "sshServer
sshClient"
complete_words network nic set -n ""
expect_stdout_contains "pnet0"
expect_stdout_contains "pnet1"

check "a port group with a blank in its name completes quoted"
complete_words network vswitch standard portgroup remove --portgroup-name Gu
expect_stdout 'Guest\ Network'
complete_words network vswitch standard portgroup remove --portgroup-name 'Guest\ N'
expect_stdout 'Guest\ Network'
complete_words network vswitch standard portgroup remove --portgroup-name '"Gu'
expect_stdout 'Guest Network'

check "names come from the host that --host names"
OTHER="$CLI_TEST_DIR/other.db"
cli --host "$OTHER" network vswitch standard add --vswitch-name spare
expect_status 0
complete_words --host "$OTHER" network vswitch standard portgroup add --vswitch-name ""
expect_stdout "switch0
spare"
complete_words --host = "$OTHER" network vswitch standard portgroup add --vswitch-name sp
expect_stdout "spare"

check "the names entry is hidden, and prints one name a line"
cli --help
expect_stdout_lacks "complete-names"
expect_stdout_contains "--completion=<str>"
cli --complete-names portgroup-name
expect_status 0
expect_stdout_contains "Guest Network"
expect_stdout_contains "Host Management"
cli --complete-names duplex
expect_status 0
expect_stdout_empty

check "the names entry on a missing host prints nothing and creates no host"
cli --host "$CLI_TEST_DIR/missing.db" --complete-names vswitch-name
expect_status 0
expect_stdout_empty
expect_stderr_empty
[ -z "$(ls "$CLI_TEST_DIR" | grep missing)" ] || fail_check "files were created: $(ls "$CLI_TEST_DIR")"
complete_words --host "$CLI_TEST_DIR/missing.db" network vswitch standard portgroup add --vswitch-name ""
expect_stdout_empty
[ -z "$(ls "$CLI_TEST_DIR" | grep missing)" ] || fail_check "completion created a host"

check "the names entry on a file that is no host prints nothing"
echo "not a host" >"$CLI_TEST_DIR/junk.db"
cli --host "$CLI_TEST_DIR/junk.db" --complete-names vswitch-name
expect_status 0
expect_stdout_empty
expect_stderr_empty
[ "$(cat "$CLI_TEST_DIR/junk.db")" = "not a host" ] || fail_check "the file was changed"

check "completing names leaves an armed fault armed"
sim fault add --operation VirtualSwitchInfoImpl::GetVirtualSwitches --message "busy" --times 1
expect_status 0
cli --complete-names vswitch-name
expect_stdout "switch0"
complete_words network vswitch standard portgroup add --vswitch-name ""
expect_stdout "switch0"
sim fault list
expect_stdout_contains "VirtualSwitchInfoImpl::GetVirtualSwitches"
cli network vswitch standard list
expect_status 1
expect_stderr_contains "busy"

check "the zsh script loads in zsh"
cli --completion zsh
expect_status 0
printf '%s\n' "$OUT" >"$CLI_TEST_DIR/completion.zsh"
if command -v zsh >/dev/null; then
  run zsh -f -c 'source "$1"' _ "$CLI_TEST_DIR/completion.zsh"
  expect_status 0
  expect_stderr_empty
else
  echo "(zsh is not installed: its script is not loaded)"
fi

check "the fish script loads in fish"
cli --completion fish
expect_status 0
expect_stdout_contains "complete -c 'haldencli' -n '__haldencli_at \\'network vswitch standard\\'' -a 'portgroup'"
printf '%s\n' "$OUT" >"$CLI_TEST_DIR/completion.fish"
if command -v fish >/dev/null; then
  run fish --no-config -c 'source $argv[1]; and complete -C "haldencli network vs"' "$CLI_TEST_DIR/completion.fish"
  expect_status 0
  expect_stderr_empty
  expect_stdout_contains "vswitch"
else
  echo "(fish is not installed: its script is not loaded)"
fi

finish
