#include "nic/NicEepromDump.h"

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"
#include "nic/NicRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

const char* const kRecord = "EepromDump";
const char* const kOffsetField = "Offset";
const char* const kValueField = "Value";
const char* const kHwnic = "hwnic";
const char* const kOffset = "offset";
const char* const kLength = "length";

}  // namespace

NicEepromDump::NicEepromDump() {
    SetDescription("Dump device EEPROM");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter(std::string("fields:") + kRecord, std::string(kOffsetField) + "," + kValueField);
}

ORVIX_COMMAND_NEW(NicEepromDump)

boost::shared_ptr<CallSpec::InputSpec> NicEepromDump::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, kHwnic, CallSpec::PARAM_STRING, "n", "The name of pnic to dump EEPROM", Required::Yes);
    DeclareParameter(declared, kOffset, CallSpec::PARAM_INT, "o", "Offset of EEPROM starting to dump", Required::No);
    DeclareParameter(declared, kLength, CallSpec::PARAM_INT, "l", "Bytes of EEPROM to dump", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicEepromDump::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> NicEepromDump::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kRecord);
}

boost::shared_ptr<MetaObj::MetaList> NicEepromDump::DumpBinary(std::int64_t offset,
                                                               const std::vector<std::uint8_t>& bytes) {
    boost::shared_ptr<MetaObj::MetaList> records = MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
    // The library refuses a negative offset before handing out any bytes.
    if (offset >= 0) {
        AppendDumpRecords(*records, EepromRows(static_cast<std::uint64_t>(offset), bytes), kRecord, kOffsetField,
                          kValueField);
    }
    return records;
}

void NicEepromDump::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                    boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    OnPnic(networkInfo, input, output, kHwnic, MissingNic::PnicNotFound, [&](HostCtl::Network::Pnic& pnic) {
        const std::int64_t offset = input->IsSet(kOffset) ? input->GetInt(kOffset) : 0;
        const std::int64_t length = input->IsSet(kLength) ? input->GetInt(kLength) : 0;
        std::vector<std::uint8_t> bytes;
        pnic.GetEeprom(bytes, length, offset);
        Finish(output, DumpBinary(offset, bytes));
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
