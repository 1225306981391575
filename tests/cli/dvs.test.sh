#!/usr/bin/env bash
# network vswitch dvs korvex, network vm and network port: the default host's
# rows in every formatter, unknown names and ids refused with their texts and
# exit 1, and a LACP timeout that the next status shows.
. "$CLI_TEST_LIB"

DVS=(network vswitch dvs korvex)

check "every command prints the default host's rows in every formatter"
for formatter in table simple json xml csv; do
  while IFS='|' read -r words value; do
    # shellcheck disable=SC2086 # the words of the command line
    cli --formatter "$formatter" $words
    expect_status 0
    expect_stderr_empty
    expect_stdout_contains "$value"
  done <<'EOF'
network vswitch dvs korvex list|50 2f 8c 1a 3e 77 4b 90-a1 0c 5d e2 7f 33 91 04
network vswitch dvs korvex lacp config get|Src and dst ip, port
network vswitch dvs korvex lacp status get|ACT,AGG,SYN,COL,DIST,
network vswitch dvs korvex lacp stats get|48230
network vm list|dvportgroup-101
network vm port list -w 69312|00:50:56:a1:00:03
network vm port list -w 0|33554450
network port stats get -p 33554437|12284824
network port filter stats get -p 33554437|790221
EOF
done

check "the default formatters show the configured rows and columns"
cli "${DVS[@]}" lacp config get
expect_stdout "DVS Name   LAG Name               LAG ID  NICs         Enabled  Mode    Load balance
---------  ---------------------  ------  -----------  -------  ------  --------------------
dvSwitch0  default_uplink_pg_lag  0       uplink1      true     Active  ---
dvSwitch0  lag1                   1       pnet4,pnet5  true     Active  Src and dst ip, port"
cli "${DVS[@]}" lacp stats get
expect_stdout "DVSwitch   NIC    LAG ID  Tx LACPDUs  Tx Errors  Rx LACPDUs  Rx Errors
---------  -----  ------  ----------  ---------  ----------  ---------
dvSwitch0  pnet4  1       48230       0          48213       0
dvSwitch0  pnet5  1       48231       0          48209       0
dvSwitch0  pnet3  0       12080       0          12077       0"
cli network vm list
expect_stdout "World ID  Name   Num Ports  Networks
--------  -----  ---------  ------------------------------
69312     web01  2          Guest Network, dvportgroup-101
69540     db01   1          Guest Network"
cli --formatter csv network port filter stats get -p 33554437
expect_stdout "Filter direction,Packets in,Packets out,Packets dropped,Packets filtered,Packets faulted,Packets queued,Packets injected,Packet errors
Receive,812331,812101,230,198,0,2,0,0
Receive,812101,812101,0,,,,,
Transmit,790221,790113,108,97,1,0,4,0"
cli "${DVS[@]}" lacp status get -s dvSwitch0
expect_stdout_contains "dvSwitch0
   DVSwitch: dvSwitch0
   LAG ID: 0
   Mode: Active
   Flags: S - Device is sending Slow LACPDUs, F - Device is sending fast LACPDUs, A - Device is in active mode, P - Device is in passive mode
   Nic List:
         Nic: pnet3
         State: bundled
         Local Information:
               Port State: ACT,AGG,SYN,COL,DIST,
               Flags: SA
               Admin Key: 9
               Oper Key: 9
               Port Priority: 255
               Port Number: 3
         Partner Information:
               Device ID: 00:1c:73:5e:0a:01"
cli --formatter json "${DVS[@]}" list --vds-name dvSwitch1
expect_stdout '[{"Name":"dvSwitch1","VDS ID":"50 11 07 c4 9b 2e 41 d5-8f 6a 30 b2 5c 19 e7 02","Class":"dvswitch","Num Ports":4,"Used Ports":0,"Configured Ports":4,"MTU":1500,"CDP Status":"down","Beacon Timeout":-1,"Uplinks":[],"Korvex Branded":false,"DVPort":[{"Port ID":"0","In Use":false,"DVPortgroup ID":"dvportgroup-201","Client":[]},{"Port ID":"1","In Use":false,"DVPortgroup ID":"dvportgroup-201","Client":[]},{"Port ID":"2","In Use":false,"DVPortgroup ID":"dvportgroup-201","Client":[]},{"Port ID":"3","In Use":false,"DVPortgroup ID":"dvportgroup-201","Client":[]}]}]'

check "unknown switches, worlds and ports are refused with exit 1 and leave the host as it was"
before=$("$HALDENSIM" export)
while IFS='|' read -r text words; do
  # shellcheck disable=SC2086
  cli $words
  expect_status 1
  expect_stdout_empty
  expect_stderr "$text"
done <<'EOF'
Unable to access all vDS|network vswitch dvs korvex list -v nosuch
LACP is disabled on DVSwitch.|network vswitch dvs korvex lacp config get --dvs nosuch
LACP is disabled on DVSwitch.|network vswitch dvs korvex lacp config get --dvs dvSwitch1
No running LACP group on the host.|network vswitch dvs korvex lacp status get --dvs nosuch
No running LACP group on the host.|network vswitch dvs korvex lacp stats get -s dvSwitch1
Distributed switch nosuch does not exist|network vswitch dvs korvex lacp timeout set -s nosuch -l 1 -t true
Unable to set the LACP timeout on distributed switch dvSwitch0: it has no running LAG 5|network vswitch dvs korvex lacp timeout set -s dvSwitch0 -l 5 -t true
Couldn't find VM with given world ID|network vm port list -w 4242
Couldn't find requested port|network port stats get -p 4242
Couldn't find requested port|network port filter stats get --portid 4242
EOF
[ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"
cli "${DVS[@]}" lacp timeout set -s dvSwitch0 -l 1
expect_status 2
expect_stderr_first_line "Error: Missing required option --timeout."

check "a short timeout on a LAG shows in the next status, and a long one on one of its NICs"
cli "${DVS[@]}" lacp timeout set --vds dvSwitch0 --lag-id 1 --timeout true
expect_status 0
expect_stdout_empty
cli --formatter json "${DVS[@]}" lacp status get
expect_stdout_contains '"Nic":"pnet4","State":"bundled","Local Information":{"Port State":"ACT,FTO,AGG,SYN,COL,DIST,","Flags":"FA"'
expect_stdout_contains '"Nic":"pnet5","State":"bundled","Local Information":{"Port State":"ACT,FTO,AGG,SYN,COL,DIST,","Flags":"FA"'
expect_stdout_contains '"Nic":"pnet3","State":"bundled","Local Information":{"Port State":"ACT,AGG,SYN,COL,DIST,","Flags":"SA"'
cli "${DVS[@]}" lacp timeout set -s dvSwitch0 -l 1 -t false -n pnet4
expect_status 0
cli --formatter json "${DVS[@]}" lacp status get
expect_stdout_contains '"Nic":"pnet4","State":"bundled","Local Information":{"Port State":"ACT,AGG,SYN,COL,DIST,","Flags":"SA"'
expect_stdout_contains '"Nic":"pnet5","State":"bundled","Local Information":{"Port State":"ACT,FTO,AGG,SYN,COL,DIST,","Flags":"FA"'

finish
