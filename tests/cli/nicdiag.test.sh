#!/usr/bin/env bash
# network nic register dump, eeprom dump, eeprom change and selftest run from
# the command line: the dumps in table and json, a change that the next dump
# shows, a FIFO given as the EEPROM file, the one line that every self test
# ends in, and unknown NICs and host failures with their texts.
. "$CLI_TEST_LIB"

NIC=(network nic)
MAGIC=284917894  # pnet0's, 0x10fb8086

check "register dump: rows of 16 registers in a table"
cli "${NIC[@]}" register dump -n pnet0
expect_status 0
expect_stderr_empty
expect_stdout "Offset  Value
------  ---------------------------------------------------------------------------------------
0000    80004 00 00 10000 4000000d 00 10d88086 30 400 12345678 ffff 9abcdef0 01 80 deadbeef 02
0010    2a"

check "eeprom dump: aligned rows in json, the values with their last blank"
cli --formatter json "${NIC[@]}" eeprom dump -n pnet0 --offset 19 --length 20
expect_status 0
expect_stdout '[{"Offset":"0010","Value":"         de 56 72 0f 47 67 66 87 59 aa 88 3c 59 "},{"Offset":"0020","Value":"ea 56 13 7b d2 85 a1 "}]'
cli --formatter json "${NIC[@]}" eeprom dump -n pnet6
expect_stdout '[{"Offset":"0000","Value":""}]'

check "eeprom change writes a double word that the next dump shows; its result is left unset"
cli --formatter json "${NIC[@]}" eeprom change -n pnet0 -m "$MAGIC" -o 4 -v 305419896
expect_status 0
expect_stderr_empty
expect_stdout "null"
cli "${NIC[@]}" eeprom change -n pnet0 -m "$MAGIC" -o 4 -v 305419896
expect_status 0
expect_stdout_empty
cli "${NIC[@]}" eeprom dump -n pnet0 -l 8
expect_stdout "Offset  Value
------  ------------------------
0000    c6 7e 81 6b 78 56 34 12"

check "eeprom change refuses --offset without --value, and --file with either"
cli "${NIC[@]}" eeprom change -n pnet0 -m "$MAGIC" -o 4
expect_status 1
expect_stderr "Need to specify atleast one of --offset, --value or --file"
cli "${NIC[@]}" eeprom change -n pnet0 -m "$MAGIC" -f /nonexistent -v 1
expect_status 1
expect_stderr "Parameter --file can't be specified together with --offset and --value"
expect_stdout_empty

check "a FIFO given as the EEPROM file is refused at once"
mkfifo "$CLI_TEST_DIR/fifo"
run timeout 10 "$HALDENCLI" "${NIC[@]}" eeprom change -n pnet0 -m "$MAGIC" -f "$CLI_TEST_DIR/fifo"
expect_status 1
expect_stderr "Unable to write the EEPROM of pnet0 from \"$CLI_TEST_DIR/fifo\": it is a FIFO, not a regular file"
expect_stdout_empty

check "a self test that ran ends in one line on standard error, no output and status 1"
for formatter in table json; do
  cli --formatter "$formatter" "${NIC[@]}" selftest run -n pnet2 -o 1
  expect_status 1
  expect_stderr "The command appended a row to a result list that was never made."
  expect_stdout_empty
done

check "a failing self test is reported as the host's text"
sim fault add --operation Pnic::RunSelfTest --message "Self test aborted: device busy" --times 1
cli "${NIC[@]}" selftest run -n pnet0
expect_status 1
expect_stderr "Self test aborted: device busy"
expect_stdout_empty

check "an unknown NIC is named in every command"
while IFS='|' read -r words; do
  # shellcheck disable=SC2086 # the words of the command line
  cli "${NIC[@]}" $words
  expect_status 1
  expect_stderr "Pnic with name pnet9 not found"
  expect_stdout_empty
done <<'EOF'
register dump -n pnet9
eeprom dump -n pnet9
eeprom change -n pnet9 -m 1 -o 0 -v 0
selftest run -n pnet9
EOF

finish
