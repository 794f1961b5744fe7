#include "nic/NicSoftwareList.h"

#include "hostctl/network/NetworkFactory.h"
#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicSoftwareList::NicSoftwareList() {
    SetDescription(
        "List software simulation settings of all physical NICs currently installed and loaded on the system.");
    DescribeFetcher(*this, "table", kSoftwareSimulationRecord, SoftwareSimulationFields());
}

ORVIX_COMMAND_NEW(NicSoftwareList)

boost::shared_ptr<CallSpec::InputSpec> NicSoftwareList::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> NicSoftwareList::GetOutputSpecInternal() {
    return RowListOutputSpec(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> NicSoftwareList::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kSoftwareSimulationRecord);
}

void NicSoftwareList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    std::unique_ptr<HostCtl::Network::NetworkInfo> nics = HostCtl::Network::NetworkFactory::GetNetworkInfo();
    ListNicRows(*nics, input, output, "", MissingNic::PnicNotFound, GetOutputStructure(), SoftwareSimulationRow);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
