#include "nic/NicGet.h"

#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"
#include "nic/NicRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicGet::NicGet() {
    SetDescription("Get the generic configuration of a network device");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

ORVIX_COMMAND_NEW(NicGet)

boost::shared_ptr<CallSpec::InputSpec> NicGet::GetInputSpecInternal() {
    return NicNameInput();
}

boost::shared_ptr<CallSpec::OutputSpec> NicGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

// The record's fields are laid out here, without values, so that the record
// shows them in this order however they are filled; a field left without a
// value (the pause fields of a NIC without pause support) is not shown.
boost::shared_ptr<MetaObj::MetaStruct> NicGet::GetOutputStructure() {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("NICInfo");
    record->SetField("Name", MetaObj::MetaString::New());
    record->SetField("Supported Ports", MetaObj::MetaList::New(MetaObj::META_STRING));
    record->SetField("Supports Auto Negotiation", MetaObj::MetaBool::New());
    record->SetField("Advertised Link Modes", MetaObj::MetaList::New(MetaObj::META_STRING));
    record->SetField("Advertised Auto Negotiation", MetaObj::MetaBool::New());
    record->SetField("Cable Type", MetaObj::MetaString::New());
    record->SetField("PHY Address", MetaObj::MetaInt::New());
    record->SetField("Virtual Address", MetaObj::MetaString::New());
    record->SetField("Transceiver", MetaObj::MetaString::New());
    record->SetField("Auto Negotiation", MetaObj::MetaBool::New());
    record->SetField("Supports Wakeon", MetaObj::MetaBool::New());
    record->SetField("Wakeon", MetaObj::MetaList::New(MetaObj::META_STRING));
    record->SetField("Current Message Level", MetaObj::MetaInt::New());
    record->SetField("Link Detected", MetaObj::MetaBool::New());
    record->SetField("Supports Pause", MetaObj::MetaBool::New());
    record->SetField("Pause Autonegotiate", MetaObj::MetaBool::New());
    record->SetField("Pause RX", MetaObj::MetaBool::New());
    record->SetField("Pause TX", MetaObj::MetaBool::New());
    record->SetField("Link Status", MetaObj::MetaString::New());
    record->SetField("Driver Info", GetDriverInfoStructure());
    return record;
}

boost::shared_ptr<MetaObj::MetaStruct> NicGet::GetDriverInfoStructure() {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("NICDriverInfo");
    for (const char* field : {"Driver", "Version", "Firmware Version", "Bus Info"}) {
        record->SetField(field, MetaObj::MetaString::New());
    }
    return record;
}

void NicGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    OnPnic(networkInfo, input, output, "nic-name", MissingNic::NoPnic, [&](HostCtl::Network::Pnic& pnic) {
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        HostCtl::Network::PnicInfo info;
        HostCtl::Network::PauseParams pause;
        HostCtl::Network::DriverInfo driver;
        pnic.GetPnicInfo(info);
        pnic.GetPauseParams(pause);
        pnic.GetDriverInfo(driver);

        record->SetField("Name", input->GetString("nic-name"));
        std::vector<std::string> ports;
        for (int code : info.supportedPorts) ports.push_back(SupportedPortWord(code));
        record->SetField("Supported Ports", std::move(ports));
        record->SetField("Supports Auto Negotiation", info.supportsAutoNegotiation);
        std::vector<std::string> modes;
        for (const HostCtl::Network::LinkMode& mode : info.advertisedLinkModes) modes.push_back(LinkModeText(mode));
        record->SetField("Advertised Link Modes", std::move(modes));
        record->SetField("Advertised Auto Negotiation", info.advertisedAutoNegotiation);
        record->SetField("Cable Type", CableTypeWord(info.port));
        record->SetField("PHY Address", static_cast<long long>(info.phyAddress));
        record->SetField("Virtual Address", info.virtualAddress);
        record->SetField("Transceiver", TransceiverWord(info.transceiver));
        record->SetField("Auto Negotiation", info.autoNegotiation);
        std::vector<std::string> wakeOn;
        if (info.supportsWakeOn) {
            for (HostCtl::Network::WakeOnMode mode : info.wakeOnModes) wakeOn.push_back(WakeOnWord(mode));
        } else {
            wakeOn.push_back("None");
        }
        record->SetField("Wakeon", std::move(wakeOn));
        record->SetField("Supports Wakeon", info.supportsWakeOn);
        record->SetField("Link Status", info.linkStatus);
        record->SetField("Current Message Level",
                         info.supportsMessageLevel ? static_cast<long long>(info.messageLevel) : -1LL);
        record->SetField("Link Detected", pnic.IsLinkUp());
        record->SetField("Supports Pause", pause.supported);
        if (pause.supported) {
            record->SetField("Pause Autonegotiate", pause.autoNegotiate);
            record->SetField("Pause RX", pause.rx);
            record->SetField("Pause TX", pause.tx);
        }
        boost::shared_ptr<MetaObj::MetaStruct> driverRecord = GetDriverInfoStructure();
        driverRecord->SetField("Driver", driver.driver);
        driverRecord->SetField("Version", driver.version);
        driverRecord->SetField("Firmware Version", driver.firmwareVersion);
        driverRecord->SetField("Bus Info", driver.busInfo);
        record->SetField("Driver Info", driverRecord);
        Finish(output, record);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
