#include "vswitch/dvs/LacpGetConfig.h"

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <utility>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkFactory.h"
#include "vswitch/dvs/DvsLookup.h"
#include "vswitch/dvs/DvsOptions.h"
#include "vswitch/dvs/DvsRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

// The first LACP-enabled uplink DV port of each distributed port group of
// `dvs`, by ascending port group id.
std::map<std::string, std::unique_ptr<HostCtl::Network::DVPort>> LacpUplinkGroups(
    const HostCtl::Network::DVSwitch& dvs) {
    std::map<std::string, std::unique_ptr<HostCtl::Network::DVPort>> groups;
    const std::string uuid = dvs.GetUUID();
    for (const auto& port : dvs.GetPorts()) {
        if (port->GetType() != HostCtl::Network::Port::TYPE_UPLINK) continue;
        HostCtl::Network::DVPortParam param;
        param.switchUuid = uuid;
        param.portId = port->GetDVPortId();
        std::unique_ptr<HostCtl::Network::DVPort> dvPort = HostCtl::Network::NetworkFactory::GetDVPort(param);
        if (!dvPort || !dvPort->IsLacpEnabled()) continue;
        const std::string group = dvPort->GetDVPortgroupId();
        groups.emplace(group, std::move(dvPort));
    }
    return groups;
}

}  // namespace

LacpGetConfig::LacpGetConfig() {
    SetDescription("Get LACP configuration on DVS");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:LACP", LacpConfigFieldList());
}

ORVIX_COMMAND_NEW(LacpGetConfig)

boost::shared_ptr<CallSpec::InputSpec> LacpGetConfig::GetInputSpecInternal() {
    return LacpReaderInput();
}

boost::shared_ptr<CallSpec::OutputSpec> LacpGetConfig::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> LacpGetConfig::GetOutputStructure() {
    return LacpConfigTemplate();
}

void LacpGetConfig::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                    boost::shared_ptr<CallSpec::Output> output) {
    ReportingHostErrors(output, [&] {
        const std::optional<DVSwitchList> switches = SelectLacpSwitches(*input, *output);
        if (!switches) return;
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        for (const auto& dvs : *switches) {
            const std::string dvsName = dvs->GetName();
            BuildThenRelease(
                dvs->GetLacpConfig(),
                [&](std::unique_ptr<HostCtl::Network::LacpConfig> config) {
                    dvs->ReleaseLacpConfig(std::move(config));
                },
                [&](const HostCtl::Network::LacpConfig& config) {
                    if (config.lags.empty()) {
                        // LACP set per uplink port group rather than by LAGs.
                        for (const auto& group : LacpUplinkGroups(*dvs)) {
                            records->Append(LacpConfigUplinkRow(dvsName, *group.second));
                        }
                    }
                    for (const auto& lag : config.lags) records->Append(LacpConfigLagRow(dvsName, lag));
                },
                "plugins/network/vswitch/dvs/LacpGetConfig", __LINE__);
        }
        if (records->Size() == 0) {
            output->SetError("LACP is disabled on DVSwitch.");
            return;
        }
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
