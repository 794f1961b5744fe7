## network ip interface tag add, get and remove on the default host, where
## migrix runs with an interface and faultTolerance is configured only.
$ orvixcli network ip interface tag get -i pld0
   Tags: Management

$ orvixcli network ip interface tag get -i pld1 --formatter=json
{
  "Tags": [
    "Storage",
    "Backup"
  ]
}

$ orvixcli network ip interface tag get --interface-name pld2 --formatter=xml
<?xml version="1.0" encoding="UTF-8"?>
<output>
  <structure typeName="InterfaceTag">
    <field name="Tags"><list type="string"><string>LiveMigration</string></list></field>
  </structure>
</output>

$ orvixcli network ip interface tag add -i pld0 -t Backup

$ orvixcli network ip interface tag add -i pld0 -t Telemetry

$ orvixcli network ip interface tag get -i pld0 --formatter=json
{
  "Tags": [
    "Management",
    "Backup",
    "Telemetry"
  ]
}

## Adding a tag the interface has changes nothing.
$ orvixcli network ip interface tag add -i pld0 -t Backup

$ orvixcli network ip interface tag get -i pld0
   Tags: Management, Backup, Telemetry

## Tag names are the library's, compared exactly: two messages for any other.
$ orvixcli network ip interface tag add -i pld0 -t backup
! Invalid tag name backup
! Supported tags are: Management, LiveMigration, FaultTolerance, Backup, Replication, Provisioning, Storage, Telemetry
[1]

$ orvixcli network ip interface tag add -i pld9 -t "Live Migration"
! Invalid tag name Live Migration
! Supported tags are: Management, LiveMigration, FaultTolerance, Backup, Replication, Provisioning, Storage, Telemetry
[1]

$ orvixcli network ip interface tag remove -i pld0 -t Mgmt
! Invalid tag name Mgmt
! Supported tags are: Management, LiveMigration, FaultTolerance, Backup, Replication, Provisioning, Storage, Telemetry
[1]

$ orvixcli network ip interface tag remove -i pld0 -t ""
! Invalid tag name 
! Supported tags are: Management, LiveMigration, FaultTolerance, Backup, Replication, Provisioning, Storage, Telemetry
[1]

## Interfaces the host does not have.
$ orvixcli network ip interface tag add -i pld9 -t Backup
! Unable to find pldnic with name pld9
[1]

$ orvixcli network ip interface tag remove -i pld9 -t Backup
! Unable to find pldnic with name pld9
[1]

$ orvixcli network ip interface tag get -i pld9
! Unable to find an interface with name pld9
[1]

$ orvixcli network ip interface tag get -i PLD0
! Unable to find an interface with name PLD0
[1]

## A dedicated tag cannot be added by hand while its netstack runs with
## interfaces (migrix has pld2), whatever the interface.
$ orvixcli network ip interface tag add -i pld0 -t LiveMigration
! Failed to add LiveMigration tag when dedicated stack is instantiated
[1]

$ orvixcli network ip interface tag add -i pld2 -t LiveMigration
! Failed to add LiveMigration tag when dedicated stack is instantiated
[1]

$ orvixcli network ip interface tag add -i pld9 -t LiveMigration
! Failed to add LiveMigration tag when dedicated stack is instantiated
[1]

## faultTolerance is only configured: its tag can be added.
$ orvixcli network ip interface tag add -i pld1 -t FaultTolerance

## An interface on a dedicated netstack takes no other tag.
$ orvixcli network ip interface tag add -i pld2 -t Management
! netstack mismatch for tagManagement
[1]

$ orvixcli network ip interface tag add -i pld2 -t FaultTolerance
! netstack mismatch for tagFaultTolerance
[1]

$ orvixcli network ip interface tag get -i pld2
   Tags: LiveMigration

## Removing: any tag, dedicated ones on their own netstack too; a tag the
## interface does not have changes nothing.
$ orvixcli network ip interface tag remove -i pld2 -t LiveMigration

$ orvixcli network ip interface tag remove -i pld1 -t Storage

$ orvixcli network ip interface tag remove -i pld1 -t Provisioning

$ orvixcli network ip interface tag get -i pld1
   Tags: Backup, FaultTolerance

$ orvixcli network ip interface tag get -i pld2 --formatter=json
{
  "Tags": []
}

## Options are required.
$ orvixcli network ip interface tag add -i pld0
! orvixcli: Missing required option --tagname
! Run 'orvixcli network ip interface tag add --help' for its options.
[2]

$ orvixcli network ip interface tag get
! orvixcli: Missing required option --interface-name
! Run 'orvixcli network ip interface tag get --help' for its options.
[2]

## The supported tags are listed in the help of tag add.
$ orvixcli network ip interface tag add --help
Usage: orvixcli network ip interface tag add [cmd options]

Description:
  Adds a tag on a given Pallad network interface. Supported tags are: Management, LiveMigration, FaultTolerance, Backup, Replication, Provisioning, Storage, Telemetry

Cmd options:
  -i|--interface-name=<str>  (required)
      The name of the Pallad network interface on which tags should be set. This name must be an interface listed in the interface list command.
  -t|--tagname=<str>  (required)
      Tag name to assign to the interface
