#include "nic/NicRingPresetGet.h"

#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicRingPresetGet::NicRingPresetGet() {
    SetDescription("Get preset RX/TX ring buffer parameters of a NIC");
    DescribeFetcher(*this, "simple", kRingRecord, RingFields());
}

ORVIX_COMMAND_NEW(NicRingPresetGet)

boost::shared_ptr<CallSpec::InputSpec> NicRingPresetGet::GetInputSpecInternal() {
    return NicNameInput("nic-name",
                        "The name of the NIC whose preset RX/TX ring buffer parameters should be retrieved.",
                        Required::Yes);
}

boost::shared_ptr<CallSpec::OutputSpec> NicRingPresetGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> NicRingPresetGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kRingRecord);
}

void NicRingPresetGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                       boost::shared_ptr<CallSpec::Output> output) {
    ShowRing(RingChoice::Preset, input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
