## The default host's three virtual machines.
$ orvixcli network vm list
$ orvixcli network vm port list -w 1049601
$ orvixcli network vm port list -w 1050310 --formatter=json
