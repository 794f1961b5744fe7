#include "nic/NicTsoSet.h"

#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicTsoSet::NicTsoSet() {
    SetDescription("Set TCP segmentation offload settings on a nic");
}

ORVIX_COMMAND_NEW(NicTsoSet)

boost::shared_ptr<CallSpec::InputSpec> NicTsoSet::GetInputSpecInternal() {
    return OffloadSetInput("Name of hwnic to set TSO settings.", "TCP segmentation offload");
}

boost::shared_ptr<CallSpec::OutputSpec> NicTsoSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicTsoSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    ChangeOffload(OffloadFamily::Segmentation, input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
