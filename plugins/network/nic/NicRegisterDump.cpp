#include "nic/NicRegisterDump.h"

#include <cstdint>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"
#include "nic/NicRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

const char* const kRecord = "RegisterDump";
const char* const kOffset = "Offset";
const char* const kValue = "Value";
const char* const kHwnic = "hwnic";

}  // namespace

NicRegisterDump::NicRegisterDump() {
    SetDescription("Dump device registers");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter(std::string("fields:") + kRecord, std::string(kOffset) + "," + kValue);
}

ORVIX_COMMAND_NEW(NicRegisterDump)

boost::shared_ptr<CallSpec::InputSpec> NicRegisterDump::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, kHwnic, CallSpec::PARAM_STRING, "n", "The name of pnic to dump registers",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicRegisterDump::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> NicRegisterDump::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kRecord);
}

void NicRegisterDump::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    OnPnic(networkInfo, input, output, kHwnic, MissingNic::PnicNotFound, [&](HostCtl::Network::Pnic& pnic) {
        std::vector<std::uint32_t> registers;
        pnic.GetRegisters(registers);
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        AppendDumpRecords(*records, RegisterRows(registers), kRecord, kOffset, kValue);
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
