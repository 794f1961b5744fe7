## network ip ipsec set: a good file is checked, copied, and the IKE
## daemons are restarted (the host's exec log records it); a missing file,
## a folder or a missing option change nothing and restart nothing.
@profile fixtures/ip/ipsec-ike.json
$ sh -c "echo 'listen 2001:db8:10::21' > iked.conf; echo 'peer 2001:db8:10::91 psk-file=/etc/orvix/ike/psk' >> iked.conf"

$ orvixcli network ip ipsec set --ike-conf iked.conf

$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "ipsec": {
    "ikeConfig": "listen 2001:db8:10::21\npeer 2001:db8:10::91 psk-file=/etc/orvix/ike/psk\n",
    "ikeConfigSource": "iked.conf"
  },
  "execLog": [
    {
      "command": "/etc/init.d/iked restart",
      "exitStatus": 0
    }
  ]
}

$ orvixcli network ip ipsec set -f missing.conf
! IKE configuration missing.conf cannot be read: No such file or directory
[1]

$ mkdir conf.d

$ orvixcli network ip ipsec set -f conf.d
! IKE configuration conf.d is not a regular file
[1]

$ orvixcli network ip ipsec set
! orvixcli: Missing required option --ike-conf
! Run 'orvixcli network ip ipsec set --help' for its options.
[2]

$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "ipsec": {
    "ikeConfig": "listen 2001:db8:10::21\npeer 2001:db8:10::91 psk-file=/etc/orvix/ike/psk\n",
    "ikeConfigSource": "iked.conf"
  },
  "execLog": [
    {
      "command": "/etc/init.d/iked restart",
      "exitStatus": 0
    }
  ]
}

## The library's failures: a failed check copies nothing; a failed copy
## restarts nothing; a failed restart, or a failed run of the restart
## command, is reported after the copy.
$ sh -c "echo 'listen ::' > other.conf"

$ orvix-hostsim fault add IpSecConfigImpl::CheckIKEConfig --message "IKE configuration check failed" --count 1
1

$ orvixcli network ip ipsec set -f other.conf
! IKE configuration check failed
[1]

$ orvix-hostsim fault add IpSecConfigImpl::CopyIKEConfig --message "Unable to copy the IKE configuration" --count 1
2

$ orvixcli network ip ipsec set -f other.conf
! Unable to copy the IKE configuration
[1]

$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "ipsec": {
    "ikeConfig": "listen 2001:db8:10::21\npeer 2001:db8:10::91 psk-file=/etc/orvix/ike/psk\n",
    "ikeConfigSource": "iked.conf"
  },
  "execLog": [
    {
      "command": "/etc/init.d/iked restart",
      "exitStatus": 0
    }
  ]
}

$ orvix-hostsim fault add IpSecConfigImpl::RestartIKEDaemons --message "IKE daemons did not stop" --count 1
3

$ orvixcli network ip ipsec set -f other.conf
! IKE daemons did not stop
[1]

$ orvix-hostsim fault add Util::PldCtl_Exec --key "/etc/init.d/iked restart" --message "iked: address in use" --count 1
4

$ orvixcli network ip ipsec set -f iked.conf
! Unable to restart the IKE daemons
[1]

$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "ipsec": {
    "ikeConfig": "listen 2001:db8:10::21\npeer 2001:db8:10::91 psk-file=/etc/orvix/ike/psk\n",
    "ikeConfigSource": "iked.conf",
    "ikeDaemonsRunning": false
  },
  "execLog": [
    {
      "command": "/etc/init.d/iked restart",
      "exitStatus": 0
    },
    {
      "command": "/etc/init.d/iked restart",
      "exitStatus": 1
    }
  ]
}
