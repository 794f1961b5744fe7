#include "nic/NicCoalesceGet.h"

#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicCoalesceGet::NicCoalesceGet() {
    SetDescription("Get coalesce parameters");
    DescribeFetcher(*this, "table", kCoalesceRecord, CoalesceFields());
}

ORVIX_COMMAND_NEW(NicCoalesceGet)

boost::shared_ptr<CallSpec::InputSpec> NicCoalesceGet::GetInputSpecInternal() {
    return NicNameInput("hwnic", "The name of pnic to get coalesce parameters", Required::No);
}

boost::shared_ptr<CallSpec::OutputSpec> NicCoalesceGet::GetOutputSpecInternal() {
    return RowListOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> NicCoalesceGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kCoalesceRecord);
}

void NicCoalesceGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl nics;
    ListNicRows(nics, input, output, "hwnic", MissingNic::PnicNotFound, GetOutputStructure(), CoalesceRow);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
