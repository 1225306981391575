#!/usr/bin/env bash
# haldensim: creating, exporting, importing and resetting the host, fault
# injection, refusals and their exit statuses.
. "$CLI_TEST_LIB"

DEFAULT_HOST="$(cd "$(dirname "${BASH_SOURCE[0]}")/../../data" && pwd)/default-host.json"
WORK="$CLI_TEST_DIR/work"
mkdir -p "$WORK"

check "help for the tool and for each command"
sim --help
expect_status 0
expect_stdout_contains "Usage: haldensim [--host PATH] <command> [options]"
for command in init export import "fault add"; do
  sim $command --help
  expect_status 0
  expect_stdout_contains "Usage: haldensim [--host PATH] $command"
done
[ ! -e "$HALDEN_HOST" ] || _fail "help created a host"

check "first use creates the default host, its directories included"
sim --host "$WORK/a/b/host.db" export
expect_status 0
expect_stdout "$(cat "$DEFAULT_HOST")"
[ "$(ls -A "$WORK/a/b")" = "host.db" ] || _fail "beside the host at --host: $(ls -A "$WORK/a/b")"
[ ! -e "$HALDEN_HOST" ] || _fail "--host did not take precedence over HALDEN_HOST"

check "concurrent first use: every process sees the complete default host"
for i in 1 2 3 4 5 6; do
  "$HALDENSIM" --host "$WORK/race/host.db" export >"$WORK/race-$i.json" 2>&1 &
done
wait
for i in 1 2 3 4 5 6; do
  cmp -s "$WORK/race-$i.json" "$DEFAULT_HOST" || _fail "process $i saw: $(head -c 300 "$WORK/race-$i.json")"
done
for name in "$WORK"/race/*; do [[ "$name" != *.new-* ]] || _fail "a host in the making was left: $name"; done

check "import reads a file, or standard input for -"
sed 's/"defaultAction": "DROP"/"defaultAction": "PASS"/' "$DEFAULT_HOST" >"$WORK/pass.json"
sim import "$WORK/pass.json"
expect_status 0
expect_stdout_empty
sim export
expect_stdout "$(cat "$WORK/pass.json")"
sim init
run bash -c '"$HALDENSIM" import - <"$1"' - "$WORK/pass.json"
expect_status 0
sim export
expect_stdout "$(cat "$WORK/pass.json")"

check "a bad description is refused with its path and changes nothing"
sim export
before=$OUT
sed '0,/"portBegin": 22/s//"portBegin": 70000/' "$DEFAULT_HOST" >"$WORK/bad-port.json"
sim import "$WORK/bad-port.json"
expect_status 2
expect_stderr "haldensim: bad description: firewall.rulesets[0].rules[0].portBegin: expected an integer from 0 to 65535"
echo '{"format": 1, "firewall": {"enabled": true}}' >"$WORK/bad-missing.json"
sim import "$WORK/bad-missing.json"
expect_status 2
expect_stderr "haldensim: bad description: firewall.defaultAction: missing required field"
echo '{"format": 1, "modules": [' >"$WORK/bad-json.json"
sim init --from "$WORK/bad-json.json"
expect_status 2
expect_stderr_contains "haldensim: bad description: not valid JSON: parse error at line 2"
sim import "$WORK/none.json"
expect_status 2
expect_stderr "haldensim: cannot read $WORK/none.json: it does not exist"
sim export
expect_stdout "$before"

check "a description with bytes that are not UTF-8 is refused with their place"
sim export
before=$OUT
printf '{"format": 1,\n "modules": [{"name": "caf\xe9", "loaded": true}]}' >"$WORK/latin1.json"
sim import "$WORK/latin1.json"
expect_status 2
expect_stderr "haldensim: bad description: not valid UTF-8: the byte 0xE9 at line 2, column 27"

check "import and init --from read regular files only, of at most 256 MiB"
mkfifo "$WORK/fifo"
truncate -s 300M "$WORK/huge.json"  # sparse: refused by its size, nothing is read
for refusal in "$WORK: it is a directory" "$WORK/fifo: it is a FIFO, not a regular file" \
               "/dev/zero: it is a device, not a regular file" "$WORK/huge.json: it is larger than 256 MiB"; do
  run timeout 20 "$HALDENSIM" import "${refusal%%: *}"
  expect_status 2
  expect_stderr "haldensim: cannot read $refusal"
done
run timeout 20 "$HALDENSIM" init --from "$WORK/fifo"
expect_status 2
sim export
expect_stdout "$before"

check "init resets: default, empty, or from a description; faults and exec log go"
sim fault add --operation Trellis_Exec --status 1
sim init --empty
expect_status 0
sim export
expect_stdout_contains '"modules": []'
expect_stdout_contains '"rulesets": []'
expect_stdout_contains '"faults": []'
sim init --from "$WORK/pass.json"
sim export
expect_stdout "$(cat "$WORK/pass.json")"
sim init
sim export
expect_stdout "$(cat "$DEFAULT_HOST")"
sim init --empty --from "$WORK/pass.json"
expect_status 2

check "init --scale makes a host N times the default's size; a bad scale changes nothing"
sim init --scale 4
expect_status 0
cli network vswitch standard portgroup list
expect_stdout_matches "Guest Network-3 +switch3 +2 +0"
sim export
scaled=$OUT
for args in "--scale 0" "--scale 1001" "--scale x" "--scale 2 --empty" "--from $WORK/pass.json --scale 2"; do
  sim init $args
  expect_status 2
done
sim export
expect_stdout "$scaled"

check "fault add, list and clear"
sim fault add --operation Trellis_Exec --status 3 --times 2
expect_status 0
sim fault list --armed
expect_status 0
expect_stdout "Trellis_Exec  status 3, 2 more calls"
sim fault list
expect_stdout_matches "^Trellis_Exec +status 3, 2 more calls$"
sim fault add --operation=Trellis_Exec --status=-5
sim fault list --armed
expect_stdout "Trellis_Exec  status -5, every call"
sim fault clear
expect_status 0
sim fault list --armed
expect_stdout_empty

check "bad fault requests are refused"
sim fault add --operation Trellis_Exek --status 1
expect_status 2
expect_stderr 'haldensim: Unknown operation "Trellis_Exek"'
sim fault add --operation Trellis_Exec --message "busy"
expect_status 2
expect_stderr "haldensim: Trellis_Exec takes a status, not a message"
sim fault add --operation Trellis_Exec --status 0
expect_status 2
expect_stderr "haldensim: Trellis_Exec takes a status other than 0"
sim fault add --operation Trellis_Exec --status 1 --times 0
expect_status 2
expect_stderr "haldensim: The number of calls must be at least 1"
sim fault add --operation Trellis_Exec --status 1 --times two
expect_status 2
expect_stderr 'haldensim: --times expects an integer, not "two" (see haldensim --help)'
sim fault add --operation Trellis_Exec --status 1 --message x
expect_status 2
expect_stderr "haldensim: fault add needs --message or --status (see haldensim --help)"
sim fault add --status 1
expect_status 2
expect_stderr "haldensim: fault add needs --operation (see haldensim --help)"
sim fault list --armed
expect_stdout_empty

check "a fault message must be valid UTF-8, not empty, without control characters"
for case in $'\xff|is not valid UTF-8' '|must not be empty' $'two\nlines|contains the control character U+000A'; do
  sim fault add --operation FirewallRuleset::Enable --message "${case%%|*}"
  expect_status 2
  expect_stderr "haldensim: The fault message ${case#*|}"
done
sim fault list --armed
expect_stdout_empty

check "usage errors exit with 2"
for args in "" "frobnicate" "--bogus export" "export extra" "import" "fault" "fault remove" "fault list --all" "--host"; do
  sim $args
  expect_status 2
  expect_stderr_contains "haldensim: "
done

check "a host path must name a file; a relative XDG_STATE_HOME is ignored; --host once"
sim --host "$WORK/made/" export
expect_status 2
expect_stderr "haldensim: Cannot open the host $WORK/made/: the path names a directory, not a file"
run env HALDEN_HOST="$WORK/made/" "$HALDENCLI" network firewall get
expect_status 2
expect_stderr "Error: Cannot open the host $WORK/made/: the path names a directory, not a file"
[ ! -e "$WORK/made" ] || fail_check "the refusal created $WORK/made"
mkdir -p "$WORK/cwd"
run env -C "$WORK/cwd" -u HALDEN_HOST XDG_STATE_HOME=state HOME="$WORK/home" "$HALDENSIM" export
expect_status 0
[ -f "$WORK/home/.local/state/halden/host.db" ] || fail_check "no host under HOME"
[ ! -e "$WORK/cwd/state" ] || fail_check "the relative XDG_STATE_HOME was used"
sim --host "$WORK/one.db" --host="$WORK/two.db" export
expect_status 2
expect_stderr "haldensim: --host is given twice (see haldensim --help)"

check "a file that is not a host is refused and left alone"
printf 'just some notes\n' >"$WORK/notes.txt"
cp "$WORK/notes.txt" "$WORK/notes.orig"
sim --host "$WORK/notes.txt" export
expect_status 2
expect_stderr "haldensim: Cannot open the host $WORK/notes.txt: it is not a host store (file is not a database)"
sim --host "$WORK/notes.txt" init
expect_status 2
cmp -s "$WORK/notes.txt" "$WORK/notes.orig" || _fail "the file was changed"

finish
