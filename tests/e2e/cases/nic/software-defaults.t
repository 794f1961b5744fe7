## A NIC without stored simulation settings simulates nothing.
@profile fixtures/nic/offload-drivers.json
$ orvixcli network nic software list --formatter=simple
   NIC: hwnic0
   IPv4 CSO: on
   IPv4 TSO: off
   Scatter Gather: off
   Offset Based Offload: off
   VXLAN Encap: on
   Geneve Offload: off
   IPv6 TSO: off
   IPv6 TSO Ext: off
   IPv6 CSO: off
   IPv6 CSO Ext: on
   High DMA: off
   Scatter Gather MP: off
   VLAN Tagging: off
   VLAN Untagging: on

   NIC: hwnic1
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

   NIC: hwnic2
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
