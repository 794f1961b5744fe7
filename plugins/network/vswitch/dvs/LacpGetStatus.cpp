#include "vswitch/dvs/LacpGetStatus.h"

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

LacpGetStatus::LacpGetStatus() {
    SetDescription("Get LACP status on DVS");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    DescribeLacpStatus(*this);
}

ORVIX_COMMAND_NEW(LacpGetStatus)

boost::shared_ptr<CallSpec::InputSpec> LacpGetStatus::GetInputSpecInternal() {
    return LacpReaderInput();
}

boost::shared_ptr<CallSpec::OutputSpec> LacpGetStatus::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> LacpGetStatus::GetOutputStructure() {
    return MetaObj::MetaStruct::New("LAG");
}

void LacpGetStatus::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                    boost::shared_ptr<CallSpec::Output> output) {
    ReportingHostErrors(output, [&] {
        const std::optional<DVSwitchList> switches = SelectLacpSwitches(*input, *output);
        if (!switches) return;
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        for (const auto& dvs : *switches) {
            const std::string dvsName = dvs->GetName();
            BuildThenRelease(
                dvs->GetLacpInfo(),
                [&](std::unique_ptr<HostCtl::Network::LacpInfo> info) { dvs->ReleaseLacpInfo(std::move(info)); },
                [&](const HostCtl::Network::LacpInfo& info) {
                    for (const auto& lag : info.lags) records->Append(LagStatusRecord(dvsName, lag));
                },
                "plugins/network/vswitch/dvs/LacpGetStatus", __LINE__);
        }
        if (records->Size() == 0) {
            output->SetError("No running LACP group on the host.");
            return;
        }
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
