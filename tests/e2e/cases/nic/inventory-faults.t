## The library's failures: nic list reports them behind its own words, nic
## get as they are. A fault keyed to one NIC leaves the others alone.
@profile fixtures/nic/inventory.json
$ orvix-hostsim fault add NetworkInfoImpl::GetPnics --message "NIC table busy" --count 1
1

$ orvixcli network nic list

$ orvixcli network nic list --formatter=json

$ orvix-hostsim fault add PnicImpl::GetPnicInfo --key hwnic0 --message "Driver of hwnic0 timed out"
2

$ orvixcli network nic get -n hwnic0

$ orvixcli network nic get -n hwnic1 --formatter=json

$ orvix-hostsim fault clear

$ orvix-hostsim fault add PnicImpl::GetPauseParams --key hwnic1 --message "Pause query failed"
1

$ orvixcli network nic get -n hwnic1

$ orvix-hostsim fault add PnicImpl::GetDriverInfo --key hwnic0 --message "Driver info unavailable"
2

$ orvixcli network nic get -n hwnic0
