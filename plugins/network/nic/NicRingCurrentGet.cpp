#include "nic/NicRingCurrentGet.h"

#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicRingCurrentGet::NicRingCurrentGet() {
    SetDescription("Get current RX/TX ring buffer parameters of a NIC");
    DescribeFetcher(*this, "simple", kRingRecord, RingFields());
}

ORVIX_COMMAND_NEW(NicRingCurrentGet)

boost::shared_ptr<CallSpec::InputSpec> NicRingCurrentGet::GetInputSpecInternal() {
    return NicNameInput("nic-name",
                        "The name of the NIC whose current RX/TX ring buffer parameters should be retrieved.",
                        Required::Yes);
}

boost::shared_ptr<CallSpec::OutputSpec> NicRingCurrentGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> NicRingCurrentGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kRingRecord);
}

void NicRingCurrentGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    ShowRing(RingChoice::Current, input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
