#include "nic/NicDown.h"

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"
#include "nic/NicRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicDown::NicDown() {
    SetDescription("Bring down the specified network device.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(NicDown)

boost::shared_ptr<CallSpec::InputSpec> NicDown::GetInputSpecInternal() {
    return NicNameInput();
}

boost::shared_ptr<CallSpec::OutputSpec> NicDown::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicDown::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    OnPnic(networkInfo, input, output, "nic-name", MissingNic::NoPnic, [&](HostCtl::Network::Pnic& pnic) {
        pnic.SetAdminUp(false);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
