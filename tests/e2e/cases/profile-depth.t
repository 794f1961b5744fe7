## A profile nested too deeply is refused before a host is built from it,
## by both tools, and leaves no file behind.
@env ORVIX_HOST_PROFILE=deep.json
$ sh -c "{ printf '{\"format\": \"orvix-host-profile\", \"version\": 1, \"system\": {\"x\": '; printf '%100000s' '' | tr ' ' '['; printf '%100000s' '' | tr ' ' ']'; printf '}}'; } > deep.json"

$ orvix-hostsim init --profile deep.json
! orvix-hostsim: profile deep.json: nested deeper than 64 levels at line 1, column 126
[1]

$ orvixcli network ip get
! orvixcli: host store '$TMP/host.db' cannot be created: profile deep.json: nested deeper than 64 levels at line 1, column 126
[3]

$ ls -A
deep.json
