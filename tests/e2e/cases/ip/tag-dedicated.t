## The dedicated tags against netstacks in every state: running with
## interfaces (migrix), running without interfaces (BrenvoProvisioning),
## configured only (faultTolerance, where pld7 is).
@profile fixtures/ip/interface-points.json

$ orvixcli network ip interface tag add -i pld4 -t LiveMigration

$ orvixcli network ip interface tag add -i pld4 -t Provisioning

$ orvixcli network ip interface tag get -i pld4

## On pld7 only its own netstack's tag passes; the check for a running
## dedicated netstack comes first.
$ orvixcli network ip interface tag add -i pld7 -t FaultTolerance

$ orvixcli network ip interface tag add -i pld7 -t Provisioning

$ orvixcli network ip interface tag add -i pld7 -t Storage

$ orvixcli network ip interface tag add -i pld7 -t LiveMigration

$ orvixcli network ip interface tag get -i pld7

## Once migrix has no interface left, its tag can be added by hand, and on
## an interface of its own netstack.
$ orvixcli network ip interface remove -i pld2

$ orvixcli network ip interface tag add -i pld0 -t LiveMigration

$ orvixcli network ip interface add -p Migration -N migrix -i pld2

$ orvixcli network ip interface tag remove -i pld2 -t LiveMigration

$ orvixcli network ip interface tag add -i pld2 -t LiveMigration

$ orvixcli network ip interface tag get -i pld2
