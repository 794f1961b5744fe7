#include "nic/NicCsoGet.h"

#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicCsoGet::NicCsoGet() {
    SetDescription("Get checksum offload settings");
    DescribeFetcher(*this, "table", OffloadRecordType(OffloadFamily::Checksum), OffloadFields(OffloadFamily::Checksum));
}

ORVIX_COMMAND_NEW(NicCsoGet)

boost::shared_ptr<CallSpec::InputSpec> NicCsoGet::GetInputSpecInternal() {
    return NicNameInput("hwnic", "The name of pnic to get CSO settings", Required::No);
}

boost::shared_ptr<CallSpec::OutputSpec> NicCsoGet::GetOutputSpecInternal() {
    return RowListOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> NicCsoGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New(OffloadRecordType(OffloadFamily::Checksum));
}

void NicCsoGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    ListOffloads(OffloadFamily::Checksum, input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
