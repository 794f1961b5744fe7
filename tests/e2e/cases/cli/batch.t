## orvixcli --batch FILE: one command line a line, in one process.
$ sh -c "printf '%s\\n' '# set up' 'network vswitch standard add -v batchSw' '' '  network vswitch standard portgroup add -v batchSw -p Batch\\ PG  # a comment' '--formatter=json network ip get' 'network vswitch standard portgroup list --formatter=csv' > ok.txt"
$ orvixcli --batch ok.txt
{
  "IPv6 Enabled": true
}
Name,Virtual Switch,Active Clients,VLAN ID
Management Network,vSwitch0,1,0
VM Network,vSwitch0,2,0
Storage,vSwitch0,2,20
Migration,vSwitch0,1,30
Lab Isolated,vSwitch1,0,100
Batch PG,batchSw,0,0

## Each line still its own change: the first failing line stops the batch,
## what came before it stays.
$ sh -c "printf '%s\\n' 'network vswitch standard portgroup remove -v batchSw -p \"Batch PG\"' 'network vswitch standard portgroup remove -v batchSw -p \"Batch PG\"' 'network ip get' > stop.txt"
$ orvixcli --batch stop.txt
! Unable to find port group Batch PG on virtual switch batchSw
! orvixcli: stop.txt:2: failed with exit status 1; the lines after it were not run
[1]
$ orvixcli network vswitch standard portgroup list --formatter=csv
Name,Virtual Switch,Active Clients,VLAN ID
Management Network,vSwitch0,1,0
VM Network,vSwitch0,2,0
Storage,vSwitch0,2,20
Migration,vSwitch0,1,30
Lab Isolated,vSwitch1,0,100
$ orvixcli --batch stop.txt --force
   IPv6 Enabled: true
! Unable to find port group Batch PG on virtual switch batchSw
! orvixcli: stop.txt:1: failed with exit status 1
! Unable to find port group Batch PG on virtual switch batchSw
! orvixcli: stop.txt:2: failed with exit status 1
[1]

## Quoting errors are that line's usage error.
$ sh -c "printf '%s\\n' 'network ip get' 'network ip set -e \"false' 'network ip set -e false' > quote.txt"
$ orvixcli --batch quote.txt
   IPv6 Enabled: true
! orvixcli: unterminated double quote
! orvixcli: quote.txt:2: failed with exit status 2; the lines after it were not run
[2]
$ orvixcli network ip get
   IPv6 Enabled: true

## Standard input: nothing to run is success.
$ orvixcli --batch -

## The batch itself.
$ orvixcli --batch missing.txt
! orvixcli: cannot read the batch file 'missing.txt': No such file or directory
[2]
$ orvixcli --batch .
! orvixcli: cannot read the batch file '.': it is a directory
[2]
$ orvixcli --batch
! orvixcli: Option --batch needs a file (- for standard input)
[2]
$ orvixcli --batch ok.txt network ip get
! orvixcli: Unexpected argument 'network' beside --batch: the commands go in the file, one a line; only --force may be added
[2]
$ orvixcli --formatter=json --batch ok.txt
! orvixcli: Unexpected argument '--formatter=json' beside --batch: the commands go in the file, one a line; only --force may be added
[2]
