#include "nic/NicOptions.h"

#include <optional>
#include <utility>

#include "framework/Format.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/NetworkInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::CoalesceParams;
using HostCtl::Network::OffloadSettings;
using HostCtl::Network::PauseParams;
using HostCtl::Network::Pnic;
using HostCtl::Network::RingParams;
using HostCtl::Network::SoftwareSimulation;
using RecordPtr = boost::shared_ptr<MetaObj::MetaStruct>;

const char kNicField[] = "NIC";
const char kNotAvailable[] = "N/A";
const char kSoftwareSimulationRecord[] = "Settings";
const char kCoalesceRecord[] = "CoalesceParams";
const char kPauseRecord[] = "PauseParamsSettings";
const char kRingRecord[] = "RingInfo";

namespace {

// A fresh row of `type` for one NIC, its name filled in.
RecordPtr NicRow(const std::string& type, const Pnic& pnic) {
    RecordPtr record = MetaObj::MetaStruct::New(type);
    record->SetField(kNicField, pnic.GetName());
    return record;
}

// The field names of a table's entries, in table order, behind `leading`.
template <typename Table>
std::vector<std::string> FieldsOf(const Table& table, std::vector<std::string> leading) {
    for (const auto& entry : table) leading.push_back(entry.field);
    return leading;
}

// ---- Hardware offloads.

struct OffloadMember {
    const char* field;
    bool OffloadSettings::*member;
};

// One family's record type, the mask bits its set command marks and the
// members it shows and sets, in the order of its fields.
struct OffloadTable {
    const char* record;
    std::uint8_t mask;
    std::vector<OffloadMember> members;
};

const OffloadTable& TableOf(OffloadFamily family) {
    static const OffloadTable checksum = {
        "CSOSettings",
        OffloadSettings::MASK_RX_CHECKSUM | OffloadSettings::MASK_TX_CHECKSUM,
        {{"RX Checksum Offload", &OffloadSettings::rxChecksum}, {"TX Checksum Offload", &OffloadSettings::txChecksum}}};
    static const OffloadTable segmentation = {
        "TSOSettings", OffloadSettings::MASK_TSO, {{"Value", &OffloadSettings::tso}}};
    static const OffloadTable scatterGather = {
        "ScatterGatherSetting", OffloadSettings::MASK_SCATTER_GATHER, {{"Value", &OffloadSettings::scatterGather}}};
    switch (family) {
        case OffloadFamily::Checksum:
            return checksum;
        case OffloadFamily::Segmentation:
            return segmentation;
        case OffloadFamily::ScatterGather:
            break;
    }
    return scatterGather;
}

// ---- Software simulation.

// One option of software set with the feature it sets and the field the
// listing shows it in. Declared in this order; Geneve comes sixth here
// although it is the last feature of the record.
struct SoftwareOption {
    const char* option;
    const char* description;
    SoftwareSimulation::Feature feature;
    const char* field;
};

const SoftwareOption kSoftwareOptions[] = {
    {"ipv4cso", "Configure IPv4 checksum offload software simulation.", SoftwareSimulation::IPV4_CSO, "IPv4 CSO"},
    {"ipv4tso", "Configure IPv4 TCP segmentation offload software simulation.", SoftwareSimulation::IPV4_TSO,
     "IPv4 TSO"},
    {"sg", "Configure scatter gather software simulation.", SoftwareSimulation::SCATTER_GATHER, "Scatter Gather"},
    {"obo", "Configure offset based encapsulation offload software simulation.",
     SoftwareSimulation::OFFSET_BASED_OFFLOAD, "Offset Based Offload"},
    {"vxlanencap", "Configure VXLAN encapsulation offload software simulation.", SoftwareSimulation::VXLAN_ENCAP,
     "VXLAN Encap"},
    {"geneveoffload", "Configure Geneve encapsulation offload software simulation.", SoftwareSimulation::GENEVE_OFFLOAD,
     "Geneve Offload"},
    {"ipv6tso", "Configure IPv6 TCP segmentation offload software simulation.", SoftwareSimulation::IPV6_TSO,
     "IPv6 TSO"},
    {"ipv6tsoext", "Configure IPv6 extend header TCP segmentation offload software simulation.",
     SoftwareSimulation::IPV6_TSO_EXT, "IPv6 TSO Ext"},
    {"ipv6cso", "Configure IPv6 checksum offload software simulation.", SoftwareSimulation::IPV6_CSO, "IPv6 CSO"},
    {"ipv6csoext", "Configure IPv6 extend header checksum offload software simulation.",
     SoftwareSimulation::IPV6_CSO_EXT, "IPv6 CSO Ext"},
    {"highdma", "Configure high DMA software simulation.", SoftwareSimulation::HIGH_DMA, "High DMA"},
    {"sgsp", "Configure scatter gather span multiple pages software simulation.",
     SoftwareSimulation::SCATTER_GATHER_MULTI_PAGE, "Scatter Gather MP"},
    {"tagging", "Configure TX VLAN tagging software simulation.", SoftwareSimulation::VLAN_TAGGING, "VLAN Tagging"},
    {"untagging", "Configure RX VLAN untagging software simulation.", SoftwareSimulation::VLAN_UNTAGGING,
     "VLAN Untagging"},
};

// ---- Interrupt coalescing.

// One option of coalesce set with the field the listing shows its member
// in. Each sets either a count (`count`) or an adaptive switch (`flag`); the
// sample interval alone is bounded before the command runs.
struct CoalesceOption {
    const char* option;
    const char* shortName;
    const char* description;
    const char* field;
    std::int64_t CoalesceParams::*count;
    bool CoalesceParams::*flag;
    std::optional<std::pair<std::int64_t, std::int64_t>> range;
};

const CoalesceOption kCoalesceOptions[] = {
    {"rx-usecs", "r", "Number of microseconds driver to wait for RX before interrupting.", "RX microseconds",
     &CoalesceParams::rxUsecs, nullptr, std::nullopt},
    {"rx-max-frames", "R", "Maximum number of RX frames driver to process before interrupting.", "RX maximum frames",
     &CoalesceParams::rxMaxFrames, nullptr, std::nullopt},
    {"tx-usecs", "t", "Number of microseconds driver to wait for completed TX before interrupting.", "TX microseconds",
     &CoalesceParams::txUsecs, nullptr, std::nullopt},
    {"tx-max-frames", "T", "Maximum number of completed TX frames driver to process before interrupting.",
     "TX Maximum frames", &CoalesceParams::txMaxFrames, nullptr, std::nullopt},
    {"adaptive-rx", "a", "enable or disable adaptive RX algorithm in driver.", "Adaptive RX", nullptr,
     &CoalesceParams::adaptiveRx, std::nullopt},
    {"adaptive-tx", "A", "enable or disable adaptive TX algorithm in driver.", "Adaptive TX", nullptr,
     &CoalesceParams::adaptiveTx, std::nullopt},
    {"sample-interval", "i",
     "Packet rate sampling internal in seconds for the adaptive coalescing algorithm in driver.",
     "Sample interval seconds", &CoalesceParams::sampleInterval, nullptr, std::make_pair(1, 3600)},
};

// ---- Pause parameters.

const char kPauseSupported[] = "Pause Params Supported";
const char kPauseAuto[] = "Auto Negotiation";
const char kPauseRx[] = "Pause RX";
const char kPauseTx[] = "Pause TX";
const char kResolutionAvail[] = "Auto Negotiation Resolution Avail";
const char kRxResolution[] = "RX Auto Negotiation Resolution";
const char kTxResolution[] = "TX Auto Negotiation Resolution";

// A resolution code saying the direction is paused by the negotiated result.
constexpr int kPausedByNegotiation = 1;

// ---- Ring sizes.

struct RingSize {
    const char* option;
    const char* shortName;
    const char* description;
    const char* field;
    std::uint8_t mask;
    std::int64_t RingParams::*member;
};

const RingSize kRingSizes[] = {
    {"rx", "r", "Number of ring entries for the RX ring.", "RX", RingParams::MASK_RX, &RingParams::rx},
    {"rx-mini", "m", "Number of ring entries for the RX mini ring.", "RX Mini", RingParams::MASK_RX_MINI,
     &RingParams::rxMini},
    {"rx-jumbo", "j", "Number of ring entries for the RX jumbo ring.", "RX Jumbo", RingParams::MASK_RX_JUMBO,
     &RingParams::rxJumbo},
    {"tx", "t", "Number of ring entries for the TX ring.", "TX", RingParams::MASK_TX, &RingParams::tx},
};

}  // namespace

const char* OnOff(bool value) {
    return value ? "on" : "off";
}

const char* OnOffCapitalised(bool value) {
    return value ? "On" : "Off";
}

boost::shared_ptr<CallSpec::InputSpec> NicNameInput(const std::string& parameter, const std::string& description,
                                                    Required required) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, parameter, CallSpec::PARAM_STRING, "n", description, required);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> RowListOutputSpec(const RecordPtr& templ) {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, templ));
}

void DescribeFetcher(AutoCli::Command& command, const std::string& formatter, const std::string& record,
                     const std::vector<std::string>& fields) {
    command.SetMetaDataField("type", "fetcher");
    command.SetDefaultOutputFormatter(formatter);
    command.SetDefaultOutputParameter("fields:" + record, AutoCli::JoinNames(fields, ","));
}

void ListNicRows(HostCtl::Network::NetworkInfo& nics, const boost::shared_ptr<CallSpec::Input>& input,
                 const boost::shared_ptr<CallSpec::Output>& output, const std::string& parameter, MissingNic how,
                 const RecordPtr& templ, const std::function<RecordPtr(Pnic&)>& row) {
    ReportingHostErrors(output, [&] {
        std::optional<std::vector<std::unique_ptr<Pnic>>> selected =
            parameter.empty() ? nics.GetPnics() : SelectPnics(nics, *input, parameter, how, *output);
        if (!selected) return;
        boost::shared_ptr<MetaObj::MetaList> rows = MetaObj::MetaList::New(MetaObj::META_STRUCT, templ);
        rows->Reserve(selected->size());
        for (const std::unique_ptr<Pnic>& pnic : *selected) rows->Append(row(*pnic));
        Finish(output, rows);
    });
}

void ChangeNic(HostCtl::Network::NetworkInfo& nics, const boost::shared_ptr<CallSpec::Input>& input,
               const boost::shared_ptr<CallSpec::Output>& output, const std::string& parameter, MissingNic how,
               const std::function<void(Pnic&)>& change) {
    OnPnic(nics, input, output, parameter, how, [&](Pnic& pnic) {
        change(pnic);
        Finish(output, MetaObj::MetaBool::New());
    });
}

std::string OffloadRecordType(OffloadFamily family) {
    return TableOf(family).record;
}

std::vector<std::string> OffloadFields(OffloadFamily family) {
    return FieldsOf(TableOf(family).members, {kNicField});
}

RecordPtr OffloadRow(OffloadFamily family, Pnic& pnic) {
    const OffloadTable& table = TableOf(family);
    RecordPtr record = NicRow(table.record, pnic);
    OffloadSettings settings;
    const bool answered = NicAnswers([&] { pnic.GetOffloadSettings(settings); });
    for (const OffloadMember& entry : table.members) {
        record->SetField(entry.field, answered ? OnOff(settings.*entry.member) : kNotAvailable);
    }
    return record;
}

void SetOffload(OffloadFamily family, Pnic& pnic, bool enable) {
    const OffloadTable& table = TableOf(family);
    OffloadSettings settings;
    pnic.GetOffloadSettings(settings);
    settings.mask = table.mask;
    for (const OffloadMember& entry : table.members) settings.*entry.member = enable;
    pnic.SetOffloadSettings(settings);
}

boost::shared_ptr<CallSpec::InputSpec> OffloadSetInput(const std::string& hwnicDescription,
                                                       const std::string& enableDescription) {
    boost::shared_ptr<CallSpec::InputSpec> declared = NicNameInput("hwnic", hwnicDescription, Required::Yes);
    DeclareParameter(declared, "enable", CallSpec::PARAM_INT, "e", enableDescription, Required::Yes, IntRange(0, 1));
    return declared;
}

void ListOffloads(OffloadFamily family, const boost::shared_ptr<CallSpec::Input>& input,
                  const boost::shared_ptr<CallSpec::Output>& output) {
    PldCtl::Network::NetworkInfoImpl nics;
    ListNicRows(nics, input, output, "hwnic", MissingNic::PnicNotFound,
                MetaObj::MetaStruct::New(OffloadRecordType(family)),
                [family](Pnic& pnic) { return OffloadRow(family, pnic); });
}

void ChangeOffload(OffloadFamily family, const boost::shared_ptr<CallSpec::Input>& input,
                   const boost::shared_ptr<CallSpec::Output>& output) {
    PldCtl::Network::NetworkInfoImpl nics;
    ChangeNic(nics, input, output, "hwnic", MissingNic::PnicNotFound,
              [&](Pnic& pnic) { SetOffload(family, pnic, input->GetInt("enable") != 0); });
}

std::vector<std::string> SoftwareSimulationFields() {
    return FieldsOf(kSoftwareOptions, {kNicField});
}

void AddSoftwareSimulationParameters(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec) {
    // None has a short name, so the one-line declaration, which always sets
    // one, does not fit.
    for (const SoftwareOption& entry : kSoftwareOptions) {
        boost::shared_ptr<CallSpec::ParameterSpec> parameter =
            CallSpec::ParameterSpec::New(entry.option, CallSpec::PARAM_BOOL);
        parameter->SetDescription(entry.description);
        parameter->SetRequired(Required::No);
        inputSpec->AddParameter(parameter);
    }
}

RecordPtr SoftwareSimulationRow(Pnic& pnic) {
    RecordPtr record = NicRow(kSoftwareSimulationRecord, pnic);
    SoftwareSimulation simulation;
    const bool answered = NicAnswers([&] { pnic.GetSoftwareSimulation(simulation); });
    for (const SoftwareOption& entry : kSoftwareOptions) {
        record->SetField(entry.field,
                         answered ? OnOff(simulation.enabled[static_cast<std::size_t>(entry.feature)]) : kNotAvailable);
    }
    return record;
}

SoftwareSimulation SoftwareSimulationFromOptions(const CallSpec::Input& input) {
    SoftwareSimulation simulation;
    for (const SoftwareOption& entry : kSoftwareOptions) {
        if (!input.IsSet(entry.option)) continue;
        simulation.mask |= SoftwareSimulation::MaskOf(entry.feature);
        simulation.enabled[static_cast<std::size_t>(entry.feature)] = input.GetBool(entry.option);
    }
    return simulation;
}

std::vector<std::string> CoalesceFields() {
    return FieldsOf(kCoalesceOptions, {kNicField});
}

void AddCoalesceParameters(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec) {
    for (const CoalesceOption& entry : kCoalesceOptions) {
        DeclareParameter(inputSpec, entry.option, entry.flag ? CallSpec::PARAM_BOOL : CallSpec::PARAM_INT,
                         entry.shortName, entry.description, Required::No,
                         entry.range ? IntRange(entry.range->first, entry.range->second)
                                     : boost::shared_ptr<CallSpec::ParameterConstraint>());
    }
}

RecordPtr CoalesceRow(Pnic& pnic) {
    RecordPtr record = NicRow(kCoalesceRecord, pnic);
    CoalesceParams params;
    const bool answered = NicAnswers([&] { pnic.GetCoalesceParams(params); });
    for (const CoalesceOption& entry : kCoalesceOptions) {
        if (!answered) {
            record->SetField(entry.field, kNotAvailable);
        } else if (entry.flag) {
            record->SetField(entry.field, OnOffCapitalised(params.*entry.flag));
        } else {
            record->SetField(entry.field, std::to_string(params.*entry.count));
        }
    }
    return record;
}

void RewriteCoalesce(const CallSpec::Input& input, Pnic& pnic) {
    CoalesceParams params;
    pnic.GetCoalesceParams(params);
    for (const CoalesceOption& entry : kCoalesceOptions) {
        if (!input.IsSet(entry.option)) continue;
        if (entry.flag) {
            params.*entry.flag = input.GetBool(entry.option);
        } else {
            params.*entry.count = input.GetInt(entry.option);
        }
    }
    pnic.SetCoalesceParams(params);
}

std::vector<std::string> PauseFields() {
    return {kNicField, kPauseSupported, kPauseRx, kPauseTx, kPauseAuto, kResolutionAvail, kRxResolution, kTxResolution};
}

RecordPtr PauseRow(Pnic& pnic) {
    RecordPtr record = NicRow(kPauseRecord, pnic);
    PauseParams params;
    // A NIC that fails part-way may have filled some members; what it does
    // not support, or could not report, shows as nothing set.
    if (!NicAnswers([&] { pnic.GetPauseParams(params); }) || !params.supported) params = PauseParams();
    const bool resolved = params.rxResolution != 0 && params.txResolution != 0;
    record->SetField(kPauseSupported, params.supported);
    record->SetField(kPauseAuto, params.autoNegotiate);
    record->SetField(kPauseRx, params.rx);
    record->SetField(kPauseTx, params.tx);
    record->SetField(kResolutionAvail, resolved);
    record->SetField(kRxResolution, resolved && params.rxResolution == kPausedByNegotiation);
    record->SetField(kTxResolution, resolved && params.txResolution == kPausedByNegotiation);
    return record;
}

void RewritePause(const CallSpec::Input& input, Pnic& pnic) {
    PauseParams params;
    pnic.GetPauseParams(params);
    if (input.IsSet("auto")) params.autoNegotiate = input.GetBool("auto");
    if (input.IsSet("rx")) params.rx = input.GetBool("rx");
    if (input.IsSet("tx")) params.tx = input.GetBool("tx");
    pnic.SetPauseParams(params);
}

std::vector<std::string> RingFields() {
    return FieldsOf(kRingSizes, {});
}

RecordPtr RingRecord(Pnic& pnic, RingChoice choice) {
    RingParams preset;
    RingParams current;
    pnic.GetRingParams(preset, current);
    const RingParams& chosen = choice == RingChoice::Preset ? preset : current;
    RecordPtr record = MetaObj::MetaStruct::New(kRingRecord);
    for (const RingSize& entry : kRingSizes) record->SetField(entry.field, chosen.*entry.member);
    return record;
}

void ShowRing(RingChoice choice, const boost::shared_ptr<CallSpec::Input>& input,
              const boost::shared_ptr<CallSpec::Output>& output) {
    std::unique_ptr<HostCtl::Network::NetworkInfo> nics = HostCtl::Network::NetworkFactory::GetNetworkInfo();
    OnPnic(*nics, input, output, "nic-name", MissingNic::NicNotFound,
           [&](Pnic& pnic) { Finish(output, RingRecord(pnic, choice)); });
}

void AddRingSizeParameters(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec) {
    for (const RingSize& entry : kRingSizes) {
        DeclareParameter(inputSpec, entry.option, CallSpec::PARAM_INT, entry.shortName, entry.description,
                         Required::No);
    }
}

RingParams RingSizesFromOptions(const CallSpec::Input& input) {
    RingParams params;
    for (const RingSize& entry : kRingSizes) {
        if (!input.IsSet(entry.option)) continue;
        params.mask |= entry.mask;
        params.*entry.member = input.GetInt(entry.option);
    }
    return params;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
