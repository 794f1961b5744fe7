## The firewall's state: get in every formatter, and every rule of set with
## its messages in their order.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall get
   Loaded: true
   Enabled: true
   DefaultAction: DROP

$ orvixcli network firewall get --formatter=json
{
  "Loaded": true,
  "Enabled": true,
  "DefaultAction": "DROP"
}

$ orvixcli network firewall get --formatter=xml
<?xml version="1.0" encoding="UTF-8"?>
<output>
  <structure typeName="Firewall">
    <field name="Loaded"><boolean>true</boolean></field>
    <field name="Enabled"><boolean>true</boolean></field>
    <field name="DefaultAction"><string>DROP</string></field>
  </structure>
</output>

$ orvixcli network firewall get --formatter=keyvalue
Firewall.Loaded=true
Firewall.Enabled=true
Firewall.DefaultAction=DROP

## No parameter: refused before the module is looked at.
$ orvixcli network firewall set
! Need parameter --enabled or --default-action
[1]

## An equal enabled state is accepted and changes nothing.
$ orvixcli network firewall set --enabled=true

$ orvixcli network firewall set -e true --formatter=json
true

$ orvixcli network firewall get
   Loaded: true
   Enabled: true
   DefaultAction: DROP

## The default action already in force is refused.
$ orvixcli network firewall set --default-action=false
! Default action already DROP
[1]

## The enabled change is made first and stays when the default action is
## refused.
$ orvixcli network firewall set --enabled=false --default-action=false
! Default action already DROP
[1]

$ orvixcli network firewall get
   Loaded: true
   Enabled: false
   DefaultAction: DROP

$ orvixcli network firewall set -d true

$ orvixcli network firewall get --formatter=json
{
  "Loaded": true,
  "Enabled": false,
  "DefaultAction": "PASS"
}

$ orvixcli network firewall set --default-action=yes
! Default action already PASS
[1]

$ orvixcli network firewall set --enabled=1 --default-action=0

$ orvixcli network firewall get
   Loaded: true
   Enabled: true
   DefaultAction: DROP

$ orvixcli network firewall set --enabled=maybe
! orvixcli: Invalid value 'maybe' for --enabled: expected true or false
! Run 'orvixcli network firewall set --help' for its options.
[2]
