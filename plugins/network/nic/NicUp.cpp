#include "nic/NicUp.h"

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"
#include "nic/NicRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicUp::NicUp() {
    SetDescription("Bring up the specified network device.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(NicUp)

boost::shared_ptr<CallSpec::InputSpec> NicUp::GetInputSpecInternal() {
    return NicNameInput();
}

boost::shared_ptr<CallSpec::OutputSpec> NicUp::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicUp::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    OnPnic(networkInfo, input, output, "nic-name", MissingNic::NoPnic, [&](HostCtl::Network::Pnic& pnic) {
        pnic.SetAdminUp(true);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
