## An interface made on the provisioning netstack is tagged for it and
## restarts the RFX daemon; a daemon that does not come back is reported,
## and the interface stays.
@profile fixtures/ip/interface-provisioning.json

$ orvixcli network ip interface add -p Provisioning -N BrenvoProvisioning

$ orvixcli network ip interface tag get -i pld1

$ orvixcli network ip interface tag get -i pld0

$ orvix-hostsim dump

$ orvix-hostsim fault add Util::PldCtl_Exec --key "/etc/init.d/rfxd restart" --message "rfxd: no such service"

$ orvixcli network ip interface add -p "Provisioning 2" -N BrenvoProvisioning

$ orvixcli network ip interface add -p "Provisioning 3" -N BrenvoProvisioning --formatter=json

$ orvixcli network ip interface list --formatter=csv

$ orvix-hostsim dump

## Other netstacks run nothing.
$ orvixcli network ip interface remove -p "Provisioning 2" -N BrenvoProvisioning

$ orvixcli network ip interface add -p "Provisioning 2"
