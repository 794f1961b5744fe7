## The library's failures behind each command's own words.
@profile fixtures/nic/sriov.json
$ orvix-hostsim fault add NetworkInfoImpl::GetSriovNics --message "SR-IOV table busy" --count 1
1

$ orvixcli network sriovnic list
! Unable to list NICs.  Error was SR-IOV table busy
[1]

$ orvix-hostsim fault add NetworkInfoImpl::GetSriovNicVFInfo --key hwnic4 --message "VF table busy"
2

$ orvixcli network sriovnic vf list -n hwnic4
! Unable to get VF Info. Error:VF table busy
[1]

$ orvix-hostsim fault add NetworkInfoImpl::GetSriovNicVFStats --key hwnic4 --message "VF counters busy"
3

$ orvixcli network sriovnic vf stats -n hwnic4 -v 3
! Unable to get VF Stats. Error:VF counters busy
[1]

$ orvixcli network sriovnic vf stats -n hwnic4 -v 3 --formatter=json
! Unable to get VF Stats. Error:VF counters busy
[1]
