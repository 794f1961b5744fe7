#include "ip/ipsec/IpIpsecSARemove.h"

#include <optional>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"
#include "ip/ipsec/IpsecOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

const char* const kName = "sa-name";
const char* const kRemoveAll = "remove-all";
const char* const kSource = "sa-source";
const char* const kDestination = "sa-destination";
const char* const kSpi = "sa-spi";

// The explanation of the three forms, a message a line: the runner shows
// control characters inside a message escaped, so a line break has to be the
// end of a message.
const char* const kWhichOperation[] = {
    "Can not figure out which operation you want to perform.",
    "Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.",
    ("Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' and "
     "'--sa-spi' and omit '--remove-all' when removing an auto SA."),
    "Remove all SAs: You should only set the flag '--remove-all' to remove all SAs.",
};

}  // namespace

IpIpsecSARemove::IpIpsecSARemove() {
    SetDescription("Operation to remove Security Association(s)");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpIpsecSARemove)

boost::shared_ptr<CallSpec::InputSpec> IpIpsecSARemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = CallSpec::InputSpec::New();
    DeclareParameter(inputSpec, kName, CallSpec::PARAM_STRING, "n",
                     "Name for the Security Association to be removed. Specify 'auto' to remove an auto SA.",
                     Required::No);
    DeclareParameter(inputSpec, kRemoveAll, CallSpec::PARAM_FLAG, "a", "Set to remove all Security Associations.",
                     Required::No);
    DeclareParameter(inputSpec, kSource, CallSpec::PARAM_STRING, "s",
                     "Ipv6 address of Security Association source. This option needs to be specified when removing an "
                     "auto SA.",
                     Required::No);
    DeclareParameter(inputSpec, kDestination, CallSpec::PARAM_STRING, "d",
                     "Ipv6 address of Security Association destination. This option needs to be specified when "
                     "removing an auto SA.",
                     Required::No);
    DeclareParameter(inputSpec, kSpi, CallSpec::PARAM_STRING, "p",
                     "SPI value for the Security Association (hex). This option needs to be specified when removing "
                     "an auto SA",
                     Required::No);
    return inputSpec;
}

boost::shared_ptr<CallSpec::OutputSpec> IpIpsecSARemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpIpsecSARemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    const bool named = input->IsSet(kName);
    const bool automatic = named && input->GetString(kName) == "auto";
    const bool removeAll = input->GetFlag(kRemoveAll);
    const bool source = input->IsSet(kSource);
    const bool destination = input->IsSet(kDestination);
    const bool spi = input->IsSet(kSpi);
    const bool anyEnd = source || destination || spi;
    ReportingHostErrors(output, [&] {
        PldCtl::Network::IpSecConfigImpl config;
        if (named && !automatic && !removeAll && !anyEnd) {
            config.RemoveSADConfig(input->GetString(kName));
        } else if (automatic && source && destination && spi && !removeAll) {
            HostCtl::Network::IpSecSadParam sa;
            sa.source = HostCtl::Network::Ipv6Address(input->GetString(kSource));
            sa.destination = HostCtl::Network::Ipv6Address(input->GetString(kDestination));
            const std::optional<std::uint32_t> value = ReadSpi(*input, *output);
            if (!value) return;
            sa.spi = *value;
            config.RemoveAutoSADConfig(sa);
        } else if (removeAll && !named && !anyEnd) {
            config.FlushSADConfig();
        } else {
            for (const char* line : kWhichOperation) output->SetError(line);
            return;
        }
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
