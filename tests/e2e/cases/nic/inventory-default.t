## network nic list on the default host, whose NICs all have a PCI device.
$ orvixcli network nic list
Name    PCI Device    Driver   Admin Status  Link Status  Speed  Duplex  MAC Address        MTU   Description
------  ------------  -------  ------------  -----------  -----  ------  -----------------  ----  ------------------------------------------------------------------
hwnic0  0000:02:00.0  lrk1g    Up            Up           1000   Full    02:a1:00:00:00:01  1500  Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller
hwnic1  0000:02:00.1  lrk1g    Up            Up           1000   Full    02:a1:00:00:00:02  1500  Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller
hwnic2  0000:04:00.0  cvx10    Up            Up           10000  Full    02:a1:00:00:00:03  9000  Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter
hwnic3  0000:04:00.1  cvx10    Up            Up           10000  Full    02:a1:00:00:00:04  9000  Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter
hwnic4  0000:06:00.0  fwk25    Up            Up           25000  Full    02:a1:00:00:00:05  9000  Fenwick Fabric Systems FW-25E 25GbE SR-IOV Network Controller
hwnic5  0000:08:00.0  lrk1g    Up            Down         0      Half    02:a1:00:00:00:06  1500  Larkspur Networks Inc. LN105 Gigabit Ethernet Controller
hwnic6  Pseudo        vpseudo  Down          Down         0      Full    02:a1:00:00:00:07  9000  Unknown Unknown
hwnic7  0000:0a:00.0  cvx10    Up            Up           10000  Full    02:a1:00:00:00:08  9000  Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter

$ orvixcli network nic get -n hwnic2
   Name: hwnic2
   Supported Ports: FIBRE, DA
   Supports Auto Negotiation: true
   Advertised Link Modes: 10000baseT/Full
   Advertised Auto Negotiation: false
   Cable Type: FIBRE
   PHY Address: 0
   Virtual Address: 
   Transceiver: external
   Auto Negotiation: false
   Supports Wakeon: false
   Wakeon: None
   Current Message Level: -1
   Link Detected: true
   Supports Pause: true
   Pause Autonegotiate: false
   Pause RX: false
   Pause TX: false
   Link Status: Up
   Driver Info:
      Driver: cvx10
      Version: 2.11.4
      Firmware Version: 7.10.2.1
      Bus Info: 0000:04:00.0
