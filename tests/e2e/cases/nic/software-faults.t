## The library's failures in software list and set. A NIC the listing
## cannot read shows "N/A" in every feature column; the others are shown.
$ orvix-hostsim fault add PnicImpl::GetSoftwareSimulation --key hwnic2 --message "Driver of hwnic2 timed out" --count 1
1

$ orvixcli network nic software list
NIC     IPv4 CSO  IPv4 TSO  Scatter Gather  Offset Based Offload  VXLAN Encap  Geneve Offload  IPv6 TSO  IPv6 TSO Ext  IPv6 CSO  IPv6 CSO Ext  High DMA  Scatter Gather MP  VLAN Tagging  VLAN Untagging
------  --------  --------  --------------  --------------------  -----------  --------------  --------  ------------  --------  ------------  --------  -----------------  ------------  --------------
hwnic0  off       off       off             off                   off          on              off       on            off       on            off       off                off           off
hwnic1  off       off       off             off                   off          on              off       on            off       on            off       off                off           off
hwnic2  N/A       N/A       N/A             N/A                   N/A          N/A             N/A       N/A           N/A       N/A           N/A       N/A                N/A           N/A
hwnic3  off       on        off             off                   off          on              off       off           off       off           off       off                off           off
hwnic4  off       off       off             off                   off          off             off       off           off       off           off       off                off           off
hwnic5  on        on        on              off                   off          on              on        off           on        off           off       off                on            off
hwnic6  off       off       off             off                   off          off             off       off           off       off           off       off                off           off
hwnic7  off       off       off             off                   off          on              off       off           off       off           off       off                off           off

$ orvix-hostsim fault add NetworkInfoImpl::GetPnics --message "Unable to list the NICs: store busy" --count 1
2

$ orvixcli network nic software list --formatter=json
! Unable to list the NICs: store busy
[1]

## A set with no option sends nothing, so a fault on the write is not
## reached; with an option it is, and nothing changes.
$ orvix-hostsim fault add PnicImpl::SetSoftwareSimulation --key hwnic0 --message "Unable to write the software simulation of hwnic0" --count 1
3

$ orvixcli network nic software set -n hwnic0

$ orvixcli network nic software set -n hwnic0 --highdma true
! Unable to write the software simulation of hwnic0
[1]

$ orvixcli network nic software list
NIC     IPv4 CSO  IPv4 TSO  Scatter Gather  Offset Based Offload  VXLAN Encap  Geneve Offload  IPv6 TSO  IPv6 TSO Ext  IPv6 CSO  IPv6 CSO Ext  High DMA  Scatter Gather MP  VLAN Tagging  VLAN Untagging
------  --------  --------  --------------  --------------------  -----------  --------------  --------  ------------  --------  ------------  --------  -----------------  ------------  --------------
hwnic0  off       off       off             off                   off          on              off       on            off       on            off       off                off           off
hwnic1  off       off       off             off                   off          on              off       on            off       on            off       off                off           off
hwnic2  off       off       off             off                   off          on              off       off           off       off           off       off                off           off
hwnic3  off       on        off             off                   off          on              off       off           off       off           off       off                off           off
hwnic4  off       off       off             off                   off          off             off       off           off       off           off       off                off           off
hwnic5  on        on        on              off                   off          on              on        off           on        off           off       off                on            off
hwnic6  off       off       off             off                   off          off             off       off           off       off           off       off                off           off
hwnic7  off       off       off             off                   off          on              off       off           off       off           off       off                off           off
