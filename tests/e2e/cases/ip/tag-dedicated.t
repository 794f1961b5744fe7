## The dedicated tags against netstacks in every state: running with
## interfaces (migrix), running without interfaces (BrenvoProvisioning),
## configured only (faultTolerance, where pld7 is).
@profile fixtures/ip/interface-points.json

$ orvixcli network ip interface tag add -i pld4 -t LiveMigration
! Failed to add LiveMigration tag when dedicated stack is instantiated
[1]

$ orvixcli network ip interface tag add -i pld4 -t Provisioning

$ orvixcli network ip interface tag get -i pld4
   Tags: Provisioning

## On pld7 only its own netstack's tag passes; the check for a running
## dedicated netstack comes first.
$ orvixcli network ip interface tag add -i pld7 -t FaultTolerance

$ orvixcli network ip interface tag add -i pld7 -t Provisioning
! netstack mismatch for tagProvisioning
[1]

$ orvixcli network ip interface tag add -i pld7 -t Storage
! netstack mismatch for tagStorage
[1]

$ orvixcli network ip interface tag add -i pld7 -t LiveMigration
! Failed to add LiveMigration tag when dedicated stack is instantiated
[1]

$ orvixcli network ip interface tag get -i pld7
   Tags: FaultTolerance

## Once migrix has no interface left its tag can be added by hand; an
## interface made on migrix takes it over again, and from then on not even
## migrix's own interface can be given it by hand.
$ orvixcli network ip interface remove -i pld2

$ orvixcli network ip interface tag add -i pld4 -t LiveMigration

$ orvixcli network ip interface tag get -i pld4
   Tags: Provisioning, LiveMigration

$ orvixcli network ip interface add -p Migration -N migrix -i pld2

$ orvixcli network ip interface tag get -i pld4
   Tags: Provisioning

$ orvixcli network ip interface tag get -i pld0
   Tags: Management

$ orvixcli network ip interface tag remove -i pld2 -t LiveMigration

$ orvixcli network ip interface tag add -i pld2 -t LiveMigration
! Failed to add LiveMigration tag when dedicated stack is instantiated
[1]

$ orvixcli network ip interface tag get -i pld2 --formatter=json
{
  "Tags": []
}
