# Shared helpers of the CLI tests. A test script sources this file, then
# alternates `check NAME`, a run (`cli ...`, `sim ...`, `run ...`) and
# expectations, and ends with `finish`:
#
#   . "$CLI_TEST_LIB"
#   check "an unknown ruleset is reported"
#   cli network firewall ruleset set -r nope -e true
#   expect_status 1
#   expect_stderr "Invalid Ruleset Id."
#   finish
#
# For a condition of its own, a check records a failure with fail_check:
#   [ -e "$HALDEN_HOST" ] || fail_check "no host was created"
#
# The environment gives HALDENCLI, HALDENSIM, TEST_PLUGIN and CLI_TEST_LIB.
# Each script works on its own host in a temporary directory (HALDEN_HOST),
# removed at exit; `fresh_host` starts that host anew.

set -u

: "${HALDENCLI:?HALDENCLI must name the haldencli binary}"

CLI_TEST_DIR=$(mktemp -d "${TMPDIR:-/tmp}/halden-cli-test.XXXXXX")
trap 'rm -rf "$CLI_TEST_DIR"' EXIT
export HALDEN_HOST="$CLI_TEST_DIR/host.db"
unset XDG_STATE_HOME

CHECK_NAME="(no check)"
CHECKS_PASSED=0
CHECKS_FAILED=0
CHECK_FAILED=0
STATUS=0
OUT=""
ERR=""
LAST_COMMAND=""

# Starts a named check; the expectations that follow belong to it.
check() {
  _close_check
  CHECK_NAME=$1
  CHECK_FAILED=0
  CHECK_OPEN=1
}

_close_check() {
  if [ "${CHECK_OPEN:-0}" = 1 ]; then
    if [ "$CHECK_FAILED" = 0 ]; then CHECKS_PASSED=$((CHECKS_PASSED + 1)); else CHECKS_FAILED=$((CHECKS_FAILED + 1)); fi
  fi
  CHECK_OPEN=0
}

# Runs a command; its standard output, standard error and exit status are
# kept in OUT, ERR and STATUS (a final line break removed, as $(...) does).
run() {
  LAST_COMMAND="$*"
  "$@" >"$CLI_TEST_DIR/stdout" 2>"$CLI_TEST_DIR/stderr" </dev/null
  STATUS=$?
  OUT=$(cat "$CLI_TEST_DIR/stdout")
  ERR=$(cat "$CLI_TEST_DIR/stderr")
}

cli() { run "$HALDENCLI" "$@"; }
sim() { run "${HALDENSIM:?HALDENSIM must name the haldensim binary}" "$@"; }

# Loads only the test plug-in instead of the installed ones.
use_test_plugin() { export HALDENCLI_PLUGINS="${TEST_PLUGIN:?TEST_PLUGIN must name the test plug-in}"; }
# Loads the installed plug-ins again.
use_installed_plugins() { unset HALDENCLI_PLUGINS; }

# Removes the host, so that the next command creates it anew.
fresh_host() { rm -f "$HALDEN_HOST" "$HALDEN_HOST"-*; }

_fail() {
  CHECK_FAILED=1
  {
    echo "FAIL: $CHECK_NAME"
    echo "  command: $LAST_COMMAND"
    echo "  $1"
    [ $# -gt 1 ] && printf '  expected: %s\n' "$2"
    echo "  status: $STATUS"
    echo "  stdout: $(printf '%s' "$OUT" | head -c 2000 | sed '2,$s/^/          /')"
    echo "  stderr: $(printf '%s' "$ERR" | head -c 2000 | sed '2,$s/^/          /')"
  } >&2
}

# Records a failure of the current check, with the last run's output.
fail_check() { _fail "$@"; }

expect_status() {
  [ "$STATUS" = "$1" ] || _fail "exit status $STATUS" "$1"
}

# Exact comparisons, the final line break ignored.
expect_stdout() {
  [ "$OUT" == "$1" ] || _fail "standard output differs" "$1"
}
expect_stderr() {
  [ "$ERR" == "$1" ] || _fail "standard error differs" "$1"
}
expect_stdout_empty() { expect_stdout ""; }
expect_stderr_empty() { expect_stderr ""; }

# Substring and regular-expression (grep -E, any line) matches.
expect_stdout_contains() {
  [[ "$OUT" == *"$1"* ]] || _fail "standard output lacks the text" "$1"
}
expect_stderr_contains() {
  [[ "$ERR" == *"$1"* ]] || _fail "standard error lacks the text" "$1"
}
expect_stdout_lacks() {
  [[ "$OUT" != *"$1"* ]] || _fail "standard output has the text" "not: $1"
}
expect_stdout_matches() {
  printf '%s\n' "$OUT" | grep -Eq -- "$1" || _fail "no line of standard output matches" "$1"
}
expect_stderr_matches() {
  printf '%s\n' "$ERR" | grep -Eq -- "$1" || _fail "no line of standard error matches" "$1"
}
# The first line of standard error (the refusal line).
expect_stderr_first_line() {
  local first
  first=$(printf '%s\n' "$ERR" | head -n 1)
  [ "$first" == "$1" ] || _fail "first line of standard error is: $first" "$1"
}

# Ends the script: a summary line, and exit status 1 when a check failed.
finish() {
  _close_check
  echo "$CHECKS_PASSED passed, $CHECKS_FAILED failed"
  [ "$CHECKS_FAILED" = 0 ]
}
