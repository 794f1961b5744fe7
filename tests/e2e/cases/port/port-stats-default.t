## The default host: a VM port on the distributed switch and a kernel port.
$ orvixcli network port stats get -p 67108870
$ orvixcli network port stats get -p 33554436 --formatter=csv
$ orvixcli network port filter stats get -p 67108869
