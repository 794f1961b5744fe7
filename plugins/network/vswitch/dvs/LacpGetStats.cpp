#include "vswitch/dvs/LacpGetStats.h"

#include <memory>
#include <optional>
#include <string>
#include <utility>

#include "common/CommandSupport.h"
#include "vswitch/dvs/DvsLookup.h"
#include "vswitch/dvs/DvsOptions.h"
#include "vswitch/dvs/DvsRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

LacpGetStats::LacpGetStats() {
    SetDescription("Get LACP stats on DVS uplinks");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    // This hint names a record type and a column the rows do not have, so
    // the table shows every field of the rows.
    SetDefaultOutputParameter("fields:LACP", "Uplink, Tx LACPDUs, Tx Errors, Rx LACPDUs, Rx Errors");
}

ORVIX_COMMAND_NEW(LacpGetStats)

boost::shared_ptr<CallSpec::InputSpec> LacpGetStats::GetInputSpecInternal() {
    return LacpReaderInput();
}

boost::shared_ptr<CallSpec::OutputSpec> LacpGetStats::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> LacpGetStats::GetOutputStructure() {
    return MetaObj::MetaStruct::New("LACPStats");
}

void LacpGetStats::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                   boost::shared_ptr<CallSpec::Output> output) {
    ReportingHostErrors(output, [&] {
        const std::optional<DVSwitchList> switches = SelectLacpSwitches(*input, *output);
        if (!switches) return;
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        bool anyLag = false;
        for (const auto& dvs : *switches) {
            const std::string dvsName = dvs->GetName();
            BuildThenRelease(
                dvs->GetLacpInfo(),
                [&](std::unique_ptr<HostCtl::Network::LacpInfo> info) { dvs->ReleaseLacpInfo(std::move(info)); },
                [&](const HostCtl::Network::LacpInfo& info) {
                    for (const auto& lag : info.lags) {
                        anyLag = true;
                        for (const auto& nic : lag.nics) records->Append(LacpStatsRecord(dvsName, lag, nic));
                    }
                },
                "plugins/network/vswitch/dvs/LacpGetStats", __LINE__);
        }
        if (!anyLag) {
            output->SetError("No running LACP group on the host.");
        } else if (records->Size() == 0) {
            output->SetError("No pnic is connected to DVSwitch.");
        } else {
            Finish(output, records);
        }
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
