## network nic selftest run: the result row first, then the driver's lines.
## Without --online the offline test runs.
@profile fixtures/nic/diag.json
$ orvixcli network nic selftest run -n hwnic0

$ orvixcli network nic selftest run -n hwnic0 --online 1

$ orvixcli network nic selftest run -n hwnic0 --online 0 --formatter=json

$ orvixcli network nic selftest run -n hwnic0 --online 2

## A failed test without any line still has its result row.
$ orvixcli network nic selftest run -n hwnic2

$ orvixcli network nic selftest run -n hwnic1

$ orvixcli network nic selftest run -n hwnic9
