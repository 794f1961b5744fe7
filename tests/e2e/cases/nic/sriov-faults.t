## The library's failures behind each command's own words.
@profile fixtures/nic/sriov.json
$ orvix-hostsim fault add NetworkInfoImpl::GetSriovNics --message "SR-IOV table busy" --count 1
1

$ orvixcli network sriovnic list

$ orvix-hostsim fault add NetworkInfoImpl::GetSriovNicVFInfo --key hwnic4 --message "VF table busy"
2

$ orvixcli network sriovnic vf list -n hwnic4

$ orvix-hostsim fault add NetworkInfoImpl::GetSriovNicVFStats --key hwnic4 --message "VF counters busy"
3

$ orvixcli network sriovnic vf stats -n hwnic4 -v 3

$ orvixcli network sriovnic vf stats -n hwnic4 -v 3 --formatter=json
