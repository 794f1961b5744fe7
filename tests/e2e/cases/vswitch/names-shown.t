## Control characters in names (here from a profile: ESC, and U+009B, which
## a terminal also takes as the start of a command) are shown escaped by the
## human formats and in messages; the machine formats keep them exact.
@env ORVIX_HOST_PROFILE=controls.json
$ sh -c "printf '%s' '{\"format\": \"orvix-host-profile\", \"version\": 1, \"vswitches\": [{\"name\": \"vSwitch0\", \"numPorts\": 64}], \"portgroups\": [{\"name\": \"red\\u001b[31m\\u0007\", \"vswitch\": \"vSwitch0\"}, {\"name\": \"csi\\u009b2J\", \"vswitch\": \"vSwitch0\"}]}' > controls.json"

$ orvixcli network vswitch standard portgroup list
Name             Virtual Switch  Active Clients  VLAN ID
---------------  --------------  --------------  -------
red\x1b[31m\x07  vSwitch0        0               0
csi\u009b2J      vSwitch0        0               0

$ orvixcli network vswitch standard portgroup list --formatter=simple
   Name: red\x1b[31m\x07
   Virtual Switch: vSwitch0
   Active Clients: 0
   VLAN ID: 0

   Name: csi\u009b2J
   Virtual Switch: vSwitch0
   Active Clients: 0
   VLAN ID: 0

$ orvixcli network vswitch standard portgroup list --formatter=keyvalue
PortGroup[0].Name=red\x1b[31m\x07
PortGroup[0].Virtual Switch=vSwitch0
PortGroup[0].Active Clients=0
PortGroup[0].VLAN ID=0
PortGroup[1].Name=csi\u009b2J
PortGroup[1].Virtual Switch=vSwitch0
PortGroup[1].Active Clients=0
PortGroup[1].VLAN ID=0

$ orvixcli network vswitch standard list --formatter=table
Name      Class      Num Ports  Used Ports  Configured Ports  MTU   CDP Status  Beacon Enabled  Beacon Interval  Beacon Threshold  Beacon Required By  Uplinks  Portgroups
--------  ---------  ---------  ----------  ----------------  ----  ----------  --------------  ---------------  ----------------  ------------------  -------  ----------------------------
vSwitch0  stdswitch  64         0           0                 1500  listen      false           1                3                                              red\x1b[31m\x07, csi\u009b2J

$ orvixcli network vswitch standard portgroup list --formatter=json
[
  {
    "Name": "red\u001b[31m\u0007",
    "Virtual Switch": "vSwitch0",
    "Active Clients": 0,
    "VLAN ID": 0
  },
  {
    "Name": "csi2J",
    "Virtual Switch": "vSwitch0",
    "Active Clients": 0,
    "VLAN ID": 0
  }
]

$ orvixcli network vswitch standard portgroup list --formatter=csv
Name,Virtual Switch,Active Clients,VLAN ID
red[31m,vSwitch0,0,0
csi2J,vSwitch0,0,0

$ orvixcli network vswitch standard portgroup list --formatter=xml
<?xml version="1.0" encoding="UTF-8"?>
<output>
  <list type="structure">
    <structure typeName="PortGroup">
      <field name="Name"><string>red[31m</string></field>
      <field name="Virtual Switch"><string>vSwitch0</string></field>
      <field name="Active Clients"><integer>0</integer></field>
      <field name="VLAN ID"><integer>0</integer></field>
    </structure>
    <structure typeName="PortGroup">
      <field name="Name"><string>csi2J</string></field>
      <field name="Virtual Switch"><string>vSwitch0</string></field>
      <field name="Active Clients"><integer>0</integer></field>
      <field name="VLAN ID"><integer>0</integer></field>
    </structure>
  </list>
</output>

$ orvixcli network vswitch standard portgroup remove -v vSwitch0 -p 'gone]0;title'
! Unable to find port group gone\x1b]0;title\x07 on virtual switch vSwitch0
[1]
