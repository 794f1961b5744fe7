## network ip interface tag add, get and remove on the default host, where
## migrix runs with an interface and faultTolerance is configured only.
$ orvixcli network ip interface tag get -i pld0

$ orvixcli network ip interface tag get -i pld1 --formatter=json

$ orvixcli network ip interface tag get --interface-name pld2 --formatter=xml

$ orvixcli network ip interface tag add -i pld0 -t Backup

$ orvixcli network ip interface tag add -i pld0 -t Telemetry

$ orvixcli network ip interface tag get -i pld0 --formatter=json

## Adding a tag the interface has changes nothing.
$ orvixcli network ip interface tag add -i pld0 -t Backup

$ orvixcli network ip interface tag get -i pld0

## Tag names are the library's, compared exactly: two messages for any other.
$ orvixcli network ip interface tag add -i pld0 -t backup

$ orvixcli network ip interface tag add -i pld9 -t "Live Migration"

$ orvixcli network ip interface tag remove -i pld0 -t Mgmt

$ orvixcli network ip interface tag remove -i pld0 -t ""

## Interfaces the host does not have.
$ orvixcli network ip interface tag add -i pld9 -t Backup

$ orvixcli network ip interface tag remove -i pld9 -t Backup

$ orvixcli network ip interface tag get -i pld9

$ orvixcli network ip interface tag get -i PLD0

## A dedicated tag cannot be added by hand while its netstack runs with
## interfaces (migrix has pld2), whatever the interface.
$ orvixcli network ip interface tag add -i pld0 -t LiveMigration

$ orvixcli network ip interface tag add -i pld2 -t LiveMigration

$ orvixcli network ip interface tag add -i pld9 -t LiveMigration

## faultTolerance is only configured: its tag can be added.
$ orvixcli network ip interface tag add -i pld1 -t FaultTolerance

## An interface on a dedicated netstack takes no other tag.
$ orvixcli network ip interface tag add -i pld2 -t Management

$ orvixcli network ip interface tag add -i pld2 -t FaultTolerance

$ orvixcli network ip interface tag get -i pld2

## Removing: any tag, dedicated ones on their own netstack too; a tag the
## interface does not have changes nothing.
$ orvixcli network ip interface tag remove -i pld2 -t LiveMigration

$ orvixcli network ip interface tag remove -i pld1 -t Storage

$ orvixcli network ip interface tag remove -i pld1 -t Provisioning

$ orvixcli network ip interface tag get -i pld1

$ orvixcli network ip interface tag get -i pld2 --formatter=json

## Options are required.
$ orvixcli network ip interface tag add -i pld0

$ orvixcli network ip interface tag get

## The supported tags are listed in the help of tag add.
$ orvixcli network ip interface tag add --help
