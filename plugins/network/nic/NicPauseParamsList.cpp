#include "nic/NicPauseParamsList.h"

#include "hostctl/network/NetworkFactory.h"
#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicPauseParamsList::NicPauseParamsList() {
    SetDescription("List pause parameters of all NICs");
    DescribeFetcher(*this, "table", kPauseRecord, PauseFields());
}

ORVIX_COMMAND_NEW(NicPauseParamsList)

boost::shared_ptr<CallSpec::InputSpec> NicPauseParamsList::GetInputSpecInternal() {
    return NicNameInput("nic-name", "The name of the NIC whose pause parameters should be retrieved.", Required::No);
}

boost::shared_ptr<CallSpec::OutputSpec> NicPauseParamsList::GetOutputSpecInternal() {
    return RowListOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> NicPauseParamsList::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kPauseRecord);
}

void NicPauseParamsList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                         boost::shared_ptr<CallSpec::Output> output) {
    std::unique_ptr<HostCtl::Network::NetworkInfo> nics = HostCtl::Network::NetworkFactory::GetNetworkInfo();
    ListNicRows(*nics, input, output, "nic-name", MissingNic::NicNotFound, GetOutputStructure(), PauseRow);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
