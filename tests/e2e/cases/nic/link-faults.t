## A change the library refuses is reported as it is and changes nothing.
@profile fixtures/nic/inventory.json
$ orvix-hostsim fault add PnicImpl::SetAdminUp --key hwnic0 --message "Device hwnic0 is busy"
1

$ orvixcli network nic down -n hwnic0

$ orvixcli network nic up -n hwnic0

$ orvix-hostsim fault add PnicImpl::SetPnicInfo --key hwnic0 --message "Settings of hwnic0 are locked"
2

$ orvixcli network nic set -n hwnic0 --port mii

$ orvix-hostsim fault add PnicImpl::SetLinkSpeedDuplex --key hwnic0 --message "Link of hwnic0 cannot be forced"
3

$ orvixcli network nic set -n hwnic0 --speed 100 --duplex half

$ orvixcli network nic set -n hwnic0 --auto

$ orvix-hostsim fault add PnicImpl::RestartNegotiation --key hwnic0 --message "Negotiation of hwnic0 did not restart"
4

$ orvixcli network nic negotiate restart -n hwnic0

## hwnic0 is as it was.
$ orvixcli network nic list --formatter=csv

$ orvixcli network nic get -n hwnic0 --formatter=json
