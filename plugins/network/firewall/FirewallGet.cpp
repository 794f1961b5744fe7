#include "firewall/FirewallGet.h"

#include "common/CommandSupport.h"
#include "firewall/FirewallRecords.h"
#include "hostctl/system/ModuleImpl.h"
#include "hostctl/system/SystemInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

FirewallGet::FirewallGet() {
    SetDescription("Get the firewall status.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

ORVIX_COMMAND_NEW(FirewallGet)

boost::shared_ptr<CallSpec::InputSpec> FirewallGet::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> FirewallGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> FirewallGet::GetOutputStructure() {
    return FirewallTemplate();
}

void FirewallGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::System::SystemInfoImpl info;
    try {
        PldCtl::System::ModuleImpl module(PldCtl::System::kFirewallModule);
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        // The firewall is asked only while its module is loaded; an unloaded
        // firewall filters nothing and passes everything.
        const bool loaded = module.IsLoaded();
        bool enabled = false;
        bool pass = true;
        if (loaded) {
            enabled = info.IsFirewallEnabled();
            pass = info.GetFirewallDefaultAction();
        }
        record->SetField("Loaded", loaded);
        record->SetField("Enabled", enabled);
        record->SetField("DefaultAction", DefaultActionWord(pass));
        Finish(output, record);
    } catch (const HostCtl::Lib::HostCtlException& e) {
        // The summary and the library's reason on lines of their own: the
        // CLI shows each error on one line, escaping a line break inside it.
        output->SetError("Unable to get firewall status.");
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
