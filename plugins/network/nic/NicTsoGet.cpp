#include "nic/NicTsoGet.h"

#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicTsoGet::NicTsoGet() {
    SetDescription("Get TCP segmentation offload settings");
    DescribeFetcher(*this, "table", OffloadRecordType(OffloadFamily::Segmentation),
                    OffloadFields(OffloadFamily::Segmentation));
}

ORVIX_COMMAND_NEW(NicTsoGet)

boost::shared_ptr<CallSpec::InputSpec> NicTsoGet::GetInputSpecInternal() {
    return NicNameInput("hwnic", "The name of pnic to get TSO settings", Required::No);
}

boost::shared_ptr<CallSpec::OutputSpec> NicTsoGet::GetOutputSpecInternal() {
    return RowListOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> NicTsoGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New(OffloadRecordType(OffloadFamily::Segmentation));
}

void NicTsoGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    ListOffloads(OffloadFamily::Segmentation, input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
