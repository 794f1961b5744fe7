#include "nic/NicEepromChange.h"

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

const char* const kHwnic = "hwnic";
const char* const kOffset = "offset";
const char* const kValue = "value";
const char* const kFile = "file";
const char* const kMagic = "magic";

// Where the two refusals of a parameter combination say they were raised.
const char* const kSourcePath = "plugins/network/NicEepromChange";
constexpr int kFileWithOffsetLine = 142;
constexpr int kNothingToWriteLine = 162;

}  // namespace

NicEepromChange::NicEepromChange() {
    SetDescription("Change EEPROM on a nic");
}

ORVIX_COMMAND_NEW(NicEepromChange)

boost::shared_ptr<CallSpec::InputSpec> NicEepromChange::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, kHwnic, CallSpec::PARAM_STRING, "n", "Name of hwnic to change EEPROM.", Required::Yes);
    DeclareParameter(declared, kOffset, CallSpec::PARAM_INT, "o", "Offset of EEPROM to change", Required::No);
    DeclareParameter(declared, kValue, CallSpec::PARAM_INT, "v", "New EEPROM value in double word", Required::No);
    DeclareParameter(declared, kFile, CallSpec::PARAM_STRING, "f", "File name of new EEPROM content", Required::No);
    DeclareParameter(declared, kMagic, CallSpec::PARAM_INT, "m", "Magic key of EEPROM", Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicEepromChange::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicEepromChange::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    OnPnic(networkInfo, input, output, kHwnic, MissingNic::PnicNotFound, [&](HostCtl::Network::Pnic& pnic) {
        // Magic, offset and value reach the library whole; it refuses what
        // does not fit the EEPROM.
        const std::int64_t magic = input->GetInt(kMagic);
        if (input->IsSet(kFile)) {
            if (input->IsSet(kOffset) || input->IsSet(kValue)) {
                throw PldCtl::Lib::PldCtlException(
                    "Parameter --file can't be specified together with --offset and --value", kSourcePath,
                    kFileWithOffsetLine);
            }
            pnic.SetEepromFromFile(magic, input->GetString(kFile));
        } else {
            if (!input->IsSet(kOffset) || !input->IsSet(kValue)) {
                throw PldCtl::Lib::PldCtlException("Need to specify atleast one of --offset, --value or --file",
                                                   kSourcePath, kNothingToWriteLine);
            }
            pnic.SetEepromValue(magic, input->GetInt(kOffset), input->GetInt(kValue));
        }
        Finish(output, MetaObj::MetaBool::New());
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
