#include "nic/NicSgGet.h"

#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicSgGet::NicSgGet() {
    SetDescription("Get scatter-gather settings");
    DescribeFetcher(*this, "table", OffloadRecordType(OffloadFamily::ScatterGather),
                    OffloadFields(OffloadFamily::ScatterGather));
}

ORVIX_COMMAND_NEW(NicSgGet)

boost::shared_ptr<CallSpec::InputSpec> NicSgGet::GetInputSpecInternal() {
    return NicNameInput("hwnic", "The name of pnic to get scatter-gather settings", Required::No);
}

boost::shared_ptr<CallSpec::OutputSpec> NicSgGet::GetOutputSpecInternal() {
    return RowListOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> NicSgGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New(OffloadRecordType(OffloadFamily::ScatterGather));
}

void NicSgGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    ListOffloads(OffloadFamily::ScatterGather, input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
