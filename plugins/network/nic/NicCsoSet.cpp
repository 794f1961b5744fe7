#include "nic/NicCsoSet.h"

#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicCsoSet::NicCsoSet() {
    SetDescription("Set checksum offload settings on a nic");
}

ORVIX_COMMAND_NEW(NicCsoSet)

boost::shared_ptr<CallSpec::InputSpec> NicCsoSet::GetInputSpecInternal() {
    return OffloadSetInput("Name of hwnic to set offload settings.", "RX/TX checksum offload");
}

boost::shared_ptr<CallSpec::OutputSpec> NicCsoSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicCsoSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    ChangeOffload(OffloadFamily::Checksum, input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
