## network nic coalesce get and set on the default host. Counts and the
## sample interval are shown as decimal text, the adaptive switches "On" or
## "Off"; the pseudo NIC hwnic6 cannot report coalescing ("N/A").
$ orvixcli network nic coalesce get
NIC     RX microseconds  RX maximum frames  TX microseconds  TX Maximum frames  Adaptive RX  Adaptive TX  Sample interval seconds
------  ---------------  -----------------  ---------------  -----------------  -----------  -----------  -----------------------
hwnic0  3                0                  0                0                  Off          Off          0
hwnic1  3                0                  0                0                  Off          Off          0
hwnic2  50               64                 50               64                 On           On           2
hwnic3  50               64                 50               64                 On           On           2
hwnic4  8                128                16               128                On           Off          1
hwnic5  0                1                  0                1                  Off          Off          0
hwnic6  N/A              N/A                N/A              N/A                N/A          N/A          N/A
hwnic7  50               64                 50               64                 On           On           2

$ orvixcli network nic coalesce get -n hwnic4 --formatter=simple
   NIC: hwnic4
   RX microseconds: 8
   RX maximum frames: 128
   TX microseconds: 16
   TX Maximum frames: 128
   Adaptive RX: On
   Adaptive TX: Off
   Sample interval seconds: 1

$ orvixcli network nic coalesce get --hwnic hwnic2 --formatter=json
[
  {
    "NIC": "hwnic2",
    "RX microseconds": "50",
    "RX maximum frames": "64",
    "TX microseconds": "50",
    "TX Maximum frames": "64",
    "Adaptive RX": "On",
    "Adaptive TX": "On",
    "Sample interval seconds": "2"
  }
]

$ orvixcli network nic coalesce get -n hwnic9
! Pnic with name hwnic9 not found
[1]

## No option writes back exactly what was read.
$ orvixcli network nic coalesce set -n hwnic0

$ orvixcli network nic coalesce get -n hwnic0
NIC     RX microseconds  RX maximum frames  TX microseconds  TX Maximum frames  Adaptive RX  Adaptive TX  Sample interval seconds
------  ---------------  -----------------  ---------------  -----------------  -----------  -----------  -----------------------
hwnic0  3                0                  0                0                  Off          Off          0

## The options given replace their value; the others keep theirs. The
## largest 32-bit count is taken.
$ orvixcli network nic coalesce set -n hwnic0 -r 4294967295 --tx-max-frames=12 -A true -i 3600

$ orvixcli network nic coalesce get -n hwnic0 --formatter=json
[
  {
    "NIC": "hwnic0",
    "RX microseconds": "4294967295",
    "RX maximum frames": "0",
    "TX microseconds": "0",
    "TX Maximum frames": "12",
    "Adaptive RX": "Off",
    "Adaptive TX": "On",
    "Sample interval seconds": "3600"
  }
]

$ orvixcli network nic coalesce set --hwnic=hwnic5 -R 0 -t 7 --adaptive-rx yes --formatter=json

$ orvixcli network nic coalesce get -n hwnic5
NIC     RX microseconds  RX maximum frames  TX microseconds  TX Maximum frames  Adaptive RX  Adaptive TX  Sample interval seconds
------  ---------------  -----------------  ---------------  -----------------  -----------  -----------  -----------------------
hwnic5  0                0                  7                1                  On           Off          0

## The sample interval is 1 to 3600 seconds, checked before the command
## runs.
$ orvixcli network nic coalesce set -n hwnic0 -i 0
! orvixcli: Value 0 for --sample-interval is out of range: it must be between 1 and 3600
! Run 'orvixcli network nic coalesce set --help' for its options.
[2]

## A count that does not fit the NIC's 32 bits is refused by the library,
## never cut down, and nothing of the record is written.
$ orvixcli network nic coalesce set -n hwnic2 -r 4294967296 -t 1
! Invalid RX microseconds value 4294967296 for NIC hwnic2: must be between 0 and 4294967295
[1]

$ orvixcli network nic coalesce set -n hwnic2 --tx-max-frames=-1 -a false
! Invalid TX maximum frames value -1 for NIC hwnic2: must be between 0 and 4294967295
[1]

$ orvixcli network nic coalesce get
NIC     RX microseconds  RX maximum frames  TX microseconds  TX Maximum frames  Adaptive RX  Adaptive TX  Sample interval seconds
------  ---------------  -----------------  ---------------  -----------------  -----------  -----------  -----------------------
hwnic0  4294967295       0                  0                12                 Off          On           3600
hwnic1  3                0                  0                0                  Off          Off          0
hwnic2  50               64                 50               64                 On           On           2
hwnic3  50               64                 50               64                 On           On           2
hwnic4  8                128                16               128                On           Off          1
hwnic5  0                0                  7                1                  On           Off          0
hwnic6  N/A              N/A                N/A              N/A                N/A          N/A          N/A
hwnic7  50               64                 50               64                 On           On           2

$ orvixcli network nic coalesce set -n hwnic9 -r 1
! Pnic with name hwnic9 not found
[1]
