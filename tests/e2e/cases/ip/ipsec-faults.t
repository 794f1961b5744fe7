## The library's failures in the IPsec commands reach the user as the
## library's message alone, and nothing changes.
$ orvix-hostsim fault add IpSecConfigImpl::GetSADConfigList --message "SA database is locked" --count 1

$ orvixcli network ip ipsec sa list

$ orvix-hostsim fault add IpSecConfigImpl::AddSADConfig --key sa-new --message "Unable to add SA sa-new" --count 1

$ orvixcli network ip ipsec sa add -n sa-new -s any -d any -p 1 -e null -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567

$ orvix-hostsim fault add IpSecConfigImpl::RemoveSADConfig --key sa-lab --message "Unable to remove SA sa-lab" --count 1

$ orvixcli network ip ipsec sa remove -n sa-lab

$ orvix-hostsim fault add IpSecConfigImpl::RemoveAutoSADConfig --message "Unable to remove the automatic SA" --count 1

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90 -p 2710

$ orvix-hostsim fault add IpSecConfigImpl::FlushSADConfig --message "Unable to flush the SA database" --count 1

$ orvixcli network ip ipsec sa remove -a

$ orvixcli network ip ipsec sa list --formatter=simple

$ orvix-hostsim fault add IpSecConfigImpl::GetSPDConfigList --message "SP database is locked" --count 1

$ orvixcli network ip ipsec sp list --formatter=json

$ orvix-hostsim fault add IpSecConfigImpl::AddSPDConfig --key sp-new --message "Unable to add SP sp-new" --count 1

$ orvixcli network ip ipsec sp add -n sp-new -s any -d any -p 0 -P 0

$ orvix-hostsim fault add IpSecConfigImpl::RemoveSPDConfig --key sp-lab --message "Unable to remove SP sp-lab" --count 1

$ orvixcli network ip ipsec sp remove -n sp-lab

$ orvix-hostsim fault add IpSecConfigImpl::FlushSPDConfig --message "Unable to flush the SP database" --count 1

$ orvixcli network ip ipsec sp remove -a

$ orvixcli network ip ipsec sp list

## ipsec set: a failed check copies nothing; a failed restart is reported
## after the copy; a failed run of the restart command is the library's
## own refusal.
$ sh -c "printf 'listen ::\n' > iked.conf"

$ orvix-hostsim fault add IpSecConfigImpl::CheckIKEConfig --message "IKE configuration check failed" --count 1

$ orvixcli network ip ipsec set -f iked.conf

$ orvix-hostsim fault add IpSecConfigImpl::CopyIKEConfig --message "Unable to copy the IKE configuration" --count 1

$ orvixcli network ip ipsec set -f iked.conf

$ orvix-hostsim fault add IpSecConfigImpl::RestartIKEDaemons --message "IKE daemons did not stop" --count 1

$ orvixcli network ip ipsec set -f iked.conf

$ orvix-hostsim fault add Util::PldCtl_Exec --key "/etc/init.d/iked restart" --message "iked: address in use" --count 1

$ orvixcli network ip ipsec set -f iked.conf

$ sh -c "orvix-hostsim dump | sed -n '/\"execLog\"/,/^  ]/p'"
