## Worlds by ascending id whatever the switch order, with one network per
## port (a port group on a standard switch, the distributed port group on a
## distributed one), repeats kept. Names lose their first five characters;
## a name of exactly five becomes empty, a shorter one stays as it is. A
## world without ports is not listed.
@profile fixtures/vm/worlds.json
$ orvixcli network vm list
$ orvixcli network vm list --formatter=json
$ orvixcli network vm list --formatter=simple
