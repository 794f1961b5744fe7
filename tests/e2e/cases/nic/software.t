## network nic software list and set on the default host: the fourteen
## offload features the host simulates in software, per NIC. Geneve is the
## last feature of the NIC's record but the sixth column.
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

$ orvixcli network nic software list --formatter=json
[
  {
    "NIC": "hwnic0",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "on",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "on",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic1",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "on",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "on",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic2",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic3",
    "IPv4 CSO": "off",
    "IPv4 TSO": "on",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic4",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "off",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic5",
    "IPv4 CSO": "on",
    "IPv4 TSO": "on",
    "Scatter Gather": "on",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "on",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "on",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "on",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic6",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "off",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic7",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  }
]

## No option sends nothing, and the command still succeeds.
$ orvixcli network nic software set -n hwnic4

## --geneveoffload sets the last feature of the record and only that one.
$ orvixcli network nic software set -n hwnic4 --geneveoffload true

$ orvixcli network nic software list --formatter=simple
   NIC: hwnic0
   IPv4 CSO: off
   IPv4 TSO: off
   Scatter Gather: off
   Offset Based Offload: off
   VXLAN Encap: off
   Geneve Offload: on
   IPv6 TSO: off
   IPv6 TSO Ext: on
   IPv6 CSO: off
   IPv6 CSO Ext: on
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: off
   VLAN Untagging: off

   NIC: hwnic1
   IPv4 CSO: off
   IPv4 TSO: off
   Scatter Gather: off
   Offset Based Offload: off
   VXLAN Encap: off
   Geneve Offload: on
   IPv6 TSO: off
   IPv6 TSO Ext: on
   IPv6 CSO: off
   IPv6 CSO Ext: on
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: off
   VLAN Untagging: off

   NIC: hwnic2
   IPv4 CSO: off
   IPv4 TSO: off
   Scatter Gather: off
   Offset Based Offload: off
   VXLAN Encap: off
   Geneve Offload: on
   IPv6 TSO: off
   IPv6 TSO Ext: off
   IPv6 CSO: off
   IPv6 CSO Ext: off
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: off
   VLAN Untagging: off

   NIC: hwnic3
   IPv4 CSO: off
   IPv4 TSO: on
   Scatter Gather: off
   Offset Based Offload: off
   VXLAN Encap: off
   Geneve Offload: on
   IPv6 TSO: off
   IPv6 TSO Ext: off
   IPv6 CSO: off
   IPv6 CSO Ext: off
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: off
   VLAN Untagging: off

   NIC: hwnic4
   IPv4 CSO: off
   IPv4 TSO: off
   Scatter Gather: off
   Offset Based Offload: off
   VXLAN Encap: off
   Geneve Offload: on
   IPv6 TSO: off
   IPv6 TSO Ext: off
   IPv6 CSO: off
   IPv6 CSO Ext: off
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: off
   VLAN Untagging: off

   NIC: hwnic5
   IPv4 CSO: on
   IPv4 TSO: on
   Scatter Gather: on
   Offset Based Offload: off
   VXLAN Encap: off
   Geneve Offload: on
   IPv6 TSO: on
   IPv6 TSO Ext: off
   IPv6 CSO: on
   IPv6 CSO Ext: off
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: on
   VLAN Untagging: off

   NIC: hwnic6
   IPv4 CSO: off
   IPv4 TSO: off
   Scatter Gather: off
   Offset Based Offload: off
   VXLAN Encap: off
   Geneve Offload: off
   IPv6 TSO: off
   IPv6 TSO Ext: off
   IPv6 CSO: off
   IPv6 CSO Ext: off
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: off
   VLAN Untagging: off

   NIC: hwnic7
   IPv4 CSO: off
   IPv4 TSO: off
   Scatter Gather: off
   Offset Based Offload: off
   VXLAN Encap: off
   Geneve Offload: on
   IPv6 TSO: off
   IPv6 TSO Ext: off
   IPv6 CSO: off
   IPv6 CSO Ext: off
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: off
   VLAN Untagging: off

## Several options at once: each given feature is set, the others keep
## their value.
$ orvixcli network nic software set --hwnic=hwnic5 --ipv4cso=false --sgsp=true --tagging no --obo yes --formatter=json

$ orvixcli network nic software list --formatter=json
[
  {
    "NIC": "hwnic0",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "on",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "on",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic1",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "on",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "on",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic2",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic3",
    "IPv4 CSO": "off",
    "IPv4 TSO": "on",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic4",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic5",
    "IPv4 CSO": "off",
    "IPv4 TSO": "on",
    "Scatter Gather": "on",
    "Offset Based Offload": "on",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "on",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "on",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "on",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic6",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "off",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  },
  {
    "NIC": "hwnic7",
    "IPv4 CSO": "off",
    "IPv4 TSO": "off",
    "Scatter Gather": "off",
    "Offset Based Offload": "off",
    "VXLAN Encap": "off",
    "Geneve Offload": "on",
    "IPv6 TSO": "off",
    "IPv6 TSO Ext": "off",
    "IPv6 CSO": "off",
    "IPv6 CSO Ext": "off",
    "High DMA": "off",
    "Scatter Gather MP": "off",
    "VLAN Tagging": "off",
    "VLAN Untagging": "off"
  }
]

$ orvixcli network nic software set -n hwnic9 --sg true
! Pnic with name hwnic9 not found
[1]

$ orvixcli network nic software set -n hwnic0 --sg maybe
! orvixcli: Invalid value 'maybe' for --sg: expected true or false
! Run 'orvixcli network nic software set --help' for its options.
[2]
