## The help of the policy set commands: the enum words with their meanings,
## the short names, and the exact option texts.
$ orvixcli network vswitch standard policy failover set --help
Usage: orvixcli network vswitch standard policy failover set [cmd options]

Description:
  Configure the Failover policy for a virtual switch.

Cmd options:
  -v|--vswitch-name=<str>  (required)
      The name of the virtual switch to use when configuring the switch failover policy.
  -l|--load-balancing=<str>
      Set the load balancing policy for this policy. This can be one of the following options: 
        portid: Route based on the originating virtual port ID.
        iphash: Route based on hashing the src and destination IP addresses
        mac: Route based on the MAC address of the packet source.
        explicit: Always use the highest order uplink from the list of active adapters which pass failover criteria.
  -f|--failure-detection=<str>
      Set the method of determining how a network outage is detected. 
        link: Detect failures based on the NIC link state
        beacon: Detect failures based on active beaconing to the vswitch
  -n|--notify-switches=<bool>
      Indicate whether to send a notification to physical switches on failover
  -b|--failback=<bool>
      Configure whether a NIC will be used immediately when it comes back in service after a failover
  -a|--active-uplinks=<str>
      Configure the list of active adapters and their failover order. This list must be a comma seperated list of values with the uplink name and no spaces. Example:  --active-uplinks=hwnic0,hwnic3,hwnic7,hwnic1
  -s|--standby-uplinks=<str>
      Configure the list of standby adapters and their failover order. This list must be a comma seperated list of values with the uplink name and no spaces. Example:  --standby-uplinks=hwnic2,hwnic4,hwnic8,hwnic6,hwnic11

$ orvixcli network vswitch standard policy security set --help
Usage: orvixcli network vswitch standard policy security set [cmd options]

Description:
  Set the security policy for a given virtual switch

Cmd options:
  -v|--vswitch-name=<str>  (required)
      The name of the virtual switch to use when setting the switch security policy.
  -p|--allow-promiscuous=<bool>
      Allow ports on the virtual switch to enter promiscuous mode.
  -m|--allow-mac-change=<bool>
      Allow ports on the virtual switch to change their MAC address.
  -f|--allow-forged-transmits=<bool>
      Allow ports on the virtual switch to send packets with forged source information.

## Three blanks end the first sentence of --use-vswitch here, one elsewhere.
$ orvixcli network vswitch standard portgroup policy security set --help
Usage: orvixcli network vswitch standard portgroup policy security set [cmd options]

Description:
  Set the security policy for a given port group

Cmd options:
  -p|--portgroup-name=<str>  (required)
      The name of the port group to set security policy for.
  -u|--use-vswitch
      Reset all values for this policy to use parent virtual switch's settings instead of overriding the settings for the port group.   Using this in conjunction with other settings will first reset all of the fields to use the virtual switch setting and then apply the other options after the reset.
  -o|--allow-promiscuous=<bool>
      Allow ports on the virtual switch to enter promiscuous mode.
  -m|--allow-mac-change=<bool>
      Allow ports on the virtual switch to change their MAC address.
  -f|--allow-forged-transmits=<bool>
      Allow ports on the virtual switch to send packets with forged source information.

$ orvixcli network vswitch standard portgroup policy shaping set --help
Usage: orvixcli network vswitch standard portgroup policy shaping set [cmd options]

Description:
  Set the shaping policy settings for the given port group

Cmd options:
  -p|--portgroup-name=<str>  (required)
      The name of the port group to set shaping policy for.
  -u|--use-vswitch
      Reset all values for this policy to use parent virtual switch's settings instead of overriding the settings for the port group. Using this in conjunction with other settings will first reset all of the fields to use the virtual switch setting and then apply the other options after the reset.
  -e|--enabled=<bool>
      Indicate whether to enable traffic shaping on this policy. If this is true then the --avg-bandwidth, --peak-bandwidth and --burst-size options are required.
  -b|--avg-bandwidth=<long>
      The averge bandwidth allowed for this shaping policy. This value is in Kbps (1 Kbps = 1000 bits/s)
  -k|--peak-bandwidth=<long>
      The peak bandwidth allowed for this shaping policy. This value is in Kbps (1 Kbps = 1000 bits/s)
  -t|--burst-size=<long>
      The largest burst size allowed for this shaping policy. This value is in Kib (1 Kib = 1024 bits)

$ orvixcli network vswitch standard portgroup policy failover get --help
Usage: orvixcli network vswitch standard portgroup policy failover get [cmd options]

Description:
  Get the network failover policy settings governing the given port group

Cmd options:
  -p|--portgroup-name=<str>  (required)
      The name of the port group to use when fetching the port group failover policy.
