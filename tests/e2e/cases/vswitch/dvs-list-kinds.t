## Several distributed switches: one not branded, one whose uplink list still
## names a NIC the host does not have (hwnic9, left out), one without DV
## ports (an empty "DVPort" list).
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix list
dvsLag
   Name: dvsLag
   VDS ID: 11111111-2222-4333-8444-555555555555
   Class: dvswitch
   Num Ports: 64
   Used Ports: 5
   Configured Ports: 5
   MTU: 9000
   CDP Status: both
   Beacon Timeout: 5
   Uplinks: hwnic0, hwnic1, hwnic2, hwnic3
   Orvix Branded: true
   DVPort:
      Port ID: 0
      In Use: true
      DVPortgroup ID: dvpg-100
      Client: hwnic0

      Port ID: 1
      In Use: true
      DVPortgroup ID: dvpg-100
      Client: hwnic1

      Port ID: 2
      In Use: true
      DVPortgroup ID: dvpg-100
      Client: hwnic2

      Port ID: 3
      In Use: true
      DVPortgroup ID: dvpg-100
      Client: hwnic3

      Port ID: 40
      In Use: true
      DVPortgroup ID: dvpg-140
      Client: app01.eth0

      Port ID: 41
      In Use: false
      DVPortgroup ID: dvpg-140
      Client: 

dvsUplinkPg
   Name: dvsUplinkPg
   VDS ID: aaaaaaaa-bbbb-4ccc-8ddd-eeeeeeeeeeee
   Class: dvswitch
   Num Ports: 32
   Used Ports: 3
   Configured Ports: 3
   MTU: 1500
   CDP Status: listen
   Beacon Timeout: -1
   Uplinks: hwnic4, hwnic5, hwnic6
   Orvix Branded: false
   DVPort:
      Port ID: 0
      In Use: true
      DVPortgroup ID: dvpg-9
      Client: hwnic4

      Port ID: 1
      In Use: true
      DVPortgroup ID: dvpg-10
      Client: hwnic5

      Port ID: 2
      In Use: true
      DVPortgroup ID: dvpg-10
      Client: hwnic6

dvsPlain
   Name: dvsPlain
   VDS ID: 99999999-8888-4777-8666-555555555555
   Class: dvswitch
   Num Ports: 16
   Used Ports: 1
   Configured Ports: 1
   MTU: 1500
   CDP Status: down
   Beacon Timeout: -1
   Uplinks: hwnic7
   Orvix Branded: true
   DVPort:
      Port ID: 0
      In Use: true
      DVPortgroup ID: dvpg-77
      Client: hwnic7

dvsEmptyLag
   Name: dvsEmptyLag
   VDS ID: 12121212-3434-4565-8787-909090909090
   Class: dvswitch
   Num Ports: 8
   Used Ports: 0
   Configured Ports: 0
   MTU: 1500
   CDP Status: listen
   Beacon Timeout: -1
   Uplinks: 
   Orvix Branded: true
   DVPort:
$ orvixcli network vswitch dvs orvix list -v dvsPlain --formatter=json
[
  {
    "Name": "dvsPlain",
    "VDS ID": "99999999-8888-4777-8666-555555555555",
    "Class": "dvswitch",
    "Num Ports": 16,
    "Used Ports": 1,
    "Configured Ports": 1,
    "MTU": 1500,
    "CDP Status": "down",
    "Beacon Timeout": -1,
    "Uplinks": [
      "hwnic7"
    ],
    "Orvix Branded": true,
    "DVPort": [
      {
        "Port ID": "0",
        "In Use": true,
        "DVPortgroup ID": "dvpg-77",
        "Client": [
          "hwnic7"
        ]
      }
    ]
  }
]
$ orvixcli network vswitch dvs orvix list -v dvsEmptyLag --formatter=xml
<?xml version="1.0" encoding="UTF-8"?>
<output>
  <list type="structure">
    <structure typeName="VDS">
      <field name="Name"><string>dvsEmptyLag</string></field>
      <field name="VDS ID"><string>12121212-3434-4565-8787-909090909090</string></field>
      <field name="Class"><string>dvswitch</string></field>
      <field name="Num Ports"><integer>8</integer></field>
      <field name="Used Ports"><integer>0</integer></field>
      <field name="Configured Ports"><integer>0</integer></field>
      <field name="MTU"><integer>1500</integer></field>
      <field name="CDP Status"><string>listen</string></field>
      <field name="Beacon Timeout"><integer>-1</integer></field>
      <field name="Uplinks"><list type="string"></list></field>
      <field name="Orvix Branded"><boolean>true</boolean></field>
      <field name="DVPort">
        <list type="structure"></list>
      </field>
    </structure>
  </list>
</output>
