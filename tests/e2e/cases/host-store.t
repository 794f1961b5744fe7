## A host store that cannot be used stops every command with a clear error
## naming the file, exit status 3, and is left exactly as it was.
$ sh -c "printf 'this is not a database' > host.db"

$ orvixcli network ip get
! orvixcli: host store '$TMP/host.db' is not an SQLite database or is damaged
[3]

$ cat host.db
this is not a database
