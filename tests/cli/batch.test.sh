#!/usr/bin/env bash
# haldencli --batch through the binary: a batch prints exactly what its
# command lines print when run one by one, each line sees what the lines
# before it changed, and standard input works as a batch.
. "$CLI_TEST_LIB"

BATCH="$CLI_TEST_DIR/batch.txt"

check "a batch prints, on both streams and in their order, what its lines print run one by one"
cat >"$BATCH" <<'EOF'
network firewall get
--formatter json network firewall ruleset list   # a comment
network firewall ruleset set -r nope -e true
network vswitch standard portgroup list --vswitch-name 'switch0'

network firewall ruleset set --ruleset-id "dns"
--formatter=table network vswitch standard list
--formatter keyvalue network vswitch standard portgroup list
network firewall ruleset allowedip add -r webAccess -i '192.0.2.300'
network firewall
EOF
: >"$CLI_TEST_DIR/one-by-one"
while IFS= read -r line; do
  eval "set -- $line"  # the shell's own word splitting, as the reference
  [ $# -gt 0 ] && "$HALDENCLI" "$@" >>"$CLI_TEST_DIR/one-by-one" 2>&1
done <"$BATCH"
run sh -c '"$0" --batch "$1" --force >"$2" 2>&1' "$HALDENCLI" "$BATCH" "$CLI_TEST_DIR/batch"
expect_status 2
cmp -s "$CLI_TEST_DIR/one-by-one" "$CLI_TEST_DIR/batch" ||
  fail_check "$(diff "$CLI_TEST_DIR/one-by-one" "$CLI_TEST_DIR/batch" | head -20)"

check "a line sees what the line before it changed"
cat >"$BATCH" <<'EOF'
network firewall ruleset set -r sshServer -e true
network firewall ruleset list
EOF
cli --batch "$BATCH"
expect_status 0
expect_stdout_matches "^sshServer +true$"
expect_stderr_empty

check "a batch on standard input stops at the first failing line"
printf 'network firewall get\nnetwork firewall ruleset set -r nope -e true\nnetwork firewall get\n' >"$BATCH"
run sh -c '"$0" --batch - <"$1"' "$HALDENCLI" "$BATCH"
expect_status 1
expect_stdout "Firewall
   Loaded: true
   Enabled: true
   DefaultAction: DROP"
expect_stderr "Invalid Ruleset Id.
haldencli: batch stopped at line 2 (status 1)."

finish
