#include "nic/NicSgSet.h"

#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicSgSet::NicSgSet() {
    SetDescription("Set scatter-gatter settings on a nic");
}

ORVIX_COMMAND_NEW(NicSgSet)

boost::shared_ptr<CallSpec::InputSpec> NicSgSet::GetInputSpecInternal() {
    return OffloadSetInput("Name of hwnic to configure scatter-gather settings.", "Enable/disable sacatter-gather");
}

boost::shared_ptr<CallSpec::OutputSpec> NicSgSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicSgSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    ChangeOffload(OffloadFamily::ScatterGather, input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
