## An interface made on the provisioning netstack is tagged for it and
## restarts the RFX daemon; a daemon that does not come back is reported
## beside a true result, and the interface stays.
@profile fixtures/ip/interface-provisioning.json

$ orvixcli network ip interface add -p Provisioning -N BrenvoProvisioning

$ orvixcli network ip interface tag get -i pld1
   Tags: Provisioning

$ orvixcli network ip interface tag get -i pld0
   Tags: Management

## An interface on another netstack runs nothing.
$ orvixcli network ip interface add -p "Provisioning 2"

$ orvixcli network ip interface remove -p "Provisioning 2"

$ orvix-hostsim fault add Util::PldCtl_Exec --key "/etc/init.d/rfxd restart" --message "rfxd: no such service"
1

$ orvixcli network ip interface add -p "Provisioning 2" -N BrenvoProvisioning
! Unable to start the RFX daemon. Take a look at /var/log/rfxd.log for more information.
[1]

$ orvixcli network ip interface add -p "Provisioning 3" -N BrenvoProvisioning --formatter=json
true
! Unable to start the RFX daemon. Take a look at /var/log/rfxd.log for more information.
[1]

$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554434
pld1,02:a1:01:00:00:02,true,vSwitch0,Provisioning,BrenvoProvisioning,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554435
pld2,02:a1:01:00:00:03,true,vSwitch0,Provisioning 2,BrenvoProvisioning,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554436
pld3,02:a1:01:00:00:04,true,vSwitch0,Provisioning 3,BrenvoProvisioning,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554437

## Three restarts, the last two failed; every interface on the
## provisioning netstack has its tag.
$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "nics": [
    {
      "adminUp": true,
      "driver": "lrk1g",
      "duplex": "full",
      "linkUp": true,
      "mac": "02:a1:00:00:00:01",
      "name": "hwnic0",
      "pciDevice": "0000:02:00.0",
      "speed": 1000,
      "uplinkPortId": 33554433
    }
  ],
  "vswitches": [
    {
      "name": "vSwitch0",
      "numPorts": 16,
      "uplinks": [
        "hwnic0"
      ]
    }
  ],
  "portgroups": [
    {
      "name": "Management Network",
      "vswitch": "vSwitch0"
    },
    {
      "name": "Provisioning",
      "vlanId": 40,
      "vswitch": "vSwitch0"
    },
    {
      "name": "Provisioning 2",
      "vlanId": 41,
      "vswitch": "vSwitch0"
    },
    {
      "name": "Provisioning 3",
      "vlanId": 42,
      "vswitch": "vSwitch0"
    }
  ],
  "netstacks": [
    {
      "key": "defaultTcpipStack"
    },
    {
      "key": "BrenvoProvisioning"
    }
  ],
  "interfaces": [
    {
      "mac": "02:a1:01:00:00:01",
      "name": "pld0",
      "netstack": "defaultTcpipStack",
      "portId": 33554434,
      "portgroup": "Management Network",
      "tags": [
        "Management"
      ]
    },
    {
      "dhcpDns": false,
      "dvPortId": "",
      "dvswitch": "",
      "enabled": true,
      "externalId": "",
      "ipv4Address": "0.0.0.0",
      "ipv4Mode": "none",
      "ipv4Netmask": "0.0.0.0",
      "ipv6Addresses": [],
      "ipv6Dhcp": false,
      "ipv6RouterAdv": false,
      "mac": "02:a1:01:00:00:02",
      "mtu": 1500,
      "name": "pld1",
      "netstack": "BrenvoProvisioning",
      "opaqueNetworkId": "",
      "opaqueNetworkType": "",
      "opaqueSwitch": "",
      "portId": 33554435,
      "portgroup": "Provisioning",
      "tags": [
        "Provisioning"
      ],
      "tsoMss": 65535
    },
    {
      "dhcpDns": false,
      "dvPortId": "",
      "dvswitch": "",
      "enabled": true,
      "externalId": "",
      "ipv4Address": "0.0.0.0",
      "ipv4Mode": "none",
      "ipv4Netmask": "0.0.0.0",
      "ipv6Addresses": [],
      "ipv6Dhcp": false,
      "ipv6RouterAdv": false,
      "mac": "02:a1:01:00:00:03",
      "mtu": 1500,
      "name": "pld2",
      "netstack": "BrenvoProvisioning",
      "opaqueNetworkId": "",
      "opaqueNetworkType": "",
      "opaqueSwitch": "",
      "portId": 33554436,
      "portgroup": "Provisioning 2",
      "tags": [
        "Provisioning"
      ],
      "tsoMss": 65535
    },
    {
      "dhcpDns": false,
      "dvPortId": "",
      "dvswitch": "",
      "enabled": true,
      "externalId": "",
      "ipv4Address": "0.0.0.0",
      "ipv4Mode": "none",
      "ipv4Netmask": "0.0.0.0",
      "ipv6Addresses": [],
      "ipv6Dhcp": false,
      "ipv6RouterAdv": false,
      "mac": "02:a1:01:00:00:04",
      "mtu": 1500,
      "name": "pld3",
      "netstack": "BrenvoProvisioning",
      "opaqueNetworkId": "",
      "opaqueNetworkType": "",
      "opaqueSwitch": "",
      "portId": 33554437,
      "portgroup": "Provisioning 3",
      "tags": [
        "Provisioning"
      ],
      "tsoMss": 65535
    }
  ],
  "ports": [
    {
      "client": "hwnic0",
      "id": 33554433,
      "portset": "vSwitch0",
      "teamUplink": "hwnic0",
      "type": "uplink"
    },
    {
      "client": "pld0",
      "id": 33554434,
      "mac": "02:a1:01:00:00:01",
      "portgroup": "Management Network",
      "portset": "vSwitch0",
      "type": "kernel"
    },
    {
      "client": "pld1",
      "id": 33554435,
      "portgroup": "Provisioning",
      "portset": "vSwitch0",
      "type": "kernel"
    },
    {
      "client": "pld2",
      "id": 33554436,
      "portgroup": "Provisioning 2",
      "portset": "vSwitch0",
      "type": "kernel"
    },
    {
      "client": "pld3",
      "id": 33554437,
      "portgroup": "Provisioning 3",
      "portset": "vSwitch0",
      "type": "kernel"
    }
  ],
  "execLog": [
    {
      "command": "/etc/init.d/rfxd restart",
      "exitStatus": 0
    },
    {
      "command": "/etc/init.d/rfxd restart",
      "exitStatus": 1
    },
    {
      "command": "/etc/init.d/rfxd restart",
      "exitStatus": 1
    }
  ]
}
