#include "ip/ipsec/IpIpsecSAAdd.h"

#include <optional>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"
#include "ip/ipsec/IpsecOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpIpsecSAAdd::IpIpsecSAAdd() {
    SetDescription("Add a Security Association.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpIpsecSAAdd)

boost::shared_ptr<CallSpec::InputSpec> IpIpsecSAAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = CallSpec::InputSpec::New();
    DeclareParameter(inputSpec, "sa-name", CallSpec::PARAM_STRING, "n",
                     "Name for the Security Association to be added.", Required::Yes);
    DeclareParameter(inputSpec, "sa-source", CallSpec::PARAM_STRING, "s",
                     "Ipv6 address of Security Association source. Can be specified as 'any' or a correct IPv6 "
                     "address.",
                     Required::Yes);
    DeclareParameter(inputSpec, "sa-destination", CallSpec::PARAM_STRING, "d",
                     "Ipv6 address of Security Association destination. Can be specified as 'any' or a correct IPv6 "
                     "address.",
                     Required::Yes);
    DeclareParameter(inputSpec, "sa-mode", CallSpec::PARAM_STRING, "m",
                     "Security Association mode. Should be one in set %ENUM%.", Required::No,
                     StringEnum({{"transport", ""}, {"tunnel", ""}}));
    DeclareParameter(inputSpec, "sa-spi", CallSpec::PARAM_STRING, "p", "SPI value for the Security Association(hex).",
                     Required::Yes);
    DeclareParameter(inputSpec, "encryption-algorithm", CallSpec::PARAM_STRING, "e",
                     "Encryption algorithm for the Security Association. Should be one in set %ENUM%.", Required::Yes,
                     StringEnum({{"null", ""}, {"3des-cbc", ""}, {"aes128-cbc", ""}}));
    DeclareParameter(inputSpec, "encryption-key", CallSpec::PARAM_STRING, "k",
                     "Encryption key(ASCII or hex). Length of hex key is dependent upon algorithm used. Required when "
                     "a encryption algorithm has been specified.",
                     Required::No);
    DeclareParameter(inputSpec, "integrity-algorithm", CallSpec::PARAM_STRING, "i",
                     "Integrity algorithm for the Security Association. Should be one in set %ENUM%.", Required::Yes,
                     StringEnum({{"hmac-sha1", ""}, {"hmac-sha2-256", ""}}));
    DeclareParameter(inputSpec, "integrity-key", CallSpec::PARAM_STRING, "K",
                     "Integrity key(ASCII or hex). Length of hex key is dependent upon algorithm used.", Required::Yes);
    return inputSpec;
}

boost::shared_ptr<CallSpec::OutputSpec> IpIpsecSAAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpIpsecSAAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                   boost::shared_ptr<CallSpec::Output> output) {
    using PldCtl::Network::IpSecConfigImpl;
    ReportingHostErrors(output, [&] {
        HostCtl::Network::IpSecSadParam sa;
        sa.name = input->GetString("sa-name");
        sa.source = SaEndAddress(input->GetString("sa-source"));
        sa.destination = SaEndAddress(input->GetString("sa-destination"));
        const std::optional<std::uint32_t> spi = ReadSpi(*input, *output);
        if (!spi) return;
        sa.spi = *spi;
        sa.mode = IpSecConfigImpl::StringToIpSecMode(input->GetString("sa-mode"));
        const std::string encryption = input->GetString("encryption-algorithm");
        sa.encryptionAlgorithm = IpSecConfigImpl::StringToIpSecEncyptAlgo(encryption);
        sa.integrityAlgorithm = IpSecConfigImpl::StringToIpSecAuthAlgo(input->GetString("integrity-algorithm"));
        sa.integrityKey = input->GetString("integrity-key");
        if (input->IsSet("encryption-key")) {
            sa.encryptionKey = input->GetString("encryption-key");
        } else if (encryption != "null") {
            output->SetError("Missing encryption key");
            return;
        }
        IpSecConfigImpl config;
        config.AddSADConfig(sa);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
