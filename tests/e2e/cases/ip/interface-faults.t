## The library's failures in the interface and tag commands: each is
## reported with its command's sentence, or alone, and changes nothing.
$ orvix-hostsim fault add PalladNicInfoImpl::AddPalladNic --key pld7 --message "Port set vSwitch0 is being reconfigured" --count 1

$ orvixcli network ip interface add -p "VM Network" -i pld7

$ orvix-hostsim fault add NetworkFactory::GetDVSwitchByName --key dvSwitch0 --message "distributed switch dvSwitch0 is not reachable" --count 2

$ orvixcli network ip interface add -s dvSwitch0 -P 11

$ orvixcli network ip interface remove -s dvSwitch0 -P 10

## The tag take-over fails after the interface was made: reported as a
## failure to add.
$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicsByTag --message "Tag index is locked" --count 1

$ orvixcli network ip interface add -p "VM Network" -N migrix

$ orvixcli network ip interface list --formatter=csv

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNics --message "Interface table is locked" --count 4

$ orvixcli network ip interface list

$ orvixcli network ip interface remove -i pld0

$ orvixcli network ip interface set -i pld0 -e false

$ orvixcli network ip interface tag get -i pld0

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicsByInstanceKey --key migrix --message "Netstack migrix is busy" --count 1

$ orvixcli network ip interface list -N migrix

$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetDVSwitchByName --key dvSwitch0 --message "dvSwitch0 is not answering" --count 1

$ orvixcli network ip interface list --formatter=json

$ orvix-hostsim fault add PldNicImpl::GetConnectionPoint --key pld1 --message "pld1 is detaching" --count 1

$ orvixcli network ip interface list --formatter=json

$ orvix-hostsim fault add PldNicImpl::Remove --key pld2 --message "pld2 is in use by the migration service" --count 1

$ orvixcli network ip interface remove -i pld2

$ orvix-hostsim fault add PalladNicInfoImpl::RemovePalladNic --key defaultTcpipStack --message "Port of pld0 is locked" --count 1

$ orvixcli network ip interface remove -p "Management Network"

$ orvix-hostsim fault add PldNicImpl::Disable --key pld0 --message "pld0 carries the management traffic" --count 1

$ orvixcli network ip interface set -i pld0 -e false --mtu 9000

$ orvix-hostsim fault add PldNicImpl::SetMtu --key pld0 --message "MTU of pld0 is locked" --count 1

$ orvixcli network ip interface set -i pld0 --mtu 9000

$ orvix-hostsim fault add NetworkInfoImpl::GetNetstackInstanceState --key migrix --message "Netstack table is locked" --count 1

$ orvixcli network ip interface tag add -i pld0 -t LiveMigration

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicByInterface --key pld0 --message "pld0 is being renamed" --count 2

$ orvixcli network ip interface tag add -i pld0 -t Backup

$ orvixcli network ip interface tag remove -i pld0 -t Management

$ orvix-hostsim fault add PldNicImpl::AddTag --key pld0 --message "Tags of pld0 are locked" --count 1

$ orvixcli network ip interface tag add -i pld0 -t Backup

$ orvix-hostsim fault add PldNicImpl::RemoveTag --key pld1 --message "Tags of pld1 are locked" --count 1

$ orvixcli network ip interface tag remove -i pld1 -t Storage

## Nothing changed.
$ orvixcli network ip interface list --formatter=csv

$ orvixcli network ip interface tag get -i pld0

$ orvixcli network ip interface tag get -i pld1
