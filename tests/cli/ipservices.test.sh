#!/usr/bin/env bash
# network ip get/set, ip connection, ip dns and ip ipsec from the command
# line: name servers, search domains, security associations and policies
# added, listed in every formatter and removed; connections by type; the key
# exchange configuration from a good file and a bad path; each refusal with
# its text, its exit status and the host unchanged.
. "$CLI_TEST_LIB"

DNS=(network ip dns)
IPSEC=(network ip ipsec)

# The host as it is now, to prove that a refused call changed nothing.
snapshot() { "$HALDENSIM" export; }

check "every list prints the default host's rows in every formatter"
for formatter in table simple json xml csv keyvalue; do
  while IFS='|' read -r words value; do
    # shellcheck disable=SC2086 # the words of the command line
    cli --formatter "$formatter" $words
    expect_status 0
    expect_stderr_empty
    expect_stdout_contains "$value"
  done <<'EOF'
network ip get|true
network ip dns server list|2001:db8::53
network ip dns search list|lab.example.net
network ip connection list|198.51.100.5:60114
network ip ipsec sa list|0xc0de
network ip ipsec sp list|2001:db8::21/128
EOF
done

check "name servers of either family are added at the end and removed"
cli "${DNS[@]}" server list
expect_stdout "NameServerList
   DNS Servers: 192.0.2.53, 2001:db8::53"
cli "${DNS[@]}" server add --server 203.0.113.53
expect_status 0
expect_stdout_empty
expect_stderr_empty
cli "${DNS[@]}" server add -s 2001:DB8::54 -N defaultTcpipStack
expect_status 0
cli "${DNS[@]}" server remove -s 192.0.2.53
expect_status 0
cli --formatter json "${DNS[@]}" server list
expect_stdout '{"DNS Servers":["2001:db8::53","203.0.113.53","2001:db8::54"]}'

check "a server edit the host refuses prints its text and still answers true"
before=$(snapshot)
cli "${DNS[@]}" server add -s 203.0.113.53
expect_status 1
expect_stderr "The name server 203.0.113.53 is already configured for netstack defaultTcpipStack"
expect_stdout_empty
cli --formatter json "${DNS[@]}" server remove -s 192.0.2.99
expect_status 1
expect_stderr "The name server 192.0.2.99 is not configured for netstack defaultTcpipStack"
expect_stdout "true"
[ "$(snapshot)" = "$before" ] || fail_check "a refused edit changed the host"

check "server add and remove refuse what is no address, and remove takes one of --all and --server"
before=$(snapshot)
cli --formatter json "${DNS[@]}" server add -s 192.0.2
expect_status 1
expect_stderr "The specified address '192.0.2' is not recognised as a valid IP address"
expect_stdout_empty
cli "${DNS[@]}" server remove -s ns1.example.com
expect_status 1
expect_stderr "The specified address 'ns1.example.com' is not recognised as a valid IP address"
cli "${DNS[@]}" server remove --all -s 192.0.2.53
expect_status 1
expect_stderr "You must specify exactly one of: --all, --server"
# --server is required as declared: the tool refuses --all alone.
cli "${DNS[@]}" server remove --all
expect_status 2
expect_stderr_first_line "Error: Missing required option --server."
cli "${DNS[@]}" server list -N nowhere
expect_status 1
expect_stdout_empty
[ "$(snapshot)" = "$before" ] || fail_check "a refused call changed the host"

check "search domains are added at the end and removed, each netstack keeping its own"
cli "${DNS[@]}" search add -d corp.example.org
expect_status 0
expect_stdout_empty
cli "${DNS[@]}" search remove --domain example.com
expect_status 0
cli "${DNS[@]}" search list
expect_stdout "DNSSearchList
   DNS Search Domains: lab.example.net, corp.example.org"
cli "${DNS[@]}" search add -d LAB.example.net
expect_status 1
expect_stderr "The search domain LAB.example.net is already configured for netstack defaultTcpipStack"
cli "${DNS[@]}" search remove -d example.com
expect_status 1
expect_stderr "The search domain example.com is not configured for netstack defaultTcpipStack"
cli --formatter json "${DNS[@]}" search list -N ""
expect_stdout '{"DNS Search Domains":["lab.example.net","corp.example.org"]}'

check "a failed save prints the host's text with true and keeps nothing"
sim fault add --operation DnsConfigImpl::SaveConfig --message "disk full" --times 1
cli --formatter json "${DNS[@]}" search add -d new.example
expect_status 1
expect_stderr "disk full"
expect_stdout "true"
cli --formatter json "${DNS[@]}" search list
expect_stdout '{"DNS Search Domains":["lab.example.net","corp.example.org"]}'

check "ip set changes the IPv6 switch, and without an option nothing"
cli network ip set --ipv6-enabled false
expect_status 0
expect_stdout_empty
cli network ip set
expect_status 0
cli network ip get
expect_stdout "IPInfo
   IPv6 Enabled: false"
cli network ip set -e true
cli --formatter json network ip get
expect_stdout '{"IPv6 Enabled":true}'

check "connections list TCP, UDP and raw IP in this order, or one type"
cli network ip connection list
expect_status 0
expect_stdout "Proto  Recv Q  Send Q  Local Address   Foreign Address      State        World ID  CC Algo  World Name
-----  ------  ------  --------------  -------------------  -----------  --------  -------  ----------
tcp    0       0       0.0.0.0:22      0.0.0.0:0            LISTEN       1001      newreno  sshd
tcp    0       0       :::443          :::0                 LISTEN       1000      newreno  hostd
tcp    0       36      192.0.2.10:443  198.51.100.77:51514  ESTABLISHED  1000      newreno  hostd
tcp    0       0       192.0.2.10:902  198.51.100.5:60114   ESTABLISHED  69312     newreno  web01
tcp    0       0       192.0.2.10:22   198.51.100.77:51210  TIME_WAIT    1001      newreno  sshd
udp    0       0       0.0.0.0:123     0.0.0.0:0            CLOSED       1002               ntpd
ip     0       0       :::0            :::0                 CLOSED       1000               hostd"
cli --formatter csv network ip connection list --type udp
expect_stdout "Proto,Recv Q,Send Q,Local Address,Foreign Address,State,World ID,CC Algo,World Name
udp,0,0,0.0.0.0:123,0.0.0.0:0,CLOSED,1002,,ntpd"
cli --formatter json network ip connection list -t ip
expect_stdout '[{"Proto":"ip","Recv Q":0,"Send Q":0,"Local Address":":::0","Foreign Address":":::0","State":"CLOSED","CC Algo":"","World ID":1000,"World Name":"hostd"}]'
cli network ip connection list -t icmp
expect_status 2
cli network ip connection list -N nowhere
expect_status 1
expect_stderr_first_line "Unable to get connection list."
expect_stdout_empty

check "security associations are added, listed with their SPI and lifetime, and removed in each form"
cli "${IPSEC[@]}" sa add -n sa-lab -s any -d 2001:db8::30 -m tunnel -p 0x1f -e aes128-cbc -k 0123456789abcdef \
  -i hmac-sha1 -K 0123456789abcdef0123
expect_status 0
expect_stdout_empty
cli "${IPSEC[@]}" sa add -n sa-null -s 2001:db8::10 -d 2001:db8::31 -p 20 -e null -i hmac-sha2-256 \
  -K 0123456789abcdef0123456789abcdef
expect_status 0
cli "${IPSEC[@]}" sa list
expect_stdout "Name     Source Address  Destination Address  State   SPI     Mode       Encryption Algorithm  Integrity Algorithm  Lifetime
-------  --------------  -------------------  ------  ------  ---------  --------------------  -------------------  --------
sa-web   2001:db8::10    2001:db8::21         mature  0x1000  transport  aes128-cbc            hmac-sha1            1h
sa-db    2001:db8::10    2001:db8::22         mature  0x1001  tunnel     3des-cbc              hmac-sha2-256        infinite
sa-lab   ::              2001:db8::30         mature  0x1f    tunnel     aes128-cbc            hmac-sha1            infinite
sa-null  2001:db8::10    2001:db8::31         mature  0x20    any        null                  hmac-sha2-256        infinite
         2001:db8::21    2001:db8::10         mature  0xc0de  transport  aes128-cbc            hmac-sha1            1h 30m"
cli --formatter json "${IPSEC[@]}" sa list
expect_stdout_contains '"SPI":"0x1000","Mode":"transport","Encryption Algorithm":"aes128-cbc","Integrity Algorithm":"hmac-sha1","Lifetime":"1h "}'
cli "${IPSEC[@]}" sa remove -n sa-null
expect_status 0
cli "${IPSEC[@]}" sa remove -n auto -s 2001:db8::21 -d 2001:db8::10 -p c0de
expect_status 0
cli --formatter csv "${IPSEC[@]}" sa list
expect_stdout "Name,Source Address,Destination Address,State,SPI,Mode,Encryption Algorithm,Integrity Algorithm,Lifetime
sa-web,2001:db8::10,2001:db8::21,mature,0x1000,transport,aes128-cbc,hmac-sha1,1h 
sa-db,2001:db8::10,2001:db8::22,mature,0x1001,tunnel,3des-cbc,hmac-sha2-256,infinite
sa-lab,::,2001:db8::30,mature,0x1f,tunnel,aes128-cbc,hmac-sha1,infinite"

check "an association is refused for its SPI, its key or the host's reasons, and nothing is added"
before=$(snapshot)
cli "${IPSEC[@]}" sa add -n sa-x -s any -d any -p 1g -e null -i hmac-sha1 -K 0123456789abcdef0123
expect_status 1
expect_stderr "Check the input value for '--sa-spi'. Should be hex integer. Got 1g"
expect_stdout_empty
cli "${IPSEC[@]}" sa add -n sa-x -s any -d any -p 1 -e 3des-cbc -i hmac-sha1 -K 0123456789abcdef0123
expect_status 1
expect_stderr "Missing encryption key"
cli "${IPSEC[@]}" sa add -n sa-x -s any -d 2001:db8::30 -p 1F -e null -i hmac-sha1 -K 0123456789abcdef0123
expect_status 1
expect_stderr "Unable to add security association sa-x: association sa-lab has the same source, destination and SPI"
cli "${IPSEC[@]}" sa add -n sa-x -s any -d any -p 1 -e des -i hmac-sha1 -K 0123456789abcdef0123
expect_status 2
cli "${IPSEC[@]}" sa remove
expect_status 1
expect_stderr "Can not figure out which operation you want to perform.
Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.
Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' and '--sa-spi' and omit '--remove-all' when removing an auto SA.
Remove all SAs: You should only set the flag '--remove-all' to remove all SAs."
cli "${IPSEC[@]}" sa remove -n sa-web --remove-all
expect_status 1
expect_stderr_first_line "Can not figure out which operation you want to perform."
[ "$(snapshot)" = "$before" ] || fail_check "a refused call changed the host"

check "security policies are added, listed, starred when their association is gone, and removed"
cli "${IPSEC[@]}" sp add -n sp-lab -a sa-lab -s any -d 2001:db8::30/128 -m tunnel -p 0 -P 500 -A ipsec \
  -u udp -w out
expect_status 0
expect_stdout_empty
cli "${IPSEC[@]}" sp add -n sp-block -a sa-lab -s 2001:db8::/32 -d any -m tunnel -p 23 -P 0 -A discard
expect_status 0
cli --formatter csv "${IPSEC[@]}" sp list
expect_stdout "Name,Source Address,Source Port,Destination Address,Destination Port,Protocol,Flow,Action,Mode,SA Name
sp-web-out,2001:db8::10/128,0,2001:db8::21/128,443,tcp,out,ipsec,transport,sa-web
sp-web-in,2001:db8::21/128,443,2001:db8::10/128,0,tcp,in,ipsec,transport,sa-web
sp-drop,::/0,0,2001:db8::10/128,161,udp,in,discard,any,
sp-lab,::/0,0,2001:db8::30/128,500,udp,out,ipsec,tunnel,sa-lab
sp-block,2001:db8::/32,23,::/0,0,any,none,discard,any,"
cli "${IPSEC[@]}" sa remove --sa-name sa-web
expect_status 0
cli "${IPSEC[@]}" sp list
expect_status 1
expect_stderr "*Some SPs with unique but deleted SAs were found. Please remove these SPs as they cannot be used anymore."
expect_stdout "Name        Source Address    Source Port  Destination Address  Destination Port  Protocol  Flow  Action   Mode       SA Name
----------  ----------------  -----------  -------------------  ----------------  --------  ----  -------  ---------  --------
sp-web-out  2001:db8::10/128  0            2001:db8::21/128     443               tcp       out   ipsec    transport  UNKNOWN*
sp-web-in   2001:db8::21/128  443          2001:db8::10/128     0                 tcp       in    ipsec    transport  UNKNOWN*
sp-drop     ::/0              0            2001:db8::10/128     161               udp       in    discard  any
sp-lab      ::/0              0            2001:db8::30/128     500               udp       out   ipsec    tunnel     sa-lab
sp-block    2001:db8::/32     23           ::/0                 0                 any       none  discard  any"
cli "${IPSEC[@]}" sp add -n sp-bad -s 2001:db8::10 -d any -p 0 -P 0
expect_status 1
expect_stderr "Invalid IPv6 network: 2001:db8::10"
cli "${IPSEC[@]}" sp remove -n sp-web-out
expect_status 0
cli "${IPSEC[@]}" sp remove -n sp-web-in
expect_status 0
cli --formatter json "${IPSEC[@]}" sp list
expect_status 0
expect_stderr_empty
expect_stdout_lacks "UNKNOWN"

check "sp remove with neither or both options prints its text, answers true and removes nothing"
before=$(snapshot)
cli --formatter json "${IPSEC[@]}" sp remove
expect_status 1
expect_stderr "You should specify exactly one of : --remove-all, --sa-name"
expect_stdout "true"
cli "${IPSEC[@]}" sp remove --remove-all --sp-name sp-lab
expect_status 1
expect_stderr "You should specify exactly one of : --remove-all, --sa-name"
expect_stdout_empty
[ "$(snapshot)" = "$before" ] || fail_check "sp remove changed the host"
cli "${IPSEC[@]}" sp remove --remove-all
expect_status 0
cli "${IPSEC[@]}" sa remove -a
expect_status 0
cli --formatter json "${IPSEC[@]}" sp list
expect_stdout "[]"
cli --formatter json "${IPSEC[@]}" sa list
expect_stdout "[]"

check "ipsec set refuses a bad path with its text and leaves the host unchanged"
before=$(snapshot)
cli "${IPSEC[@]}" set --ike-conf "$CLI_TEST_DIR/missing.conf"
expect_status 1
expect_stderr "Unable to use the IKE configuration $CLI_TEST_DIR/missing.conf: it does not exist"
expect_stdout_empty
cli "${IPSEC[@]}" set -f "$CLI_TEST_DIR"
expect_status 1
expect_stderr "Unable to use the IKE configuration $CLI_TEST_DIR: it is a directory"
printf '[peer lab]\naddress 2001:db8::30\n' >"$CLI_TEST_DIR/bad.conf"
cli "${IPSEC[@]}" set -f "$CLI_TEST_DIR/bad.conf"
expect_status 1
expect_stderr "Unable to use the IKE configuration $CLI_TEST_DIR/bad.conf: line 2 is neither a [section] nor a name = value setting"
[ "$(snapshot)" = "$before" ] || fail_check "a refused file changed the host"

check "ipsec set installs a good file and restarts the daemons"
printf '# lab peers\n[peer lab]\naddress = 2001:db8::30\n' >"$CLI_TEST_DIR/ike.conf"
cli "${IPSEC[@]}" set -f "$CLI_TEST_DIR/ike.conf"
expect_status 0
expect_stdout_empty
expect_stderr_empty
sim export
expect_stdout_contains "\"sourcePath\": \"$CLI_TEST_DIR/ike.conf\""
expect_stdout_contains '"address = 2001:db8::30"'
expect_stdout_contains "/etc/init.d/iked restart"

finish
