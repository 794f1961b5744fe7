## The library's failures in coalesce get and set.
$ orvix-hostsim fault add PnicImpl::GetCoalesceParams --key hwnic3 --message "Driver of hwnic3 timed out" --count 2
1

$ orvixcli network nic coalesce get --formatter=simple
   NIC: hwnic0
   RX microseconds: 3
   RX maximum frames: 0
   TX microseconds: 0
   TX Maximum frames: 0
   Adaptive RX: Off
   Adaptive TX: Off
   Sample interval seconds: 0

   NIC: hwnic1
   RX microseconds: 3
   RX maximum frames: 0
   TX microseconds: 0
   TX Maximum frames: 0
   Adaptive RX: Off
   Adaptive TX: Off
   Sample interval seconds: 0

   NIC: hwnic2
   RX microseconds: 50
   RX maximum frames: 64
   TX microseconds: 50
   TX Maximum frames: 64
   Adaptive RX: On
   Adaptive TX: On
   Sample interval seconds: 2

   NIC: hwnic3
   RX microseconds: N/A
   RX maximum frames: N/A
   TX microseconds: N/A
   TX Maximum frames: N/A
   Adaptive RX: N/A
   Adaptive TX: N/A
   Sample interval seconds: N/A

   NIC: hwnic4
   RX microseconds: 8
   RX maximum frames: 128
   TX microseconds: 16
   TX Maximum frames: 128
   Adaptive RX: On
   Adaptive TX: Off
   Sample interval seconds: 1

   NIC: hwnic5
   RX microseconds: 0
   RX maximum frames: 1
   TX microseconds: 0
   TX Maximum frames: 1
   Adaptive RX: Off
   Adaptive TX: Off
   Sample interval seconds: 0

   NIC: hwnic6
   RX microseconds: N/A
   RX maximum frames: N/A
   TX microseconds: N/A
   TX Maximum frames: N/A
   Adaptive RX: N/A
   Adaptive TX: N/A
   Sample interval seconds: N/A

   NIC: hwnic7
   RX microseconds: 50
   RX maximum frames: 64
   TX microseconds: 50
   TX Maximum frames: 64
   Adaptive RX: On
   Adaptive TX: On
   Sample interval seconds: 2

## A set reads the record first; when that fails nothing is written.
$ orvixcli network nic coalesce set -n hwnic3 -r 1
! Driver of hwnic3 timed out
[1]

$ orvix-hostsim fault add PnicImpl::SetCoalesceParams --key hwnic4 --message "Unable to write the coalescing of hwnic4" --count 1
2

$ orvixcli network nic coalesce set -n hwnic4 -t 1
! Unable to write the coalescing of hwnic4
[1]

$ orvixcli network nic coalesce get -n hwnic3
NIC     RX microseconds  RX maximum frames  TX microseconds  TX Maximum frames  Adaptive RX  Adaptive TX  Sample interval seconds
------  ---------------  -----------------  ---------------  -----------------  -----------  -----------  -----------------------
hwnic3  50               64                 50               64                 On           On           2

$ orvixcli network nic coalesce get -n hwnic4
NIC     RX microseconds  RX maximum frames  TX microseconds  TX Maximum frames  Adaptive RX  Adaptive TX  Sample interval seconds
------  ---------------  -----------------  ---------------  -----------------  -----------  -----------  -----------------------
hwnic4  8                128                16               128                On           Off          1

$ orvix-hostsim fault add NetworkInfoImpl::GetPnics --message "Unable to list the NICs: store busy" --count 1
3

$ orvixcli network nic coalesce get
! Unable to list the NICs: store busy
[1]
