#include "nic/NicSelfTestRun.h"

#include <string>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

// The self test's rows share the EEPROM dump's record type.
const char* const kRecord = "EepromDump";
const char* const kItem = "Item";
const char* const kValue = "Value";
const char* const kHwnic = "hwnic";
const char* const kOnline = "online";

}  // namespace

NicSelfTestRun::NicSelfTestRun() {
    SetDescription("Run self test");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter(std::string("fields:") + kRecord, std::string(kItem) + "," + kValue);
}

ORVIX_COMMAND_NEW(NicSelfTestRun)

boost::shared_ptr<CallSpec::InputSpec> NicSelfTestRun::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, kHwnic, CallSpec::PARAM_STRING, "n", "The name of pnic to dump EEPROM", Required::Yes);
    DeclareParameter(declared, kOnline, CallSpec::PARAM_INT, "o",
                     "Performing limited set of tests do not inetrrupt normal adapter operation, default is offline",
                     Required::No, IntRange(0, 1));
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicSelfTestRun::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> NicSelfTestRun::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kRecord);
}

void NicSelfTestRun::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    OnPnic(networkInfo, input, output, kHwnic, MissingNic::PnicNotFound, [&](HostCtl::Network::Pnic& pnic) {
        const bool online = input->IsSet(kOnline) && input->GetInt(kOnline) != 0;
        HostCtl::Network::SelfTestResult result;
        pnic.RunSelfTest(result, online);

        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        records->Reserve(result.info.size() + 1);
        auto append = [&](const char* item, const std::string& value) {
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            record->SetField(kItem, item);
            record->SetField(kValue, value);
            records->Append(std::move(record));
        };
        append("Result", result.passed ? "Passed" : "Failed");
        for (const std::string& line : result.info) append("Info", line);
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
