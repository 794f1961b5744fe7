## A profile whose fields have the wrong type or lie outside their range is
## refused when it is loaded, by both tools and by every way of loading, with
## the field's place; nothing is created and no library text is shown.
@env ORVIX_HOST_PROFILE=bad.json
$ sh -c "printf '%s' '{\"format\": \"orvix-host-profile\", \"version\": 1, \"vswitches\": [{\"name\": \"vSwitch0\", \"numPorts\": 18446744073709551615}]}' > bad.json"

$ orvix-hostsim init --profile bad.json
! orvix-hostsim: profile bad.json: vswitches[0].numPorts: must be an integer from 1 to 4096, not 18446744073709551615
[1]

$ orvixcli network vswitch standard list
! orvixcli: host store '$TMP/host.db' cannot be created: profile bad.json: vswitches[0].numPorts: must be an integer from 1 to 4096, not 18446744073709551615
[3]

$ sh -c "printf '%s' '{\"format\": \"orvix-host-profile\", \"version\": 1, \"vswitches\": [{\"name\": \"vSwitch0\"}], \"portgroups\": [{\"name\": \"Storage\", \"vswitch\": \"vSwitch0\", \"vlanId\": \"20\"}]}' > bad.json"

$ orvixcli network vswitch standard portgroup list
! orvixcli: host store '$TMP/host.db' cannot be created: profile bad.json: portgroups[0].vlanId: must be an integer from 0 to 4095, not string
[3]

$ sh -c "printf '%s' '{\"format\": \"orvix-host-profile\", \"version\": 1, \"vswitches\": [{\"name\": \"vSwitch0\", \"uplinks\": [1, 2]}]}' > bad.json"

$ orvix-hostsim init
! orvix-hostsim: profile bad.json: vswitches[0].uplinks: item 0 must be a string, not 1
[1]

$ sh -c "printf '%s' '{\"format\": \"orvix-host-profile\", \"version\": 1, \"system\": {\"ipv6Enabled\": \"no\"}}' > bad.json"

$ orvixcli network ip get
! orvixcli: host store '$TMP/host.db' cannot be created: profile bad.json: system.ipv6Enabled: must be true or false, not string
[3]

$ sh -c "printf '{\"format\": \"orvix-host-profile\", \"version\": 1, \"system\": {\"maxPorts\": 1%0400d}}' 0 > bad.json"

$ orvixcli network ip get
! orvixcli: host store '$TMP/host.db' cannot be created: profile bad.json: a number is too large at line 1, column 71
[3]

## Loading over an existing host refuses the profile and keeps the host.
$ sh -c "printf '%s' '{\"format\": \"orvix-host-profile\", \"version\": 1, \"vswitches\": [{\"name\": \"vSwitch0\", \"numPorts\": 64, \"mtu\": 9000.0}]}' > good.json"

$ orvix-hostsim init --profile good.json

$ sh -c "printf '%s' '{\"format\": \"orvix-host-profile\", \"version\": 1, \"vswitches\": [{\"name\": \"vSwitch0\", \"mtu\": 65536}]}' > bad.json"

$ orvix-hostsim load bad.json
! orvix-hostsim: profile bad.json: vswitches[0].mtu: must be an integer from 1280 to 9000, not 65536
[1]

$ orvixcli network vswitch standard list --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,64,0,0,9000,listen,false,1,3,,,
