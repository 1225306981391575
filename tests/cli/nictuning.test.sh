#!/usr/bin/env bash
# network nic cso, tso, sg, coalesce, pauseParams, software and ring, and
# network sriovnic: each setting read, changed and read again in table and
# json; the setters' unset answer; refusals with their texts, exit status 1
# and a host that every refusal leaves as it was; the SR-IOV NICs, their
# virtual functions and counters.
. "$CLI_TEST_LIB"

# Runs a command that must fail with status 1, the text and no output, and
# checks that the host did not change.
expect_refusal() {
  local text=$1
  shift
  local before
  before=$("$HALDENSIM" export)
  cli "$@"
  expect_status 1
  expect_stderr "$text"
  expect_stdout_empty
  [ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"
}

# Runs a setter that must succeed with the unset answer: nothing in the
# default formatter, null in json.
expect_set() {
  cli "$@"
  expect_status 0
  expect_stdout_empty
  expect_stderr_empty
}

check "cso set turns both checksum offloads off, and tso and sg stay"
cli network nic cso get -n pnet1
expect_stdout "NIC    RX Checksum Offload  TX Checksum Offload
-----  -------------------  -------------------
pnet1  on                   on"
cli --formatter json network nic cso set -n pnet1 -e 0
expect_status 0
expect_stdout "null"
cli --formatter json network nic cso get -n pnet1
expect_stdout '[{"NIC":"pnet1","RX Checksum Offload":"off","TX Checksum Offload":"off"}]'
cli network nic tso get -n pnet1
expect_stdout "NIC    Value
-----  -----
pnet1  off"
cli network nic sg get -n pnet1
expect_stdout "NIC    Value
-----  -----
pnet1  on"

check "tso set and sg set change their one offload"
expect_set network nic tso set -n pnet1 -e 1
expect_set network nic sg set --pnet pnet1 --enable 0
cli --formatter json network nic tso get -n pnet1
expect_stdout '[{"NIC":"pnet1","Value":"on"}]'
cli --formatter json network nic sg get -n pnet1
expect_stdout '[{"NIC":"pnet1","Value":"off"}]'
cli network nic cso get
expect_stdout "NIC    RX Checksum Offload  TX Checksum Offload
-----  -------------------  -------------------
pnet0  on                   on
pnet1  off                  off
pnet2  on                   on
pnet3  on                   on
pnet4  on                   on
pnet5  on                   off
pnet6  off                  off"

check "coalesce set changes the values given and keeps the others"
cli network nic coalesce get -n pnet0
expect_stdout "NIC    RX microseconds  RX maximum frames  TX microseconds  TX Maximum frames  Adaptive RX  Adaptive TX  Sample interval seconds
-----  ---------------  -----------------  ---------------  -----------------  -----------  -----------  -----------------------
pnet0  16               32                 16               32                 On           Off          5"
expect_set network nic coalesce set -n pnet0 -t 64 -A true -i 10
cli --formatter json network nic coalesce get -n pnet0
expect_stdout '[{"NIC":"pnet0","RX microseconds":"16","RX maximum frames":"32","TX microseconds":"64","TX Maximum frames":"32","Adaptive RX":"On","Adaptive TX":"On","Sample interval seconds":"10"}]'

check "pauseParams set turns TX off, and the negotiated TX resolution follows"
cli network nic pauseParams list -n pnet3
expect_stdout "NIC    Pause Params Supported  Pause RX  Pause TX  Auto Negotiation  Auto Negotiation Resolution Avail  RX Auto Negotiation Resolution  TX Auto Negotiation Resolution
-----  ----------------------  --------  --------  ----------------  ---------------------------------  ------------------------------  ------------------------------
pnet3  true                    true      true      true              true                               true                            false"
expect_set network nic pauseParams set -n pnet0 -t false
cli --formatter json network nic pauseParams list -n pnet0
expect_stdout '[{"NIC":"pnet0","Pause Params Supported":true,"Auto Negotiation":true,"Pause RX":true,"Pause TX":false,"Auto Negotiation Resolution Avail":true,"RX Auto Negotiation Resolution":true,"TX Auto Negotiation Resolution":false}]'
cli --formatter json network nic pauseParams list -n pnet5
expect_stdout '[{"NIC":"pnet5","Pause Params Supported":false,"Auto Negotiation":false,"Pause RX":false,"Pause TX":false,"Auto Negotiation Resolution Avail":false,"RX Auto Negotiation Resolution":false,"TX Auto Negotiation Resolution":false}]'

check "ring current set changes the rings given, within the presets"
cli network nic ring preset get -n pnet5
expect_stdout "RingInfo
   RX: 1024
   RX Mini: 256
   RX Jumbo: 8192
   TX: 1024"
expect_set network nic ring current set -n pnet5 -t 1024 -j 8192
cli network nic ring current get -n pnet5
expect_stdout "RingInfo
   RX: 512
   RX Mini: 128
   RX Jumbo: 8192
   TX: 1024"
cli --formatter json network nic ring current get -n pnet5
expect_stdout '{"RX":512,"RX Mini":128,"RX Jumbo":8192,"TX":1024}'

check "software set changes the flags given and leaves the others"
cli network nic software list
expect_stdout_contains "pnet0  off       off       off             off                   off          on              off       off           off       off           off       off                off           off"
expect_set network nic software set -n pnet0 --sg true --highdma true
cli --formatter json network nic software list
expect_stdout_contains '{"NIC":"pnet0","IPv4 CSO":"off","IPv4 TSO":"off","Scatter Gather":"on","Offset Based Offload":"off","VXLAN Encap":"off","Geneve Offload":"on","IPv6 TSO":"off","IPv6 TSO Ext":"off","IPv6 CSO":"off","IPv6 CSO Ext":"off","High DMA":"on","Scatter Gather MP":"off","VLAN Tagging":"off","VLAN Untagging":"off"}'
expect_set network nic software set -n pnet0 --geneveoffload false
cli network nic software list
expect_stdout_contains "pnet0  off       off       on              off                   off          off             off       off           off       off           on        off                off           off"

check "refusals print their text, exit 1 and leave the host as it was"
expect_refusal "Physical NIC pnet6 does not support TCP segmentation offload" network nic tso set -n pnet6 -e 1
expect_refusal "Physical NIC pnet5 does not support pause frames" network nic pauseParams set -n pnet5 -r true
expect_refusal "Physical NIC pnet0 cannot have a RX ring of 8192 entries: its maximum is 4096" \
  network nic ring current set -n pnet0 -r 8192
expect_refusal "Pnic with name nope not found" network nic cso get -n nope
expect_refusal "Pnic with name nope not found" network nic coalesce set -n nope -r 1
expect_refusal "Pnic with name nope not found" network nic software set -n nope --sg true
expect_refusal "NIC with name nope not found" network nic pauseParams list -n nope
expect_refusal "NIC with name nope not found" network nic ring preset get -n nope
expect_refusal "There is no SRIOV Nic with name pnet0" network sriovnic vf list -n pnet0
expect_refusal "Unable to get VF Stats. Error:Physical NIC pnet1 has no virtual function 9" \
  network sriovnic vf stats -n pnet1 -v 9

check "values outside their range are refused before the command runs"
cli network nic cso set -n pnet0 -e 2
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --enable: 2 is not in the range 0 to 1."
cli network nic coalesce set -n pnet0 -i 3601
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --sample-interval: 3601 is not in the range 1 to 3600."
cli network nic coalesce set -n pnet0 -i 0
expect_status 2

check "a setter with only the NIC changes nothing and succeeds"
before=$("$HALDENSIM" export)
expect_set network nic pauseParams set -n pnet5
expect_set network nic ring current set -n pnet0
expect_set network nic coalesce set -n pnet0
[ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"

check "sriovnic list, vf list and vf stats"
cli network sriovnic list
expect_stdout "Name   PCI Device    Driver  Link  Speed  Duplex  MAC Address        MTU   Description
-----  ------------  ------  ----  -----  ------  -----------------  ----  ---------------------------------------------------------------
pnet1  0000:03:00.1  ixgbe   Up    10000  Full    a0:36:9f:1c:2e:41  1500  Intel Corporation 82599 10 Gigabit Dual Port Network Connection"
cli network sriovnic vf list -n pnet1
expect_stdout "VF ID  Active  PCI Address   Owner World ID
-----  ------  ------------  --------------
0      true    0000:03:10.1  69312
1      true    0000:03:10.3
2      false   0000:03:10.5
3      false   0000:03:10.7"
cli network sriovnic vf stats -n pnet1 -v 0
expect_status 0
expect_stdout "VfStats
   NIC Name: pnet1
   VF ID: 0
   Rx Unicast Pkt: 432000
   Rx Unicast Bytes: 354240000
   Rx Multicast Pkts: 1200
   Rx Multicast Bytes: 108000
   Rx Broadcast Pkts: 240
   Rx Broadcast Bytes: 15360
   Rx Out of Buffer drops: 3
   Rx Error drops: 0
   Rx LRO Pkts: 6857
   Rx LRO Bytes: 41142000
   Tx Unicast Pkt: 336000
   Tx Unicast Bytes: 215040000
   Tx Multicast Pkts: 960
   Tx Multicast Bytes: 86400
   Tx Broadcast Pkts: 192
   Tx Broadcast Bytes: 12288
   Tx Errors: 0
   Tx Discards: 1
   Tx TSO Pkts: 5333
   Tx TSO Bytes: 47997000"
cli --formatter json network sriovnic vf stats -n pnet1 -v 3
expect_stdout '[{"NIC Name":"pnet1","VF ID":3,"Rx Unicast Pkt":0,"Rx Unicast Bytes":0,"Rx Multicast Pkts":0,"Rx Multicast Bytes":0,"Rx Broadcast Pkts":0,"Rx Broadcast Bytes":0,"Rx Out of Buffer drops":0,"Rx Error drops":0,"Rx LRO Pkts":0,"Rx LRO Bytes":0,"Tx Unicast Pkt":0,"Tx Unicast Bytes":0,"Tx Multicast Pkts":0,"Tx Multicast Bytes":0,"Tx Broadcast Pkts":0,"Tx Broadcast Bytes":0,"Tx Errors":0,"Tx Discards":0,"Tx TSO Pkts":0,"Tx TSO Bytes":0}]'

check "a host failure is printed with the command's own words"
"$HALDENSIM" fault add --operation NetworkInfoImpl::GetSriovNicVFInfo --message "PF reset in progress" >/dev/null
expect_refusal "Unable to get VF Info. Error:PF reset in progress" network sriovnic vf list -n pnet1
"$HALDENSIM" fault add --operation Pnic::GetMtu --message "PF reset in progress" >/dev/null
expect_refusal "Unable to list NICs.  Error was PF reset in progress" network sriovnic list
"$HALDENSIM" fault add --operation Pnic::SetCoalesceParams --message "device busy" >/dev/null
expect_refusal "device busy" network nic coalesce set -n pnet0 -r 8
"$HALDENSIM" fault clear >/dev/null

finish
