## Search domains of a netstack: order after add and remove, the empty list,
## and text that cannot be stored as one domain.
$ orvixcli network ip dns search list
   DNS Search Domains: example.test, lab.example.com

$ orvixcli network ip dns search list --formatter=json
{
  "DNS Search Domains": [
    "example.test",
    "lab.example.com"
  ]
}

$ orvixcli network ip dns search list -N migrix
   DNS Search Domains: migration.example.test

$ orvixcli network ip dns search list -N faultTolerance
   DNS Search Domains: 

$ orvixcli network ip dns search list -N faultTolerance --formatter=json
{
  "DNS Search Domains": []
}

$ orvixcli network ip dns search list --netstack=
   DNS Search Domains: example.test, lab.example.com

$ orvixcli network ip dns search list -N nowhere
! Netstack instance nowhere does not exist
[1]

$ orvixcli network ip dns search add --domain corp.example.test

$ orvixcli network ip dns search add -d a.example.test

$ orvixcli network ip dns search list
   DNS Search Domains: example.test, lab.example.com, corp.example.test, a.example.test

$ orvixcli network ip dns search add -d a.example.test
! Search domain a.example.test is already configured
[1]

$ orvixcli network ip dns search remove -d example.test

$ orvixcli network ip dns search remove --domain example.test
! Search domain example.test is not configured
[1]

$ orvixcli network ip dns search list --formatter=json
{
  "DNS Search Domains": [
    "lab.example.com",
    "corp.example.test",
    "a.example.test"
  ]
}

## A domain is one word: empty, blank, with a blank or a control character
## inside, it is refused and the list stays as it was.
$ orvixcli network ip dns search add -d ""
! Invalid search domain '': use a name without blanks or control characters
[1]

$ orvixcli network ip dns search add -d " "
! Invalid search domain ' ': use a name without blanks or control characters
[1]

$ orvixcli network ip dns search add -d "two words.example.test"
! Invalid search domain 'two words.example.test': use a name without blanks or control characters
[1]

$ orvixcli network ip dns search add -d "tab	inside.example.test"
! Invalid search domain 'tab\x09inside.example.test': use a name without blanks or control characters
[1]

$ orvixcli network ip dns search list
   DNS Search Domains: lab.example.com, corp.example.test, a.example.test

$ orvixcli network ip dns search add -d first.example.test -N faultTolerance

$ orvixcli network ip dns search add -d second.example.test -N faultTolerance

$ orvixcli network ip dns search list -N faultTolerance
   DNS Search Domains: first.example.test, second.example.test

$ orvixcli network ip dns search remove -d first.example.test -N faultTolerance

$ orvixcli network ip dns search remove -d second.example.test -N faultTolerance

$ orvixcli network ip dns search list -N faultTolerance --formatter=json
{
  "DNS Search Domains": []
}

$ orvixcli network ip dns search add -d x.example.test -N nowhere
! Netstack instance nowhere does not exist
[1]
