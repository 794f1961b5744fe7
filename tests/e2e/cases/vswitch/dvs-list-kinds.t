## Several distributed switches: one not branded, one whose uplink list still
## names a NIC the host does not have (hwnic9, left out), one without DV
## ports (an empty "DVPort" list).
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix list
$ orvixcli network vswitch dvs orvix list -v dvsPlain --formatter=json
$ orvixcli network vswitch dvs orvix list -v dvsEmptyLag --formatter=xml
