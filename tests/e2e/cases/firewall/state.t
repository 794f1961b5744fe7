## The firewall's state: get in every formatter, and every rule of set with
## its messages in their order.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall get

$ orvixcli network firewall get --formatter=json

$ orvixcli network firewall get --formatter=xml

$ orvixcli network firewall get --formatter=keyvalue

## No parameter: refused before the module is looked at.
$ orvixcli network firewall set

## An equal enabled state is accepted and changes nothing.
$ orvixcli network firewall set --enabled=true

$ orvixcli network firewall set -e true --formatter=json

$ orvixcli network firewall get

## The default action already in force is refused.
$ orvixcli network firewall set --default-action=false

## The enabled change is made first and stays when the default action is
## refused.
$ orvixcli network firewall set --enabled=false --default-action=false

$ orvixcli network firewall get

$ orvixcli network firewall set -d true

$ orvixcli network firewall get --formatter=json

$ orvixcli network firewall set --default-action=yes

$ orvixcli network firewall set --enabled=1 --default-action=0

$ orvixcli network firewall get

$ orvixcli network firewall set --enabled=maybe
