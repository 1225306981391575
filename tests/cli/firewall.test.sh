#!/usr/bin/env bash
# The firewall commands on the default host: what they show, what they
# change for the next invocation, and the exact text and status of each
# failure, faults included.
. "$CLI_TEST_LIB"

# The host as it is now, to prove that a refused call changed nothing.
snapshot() { "$HALDENSIM" export; }

check "firewall get shows the module's state"
cli network firewall get
expect_status 0
expect_stdout "Firewall
   Loaded: true
   Enabled: true
   DefaultAction: DROP"
expect_stderr_empty
cli --formatter=json network firewall get
expect_stdout '{"Loaded":true,"Enabled":true,"DefaultAction":"DROP"}'

check "firewall set changes the global state for the next invocation"
cli network firewall set --enabled false --default-action true
expect_status 0
expect_stdout_empty
cli --formatter=json network firewall get
expect_stdout '{"Loaded":true,"Enabled":false,"DefaultAction":"PASS"}'

check "firewall set: a repeated default action fails after the enabled change was made"
cli network firewall set -e true -d true
expect_status 1
expect_stderr "Default action already PASS"
expect_stdout_empty
cli --formatter=json network firewall get
expect_stdout '{"Loaded":true,"Enabled":true,"DefaultAction":"PASS"}'

check "ruleset list shows a table of every ruleset"
cli network firewall ruleset list
expect_status 0
expect_stdout_matches "^Name +Enabled$"
expect_stdout_matches "^sshServer +false$"
expect_stdout_matches "^dhcp +true$"
expect_stdout_matches "^webAccess +true$"
[ "$(printf '%s\n' "$OUT" | head -n 2 | tail -n 1)" = "--------------  -------" ] ||
  fail_check "the second line is not the column rule"
cli --formatter=json network firewall ruleset list -r dns
expect_stdout '[{"Name":"dns","Enabled":true}]'

check "rule list shows the rules of a ruleset"
cli network firewall ruleset rule list -r dns
expect_status 0
expect_stdout "Ruleset  Direction  Protocol  Port Type  Port Begin  Port End
-------  ---------  --------  ---------  ----------  --------
dns      Outbound   UDP       Dst        53          53
dns      Outbound   TCP       Dst        53          53"
cli --formatter=json network firewall ruleset rule list -r sshServer
expect_stdout '[{"Ruleset":"sshServer","Port Type":"Dst","Port Begin":22,"Port End":22,"Direction":"Inbound","Protocol":"TCP"}]'

check "an unknown ruleset is reported by each command in its own words"
before=$(snapshot)
cli network firewall ruleset list -r nope
expect_status 1
expect_stderr "Ruleset Not Found: nope"
expect_stdout_empty
cli network firewall ruleset rule list -r nope
expect_stderr "Ruleset Not Found: nope"
cli network firewall ruleset allowedip list -r nope
expect_stderr "Ruleset Not Found: nope"
cli network firewall ruleset set -r nope -e true
expect_status 1
expect_stderr "Invalid Ruleset Id."
cli network firewall ruleset allowedip add -r nope -i 192.0.2.1
expect_status 1
expect_stderr "Invalid Ruleset Id."
[ "$(snapshot)" = "$before" ] || fail_check "a refused call changed the host"

check "enabling a ruleset and using its allowed list survive the next invocation"
cli network firewall ruleset set -r sshServer -e true -a false
expect_status 0
expect_stdout_empty
cli network firewall ruleset allowedip add -r sshServer -i 2001:DB8::7
expect_status 0
cli network firewall ruleset allowedip add -r sshServer -i 198.51.100.9/24
expect_status 0
cli network firewall refresh
expect_status 0
cli --formatter=json network firewall ruleset list -r sshServer
expect_stdout '[{"Name":"sshServer","Enabled":true}]'
cli network firewall ruleset allowedip list -r sshServer
expect_stdout "Ruleset    Allowed IP Addresses
---------  ----------------------------
sshServer  2001:db8::7, 198.51.100.0/24"
cli --formatter=json network firewall ruleset allowedip list -r sshServer
expect_stdout '[{"Ruleset":"sshServer","Allowed IP Addresses":["2001:db8::7","198.51.100.0/24"]}]'
cli network firewall ruleset allowedip remove -r sshServer -i 2001:db8:0::7
expect_status 0
cli --formatter=json network firewall ruleset allowedip list -r sshServer
expect_stdout '[{"Ruleset":"sshServer","Allowed IP Addresses":["198.51.100.0/24"]}]'

check "allowedip list shows All for a ruleset that admits everybody"
cli --formatter=json network firewall ruleset allowedip list -r dns
expect_status 0
expect_stdout '[{"Ruleset":"dns","Allowed IP Addresses":["All"]}]'
cli network firewall ruleset allowedip list
expect_stdout_matches "^dhcp +All$"
expect_stdout_matches "^webAccess +192\.0\.2\.10, 203\.0\.113\.5, 2001:db8::10, 198\.51\.100\.0/24, 2001:db8:100::/48$"

check "allowedip refusals: their texts, exit 1, nothing changed"
before=$(snapshot)
cli network firewall ruleset allowedip add -r webAccess -i 300.1.1.1
expect_status 1
expect_stderr "Invalid IP address or network: 300.1.1.1"
expect_stdout_empty
cli network firewall ruleset allowedip add -r webAccess -i 192.0.2.10
expect_stderr "192.0.2.10 is already in the allowed IP list of the ruleset webAccess"
cli network firewall ruleset allowedip remove -r webAccess -i 192.0.2.11
expect_stderr "192.0.2.11 is not in the allowed IP list of the ruleset webAccess"
cli network firewall ruleset allowedip add -r dns -i 192.0.2.1
expect_status 1
expect_stderr "Couldn't update allowed ip list when allowed-all flag is true."
cli network firewall ruleset set -r dns -a true
expect_status 1
expect_stderr "Already allowed all ip"
cli network firewall ruleset set -r dns
expect_stderr "Need parameter --enabled or --allowed-all"
[ "$(snapshot)" = "$before" ] || fail_check "a refused call changed the host"

check "an empty allowed address is reported together with a true result"
cli --formatter=json network firewall ruleset allowedip remove -r webAccess -i ""
expect_status 1
expect_stderr "Invalid allowedip parameter."
expect_stdout "true"

check "a fault in the ruleset lookup is reported with the label only"
sim fault add --operation SystemInfoImpl::GetFirewallRulesetById --message "lookup failed" --times 1
cli network firewall ruleset rule list -r dhcp
expect_status 1
expect_stderr "Failed to check loaded status: dhcp"
expect_stdout_empty

check "a fault while the rows are built gives the host's text and no table"
sim fault add --operation FirewallRuleset::GetRules --message "Rules unreadable" --times 1
cli network firewall ruleset rule list
expect_status 1
expect_stderr "Rules unreadable"
expect_stdout_empty
sim fault add --operation FirewallRuleset::GetName --message "Name unreadable" --times 1
cli network firewall ruleset allowedip list
expect_stderr "Name unreadable"
expect_stdout_empty

check "firewall get puts a first line before the host's text"
sim fault add --operation ModuleImpl::IsLoaded --message "Module table locked" --times 1
cli network firewall get
expect_status 1
expect_stderr "Unable to get firewall status.
Module table locked"

check "refresh keeps the dynamic rules, but loses them when it fails in a re-add"
sim export
printf '%s\n' "$OUT" | python3 -c '
import json, sys
d = json.load(sys.stdin)
d["firewall"]["dynamicRules"] = [{"name": "vnc", "portType": "dst", "portBegin": 5900, "portEnd": 5964, "direction": "inbound", "protocol": "tcp"}]
print(json.dumps(d, indent=2))' >"$CLI_TEST_DIR/dynamic.json"
sim import "$CLI_TEST_DIR/dynamic.json"
expect_status 0
cli network firewall refresh
expect_status 0
sim export
expect_stdout_contains '"name": "vnc"'
sim fault add --operation SystemInfoImpl::AddFirewallDynamicRule --message "Filter table full" --times 1
cli network firewall refresh
expect_status 1
expect_stderr "Filter table full"
sim export
expect_stdout_contains '"dynamicRules": []'

check "unload, then the module's state; load brings the rulesets back"
cli network firewall unload
expect_status 0
expect_stdout_empty
cli --formatter=json network firewall get
expect_stdout '{"Loaded":false,"Enabled":false,"DefaultAction":"PASS"}'
cli network firewall unload
expect_status 0
cli network firewall set -e true
expect_status 1
expect_stderr "Firewall module is not loaded"
cli --formatter=json network firewall ruleset list
expect_status 0
expect_stdout "[]"
cli network firewall ruleset set -r sshServer -e false
expect_stderr "Invalid Ruleset Id."
cli network firewall refresh
expect_status 1
expect_stderr "The firewall module haldenfw is not loaded"
cli network firewall load
expect_status 0
cli --formatter=json network firewall ruleset list -r sshServer
expect_stdout '[{"Name":"sshServer","Enabled":true}]'
cli network firewall load
expect_status 1
expect_stderr "Module haldenfw is already loaded"

check "an unload that fails after the filters were destroyed leaves them destroyed"
sim fault add --operation ModuleImpl::Unload --message "Module busy" --times 1
cli network firewall unload
expect_status 1
expect_stderr "Module busy"
cli --formatter=json network firewall get
expect_stdout '{"Loaded":true,"Enabled":true,"DefaultAction":"PASS"}'
cli network firewall ruleset list -r dns
expect_stderr "Ruleset Not Found: dns"
cli network firewall refresh
expect_status 0
cli --formatter=json network firewall ruleset list -r dns
expect_stdout '[{"Name":"dns","Enabled":true}]'

finish
