#include "nic/NicSet.h"

#include <optional>
#include <string>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"
#include "nic/NicRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using HostCtl::Lib::HostCtlException;

// A PHY address of -1 asks to keep the current one.
constexpr std::int64_t kKeepPhyAddress = -1;

}  // namespace

NicSet::NicSet() {
    SetDescription("Set the general options for the specified ethernet device.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(NicSet)

boost::shared_ptr<CallSpec::InputSpec> NicSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = NicNameInput();
    DeclareParameter(declared, "port", CallSpec::PARAM_STRING, "p",
                     "Selects device port. Available device ports are %FULLENUM%", Required::No,
                     StringEnum(PortChoices()));
    DeclareParameter(declared, "phy-address", CallSpec::PARAM_INT, "P", "Set the PHY address of the device",
                     Required::No);
    DeclareParameter(declared, "virtual-address", CallSpec::PARAM_STRING, "V", "Set the virtual address of the device",
                     Required::No);
    DeclareParameter(declared, "transceiver-type", CallSpec::PARAM_STRING, "t",
                     "Selects transeiver type. Currently only internal and external can be specified, in the future "
                     "future types might be added. Available transeiver types are %FULLENUM%",
                     Required::No,
                     StringEnum({{"internal", "Set the transceiver type to internal"},
                                 {"external", "Set the transceiver type to external"}}));
    DeclareParameter(declared, "wake-on-lan", CallSpec::PARAM_STRING, "w",
                     "Sets Wake-on-LAN options. Not all devices support this. The argument to this option is a string "
                     "of characters specifying which options to enable. \n"
                     "p Wake on phy activity\n"
                     "u Wake on unicast messages\n"
                     "m Wake on multicast messages\n"
                     "b Wake on broadcast messages\n"
                     "a Wake on ARP\n"
                     "g Wake on MagicPacket(tm)\n"
                     "s Enable SecureOn(tm) password for MagicPacket(tm)\n",
                     Required::No, StringRegex("[pumbagsd]+"));
    DeclareParameter(declared, "message-level", CallSpec::PARAM_INT, "l",
                     "Sets the driver message level. Meaning differ per driver.", Required::No);
    DeclareParameter(declared, "speed", CallSpec::PARAM_INT, "S",
                     "The speed to set this NIC to, in Mbps. Acceptable values are :%ENUM%", Required::No,
                     IntEnum({10, 100, 1000, 2500, 5000, 10000, 20000, 25000, 40000, 50000, 56000, 100000}));
    DeclareParameter(declared, "duplex", CallSpec::PARAM_STRING, "D",
                     "The duplex to set this NIC to. Acceptable values are :%ENUM%", Required::No,
                     StringEnum({{"full", "Set this nic to full duplex"}, {"half", "Set this nic to half duplex"}}));
    DeclareParameter(declared, "auto", CallSpec::PARAM_FLAG, "a",
                     "Set the speed and duplexity settings to autonegotiate.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

bool NicSet::GetInfoFromParam(const CallSpec::Input& input, HostCtl::Network::PnicInfo& info) {
    bool changed = false;
    if (input.IsSet("port")) {
        std::optional<int> port = PortCodeOfWord(input.GetString("port"));
        if (port && *port != info.port) {
            info.port = *port;
            info.portChanged = true;
            changed = true;
        }
    }
    if (input.IsSet("phy-address")) {
        const std::int64_t address = input.GetInt("phy-address");
        if (address != kKeepPhyAddress) {
            if (address <= 0) throw HostCtlException("Invalid PHY address value.");
            if (address != info.phyAddress) {
                info.phyAddress = address;
                info.phyAddressChanged = true;
                changed = true;
            }
        }
    }
    if (input.IsSet("virtual-address")) {
        const std::string address = input.GetString("virtual-address");
        if (address != info.virtualAddress) {
            info.virtualAddress = address;
            info.virtualAddressChanged = true;
            changed = true;
        }
    }
    if (input.IsSet("transceiver-type")) {
        std::optional<int> transceiver = TransceiverCodeOfWord(input.GetString("transceiver-type"));
        if (transceiver && *transceiver != info.transceiver) {
            info.transceiver = *transceiver;
            info.transceiverChanged = true;
            changed = true;
        }
    }
    if (input.IsSet("wake-on-lan")) {
        if (!info.supportsWakeOn) throw HostCtlException("Not Support wol.");
        // The letters replace the NIC's modes whole, so this always counts as
        // a change, even when they name the modes already enabled.
        info.wakeOnChanged = true;
        info.wakeOnModes.clear();
        for (char letter : input.GetString("wake-on-lan")) {
            std::optional<HostCtl::Network::WakeOnMode> mode = WakeOnModeOfLetter(letter);
            if (!mode) throw HostCtlException("Invalid wol value.");
            info.wakeOnModes.push_back(*mode);
        }
        changed = true;
    }
    if (input.IsSet("message-level")) {
        if (!info.supportsMessageLevel) throw HostCtlException("Not Support msglvl.");
        // Passed on whole: the library refuses a level that does not fit its
        // 32 bits rather than storing a wrapped one.
        const std::int64_t level = input.GetInt("message-level");
        if (level != info.messageLevel) {
            info.messageLevel = level;
            info.messageLevelChanged = true;
            changed = true;
        }
    }
    return changed;
}

void NicSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(output, [&] {
        const std::string name = input->GetString("nic-name");
        const bool speed = input->IsSet("speed");
        const bool duplex = input->IsSet("duplex");
        const bool autoNegotiate = input->GetFlag("auto");
        if (speed != duplex) {
            output->SetError("The --speed and --duplex options must be specified together");
            return;
        }
        if (autoNegotiate && speed) {
            output->SetError("The options --speed and --duplex cannot be specified with the --auto option.");
            return;
        }
        const bool linkChange = autoNegotiate || speed;

        std::unique_ptr<HostCtl::Network::Pnic> pnic = FindPnic(networkInfo, name, MissingNic::NoPnic, *output);
        if (!pnic) return;
        HostCtl::Network::PnicInfo info;
        pnic->GetPnicInfo(info);
        if (GetInfoFromParam(*input, info)) {
            pnic->SetPnicInfo(info);
        } else if (!linkChange) {
            output->SetError("There is no change for nic " + name);
            return;
        }
        if (speed) {
            pnic->SetLinkSpeedDuplex(input->GetInt("speed"), input->GetString("duplex") == "full"
                                                                 ? HostCtl::Network::DUPLEX_FULL
                                                                 : HostCtl::Network::DUPLEX_HALF);
        } else if (autoNegotiate) {
            pnic->SetLinkSpeedDuplex(0, 0);
        }
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
