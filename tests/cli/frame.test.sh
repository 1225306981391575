#!/usr/bin/env bash
# The tool's frame through the test plug-in: help, option parsing and
# validation, formatters, error texts, exit statuses, plug-in loading and
# when the host is opened.
. "$CLI_TEST_LIB"
use_test_plugin

check "the root help lists the plug-in's namespace and the global options"
cli --help
expect_status 0
expect_stdout_contains "Usage: haldencli [options] {namespace}+ {cmd} [cmd options]"
expect_stdout_contains "  --formatter=<str>"
expect_stdout_matches "^  demo  Commands that exercise the command frame\.$"
expect_stderr_empty

check "a path that ends at a namespace shows its help"
cli demo
expect_status 0
expect_stdout "Usage: haldencli [options] {namespace}+ {cmd} [cmd options]

Commands that exercise the command frame.

Available Namespaces:
  nic     Result shapes of a table.
  switch  Result shapes of nested structures.

Available Commands:
  echo   Show the parameters as the command receives them.
  fail   Report failures, with or without a result.
  throw  Fail with an exception.
  bool   Deliver a boolean."

check "help is not a command run: it creates no host"
[ ! -e "$HALDEN_HOST" ] || fail_check "a host exists after help only"

check "a command's help shows its options with the enum markers expanded"
cli demo echo --help
expect_status 0
expect_stdout_contains "Usage: haldencli demo echo [cmd options]

Description:
  Show the parameters as the command receives them.

Cmd options:
  -n|--name=<str>       The name to echo. (required)
  -p|--port=<long>      A port number."
expect_stdout_contains "  -m|--mode=<str>       The mode. Should be one in set [transport, tunnel]."
expect_stdout_contains "  -k|--kind=<str>       Address type :
                          static: Set static IPv4 information.
                          dhcp: Use DHCP."
expect_stdout_contains "  --label=<str>         A lower-case label"
expect_stdout_contains "  -v|--verbose          Say more."

check "an unknown command names itself, then the help of the deepest namespace"
cli demo nic lsit --all
expect_status 2
expect_stderr_first_line "Error: Unknown command or namespace demo nic lsit."
expect_stderr_contains "Available Commands:
  list  List the demo NICs."
expect_stdout_empty

check "every option form reaches the command"
cli demo echo --name pnet0 -p 4096 --level=4 -m tunnel -k=dhcp --label a1 -e No -v
expect_status 0
expect_stdout '{"Name":"pnet0","Port":4096,"Level":4,"Mode":"tunnel","Kind":"dhcp","Label":"a1","Enabled":false,"Verbose":true,"Given":["name","port","level","mode","kind","label","enabled","verbose"]}'

check "options left out stay absent"
cli demo echo -n x
expect_stdout '{"Name":"x","Port":null,"Level":null,"Mode":null,"Kind":null,"Label":null,"Enabled":null,"Verbose":false,"Given":["name"]}'

check "a value outside its range is refused before the command runs"
cli demo echo -n x --port 4097
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --port: 4097 is not in the range 1 to 4096."
expect_stderr_contains "Usage: haldencli demo echo [cmd options]"
expect_stdout_empty

check "the command's default formatter, and --formatter over it"
cli demo nic list
expect_status 0
expect_stdout "Name   Link Status  Speed       Description
-----  -----------  ----------  -----------------
pnet0  true         10000 Mbps  Uplink of switch0
pnet1  false                    Dual port, \"fast\""
cli --formatter simple demo nic list
expect_stdout "NIC pnet0 (hnet)
   Name: pnet0
   Link Status: true
   Speed: 10000 Mbps
   Description: Uplink of switch0

NIC pnet1 (hnet)
   Name: pnet1
   Link Status: false
   Speed:
   Description: Dual port, \"fast\""
cli --formatter=csv demo nic list
expect_stdout 'Name,Link Status,Speed,Description
pnet0,true,10000,Uplink of switch0
pnet1,false,,"Dual port, ""fast"""'

check "an empty table still shows its header"
cli demo nic list --empty
expect_status 0
expect_stdout "Name  Link Status  Speed  Description
----  -----------  -----  -----------"

check "nested structures and lists in the simple layout"
cli demo switch get
expect_stdout "switch0
   Name: switch0
   MTU: 1500
   Uplinks: pnet0, pnet1
   Policy:
         Enabled: true
         Average Bandwidth: 100 Kbps
   Portgroups:
      PortGroup
         Name: Host Management
         VLAN ID: 0

      PortGroup
         Name: Guest Network
         VLAN ID: 12
   Notes:"

check "a boolean result: nothing for true by default, true in json"
cli demo bool -b true
expect_status 0
expect_stdout_empty
cli --formatter json demo bool -b yes
expect_stdout "true"

check "error texts go to stderr in order, exit 1, and a result still prints"
cli demo fail
expect_status 1
expect_stderr "First failure.
Second failure."
expect_stdout_empty
cli --formatter json demo fail --with-result
expect_status 1
expect_stderr "First failure.
Second failure."
expect_stdout "true"

check "an exception out of a command is a failure with its text after the earlier ones, not a crash"
cli demo throw
expect_status 1
expect_stderr "Before the throw.
The host did not answer."
expect_stdout_empty

check "running a command creates the host where HALDEN_HOST says"
[ -s "$HALDEN_HOST" ] || fail_check "no host at $HALDEN_HOST"

check "a host that cannot be opened is a refusal"
echo "not a host" >"$CLI_TEST_DIR/broken.db"
cli --host "$CLI_TEST_DIR/broken.db" demo bool -b false
expect_status 2
expect_stderr "Error: Cannot open the host $CLI_TEST_DIR/broken.db: it is not a host store (file is not a database)"
expect_stdout_empty

check "an unknown formatter or global option is refused"
cli --formatter yaml demo bool -b true
expect_status 2
expect_stderr "Error: Unknown formatter 'yaml'. Available formatters: simple, table, json, xml, csv, keyvalue."
cli --verbose demo
expect_status 2
expect_stderr_first_line "Error: Unknown option --verbose."

check "a plug-in that cannot be loaded is refused with the loader's reason"
HALDENCLI_PLUGINS="$CLI_TEST_DIR/missing.so" cli --help
expect_status 2
expect_stderr_first_line "Error: Cannot load the plug-in $CLI_TEST_DIR/missing.so: $CLI_TEST_DIR/missing.so: cannot open shared object file: No such file or directory"
printf 'junk' >"$CLI_TEST_DIR/junk.so"
HALDENCLI_PLUGINS="$TEST_PLUGIN:$CLI_TEST_DIR/junk.so" cli --help
expect_status 2
expect_stderr_contains "junk.so"

finish
