// The standard switch and port group commands run in-process against a fresh
// copy of the default host: what the transcripts cannot see (the run's
// outcome object, values the framework would refuse before the command
// runs, the command metadata) and what the host keeps after a change.
#include <stdlib.h>

#include <filesystem>
#include <map>
#include <optional>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "vswitch/CdpStatus.h"
#include "vswitch/VirtualSwitchPortGroupAdd.h"
#include "vswitch/VirtualSwitchPortGroupList.h"
#include "vswitch/VirtualSwitchPortGroupRemove.h"
#include "vswitch/VirtualSwitchPortGroupSet.h"
#include "vswitch/VirtualSwitchStandardAdd.h"
#include "vswitch/VirtualSwitchStandardList.h"
#include "vswitch/VirtualSwitchStandardRemove.h"
#include "vswitch/VirtualSwitchStandardSet.h"
#include "vswitch/VirtualSwitchStandardUplinkAdd.h"
#include "vswitch/VirtualSwitchStandardUplinkRemove.h"
#include "hostctl/HostSession.h"
#include "hostctl/network/NetworkFactory.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Network::NetworkFactory;
using Arguments = std::vector<std::pair<std::string, std::string>>;

// Builds the input as the parser would, from the command's own declaration
// (so a misspelt option name fails the test), but without the constraints:
// values the framework refuses can still reach the command.
boost::shared_ptr<CallSpec::Output> RunCommand(AutoCli::Command& command, const Arguments& arguments) {
    boost::shared_ptr<CallSpec::InputSpec> spec = command.GetInputSpec();
    boost::shared_ptr<CallSpec::Input> input = CallSpec::Input::New();
    for (const auto& [name, text] : arguments) {
        boost::shared_ptr<CallSpec::ParameterSpec> parameter = spec->FindByName(name);
        if (!parameter) throw std::invalid_argument("no parameter " + name);
        if (parameter->GetType() == CallSpec::PARAM_INT) {
            input->SetInt(name, text, std::stoll(text));
        } else {
            input->SetString(name, text);
        }
    }
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    command.Execute(input, output);
    return output;
}

bool IsTrueResult(const CallSpec::Output& output) {
    auto result = boost::dynamic_pointer_cast<MetaObj::MetaBool>(output.GetResult());
    return result && result->HasValue() && result->GetValue();
}

class SwitchCommands : public ::testing::Test {
protected:
    SwitchCommands() {
        char pattern[] = "/tmp/orvix-switch-commands-XXXXXX";
        if (!mkdtemp(pattern)) throw std::runtime_error("mkdtemp failed");
        dir_ = pattern;
        setenv("ORVIX_HOST_DB", (dir_ + "/host.db").c_str(), 1);
        unsetenv("ORVIX_HOST_PROFILE");
        PldCtl::Lib::ReopenHost();
    }
    ~SwitchCommands() override {
        PldCtl::Lib::ReopenHost();
        unsetenv("ORVIX_HOST_DB");
        std::error_code ignored;
        std::filesystem::remove_all(dir_, ignored);
    }

    static std::unique_ptr<HostCtl::Network::VirtualSwitch> Switch(const std::string& name) {
        auto vswitch = NetworkFactory::GetVirtualSwitchById(name);
        if (!vswitch) throw std::runtime_error("no switch " + name);
        return vswitch;
    }

    std::string dir_;
};

TEST(CdpStatus, TableIndexesAndChoicesAgree) {
    const std::vector<std::string> words = {"down", "listen", "advertise", "both"};
    for (int index = 0; index < 4; ++index) EXPECT_EQ(CdpStatusIndex(words[index]), index) << words[index];
    // Anything else is "both", even a word that differs only in case.
    EXPECT_EQ(CdpStatusIndex("bogus"), 3);
    EXPECT_EQ(CdpStatusIndex(""), 3);
    EXPECT_EQ(CdpStatusIndex("Down"), 3);

    const auto constraint = CdpStatusConstraint();
    ASSERT_EQ(constraint->GetType(), CallSpec::CONSTRAINT_STRING_ENUM);
    const auto& choices = constraint->GetStringEnum();
    ASSERT_EQ(choices.size(), 4u);
    for (std::size_t i = 0; i < choices.size(); ++i) {
        EXPECT_EQ(choices[i].value, words[i]);
        EXPECT_EQ(choices[i].description, "CDP status is '" + words[i] + "'");
    }
}

TEST(SwitchCommandMetadata, TypesFormattersAndHints) {
    struct Expected {
        boost::shared_ptr<AutoCli::Command> command;
        const char* type;
        const char* formatter;
    };
    const std::vector<Expected> expected = {
        {VirtualSwitchStandardAdd::New(), "operation", ""},
        {VirtualSwitchStandardList::New(), "fetcher", "simple"},
        {VirtualSwitchStandardRemove::New(), "operation", ""},
        {VirtualSwitchStandardSet::New(), "operation", ""},
        {VirtualSwitchStandardUplinkAdd::New(), "operation", ""},
        {VirtualSwitchStandardUplinkRemove::New(), "operation", ""},
        {VirtualSwitchPortGroupList::New(), "fetcher", "table"},
        {VirtualSwitchPortGroupAdd::New(), "operation", ""},
        {VirtualSwitchPortGroupRemove::New(), "operation", ""},
        {VirtualSwitchPortGroupSet::New(), "operator", ""},
    };
    for (const Expected& e : expected) {
        EXPECT_EQ(e.command->GetMetaDataField("type"), e.type) << e.command->GetDescription();
        EXPECT_EQ(e.command->GetDefaultOutputFormatter(), e.formatter) << e.command->GetDescription();
        // Fetchers declare a list of records, operations one boolean.
        const auto templ = e.command->GetOutputSpec()->GetTemplate();
        ASSERT_TRUE(templ);
        EXPECT_EQ(templ->GetType(), *e.formatter ? MetaObj::META_LIST : MetaObj::META_BOOL);
        EXPECT_EQ(e.command->GetDefaultOutputParameters().empty(), !*e.formatter);
    }
    const auto list = VirtualSwitchStandardList::New();
    EXPECT_EQ(list->GetDefaultOutputParameters().at("header:VirtualSwitch"), "%Name%");
    const auto portGroups = VirtualSwitchPortGroupList::New();
    EXPECT_EQ(portGroups->GetDefaultOutputParameters().at("fields:PortGroup"),
              "Name,Virtual Switch,Active Clients,VLAN ID");
}

TEST_F(SwitchCommands, EveryRunEndsWithAResultAndOneCompleteOrWithAnErrorAlone) {
    auto set = VirtualSwitchStandardSet::New();
    auto refused = RunCommand(*set, {{"vswitch-name", "vSwitch9"}, {"mtu", "1500"}});
    EXPECT_EQ(refused->GetErrors(), std::vector<std::string>{"vSwitch9 is not a valid name for a virtual switch"});
    EXPECT_FALSE(refused->GetResult());
    EXPECT_EQ(refused->CompleteCalls(), 0);

    auto failed = RunCommand(*set, {{"vswitch-name", "vSwitch1"}, {"mtu", "0"}});
    EXPECT_EQ(failed->GetErrors().size(), 1u);
    EXPECT_FALSE(failed->GetResult());
    EXPECT_EQ(failed->CompleteCalls(), 0);

    auto done = RunCommand(*set, {{"vswitch-name", "vSwitch1"}, {"cdp-status", "advertise"}});
    EXPECT_TRUE(done->GetErrors().empty());
    EXPECT_TRUE(IsTrueResult(*done));
    EXPECT_EQ(done->CompleteCalls(), 1);

    auto uplinkAdd = VirtualSwitchStandardUplinkAdd::New();
    auto unknown = RunCommand(*uplinkAdd, {{"vswitch-name", "vSwitch9"}, {"uplink-name", "hwnic4"}});
    EXPECT_EQ(unknown->GetErrors(), std::vector<std::string>{"Unable to find virtual switch with the name vSwitch9"});
    EXPECT_FALSE(unknown->GetResult());
    EXPECT_EQ(unknown->CompleteCalls(), 0);

    // The one command that reports an error and still sets its result.
    auto list = VirtualSwitchStandardList::New();
    auto partial = RunCommand(*list, {{"vswitch-name", "vSwitch9"}});
    EXPECT_EQ(partial->GetErrors(), std::vector<std::string>{"Unable to access all portsets"});
    auto records = boost::dynamic_pointer_cast<MetaObj::MetaList>(partial->GetResult());
    ASSERT_TRUE(records);
    EXPECT_EQ(records->Size(), 0u);
    EXPECT_EQ(partial->CompleteCalls(), 1);
}

TEST_F(SwitchCommands, SetPassesValuesTheFrameworkWouldRefuseOnUnchanged) {
    auto set = VirtualSwitchStandardSet::New();
    // An unknown word is "both".
    auto cdp = RunCommand(*set, {{"vswitch-name", "vSwitch1"}, {"cdp-status", "bogus"}});
    EXPECT_TRUE(IsTrueResult(*cdp));
    EXPECT_EQ(Switch("vSwitch1")->GetCDPStatus(), "both");

    // 2^32 + 1500 would be an acceptable 1500 if it were cut to 32 bits.
    auto mtu = RunCommand(*set, {{"vswitch-name", "vSwitch1"}, {"mtu", "4294968796"}});
    EXPECT_EQ(mtu->GetErrors(),
              std::vector<std::string>{
                  "Invalid MTU 4294968796 for virtual switch vSwitch1: it must be between 1280 and 9000"});
    EXPECT_EQ(Switch("vSwitch1")->GetMTU(), 9000);
}

TEST_F(SwitchCommands, UplinkRemoveLeavesTheFailoverPoliciesAlone) {
    auto remove = VirtualSwitchStandardUplinkRemove::New();
    auto output = RunCommand(*remove, {{"vswitch-name", "vSwitch0"}, {"uplink-name", "hwnic1"}});
    ASSERT_TRUE(IsTrueResult(*output));

    auto vswitch = Switch("vSwitch0");
    EXPECT_EQ(vswitch->GetUplinks(), std::vector<std::string>{"hwnic0"});
    EXPECT_EQ(vswitch->GetTeamingPolicy().GetUplinkOrder(), (std::vector<std::string>{"hwnic0", "hwnic1"}));
    auto vmNetwork = NetworkFactory::GetPortGroupByName("VM Network");
    ASSERT_TRUE(vmNetwork);
    EXPECT_EQ(vmNetwork->GetOwnTeamingPolicy().GetUplinkOrder(), (std::vector<std::string>{"hwnic1", "hwnic0"}));
}

TEST_F(SwitchCommands, PortGroupSetWritesTheVlanOnlyWhenGiven) {
    auto set = VirtualSwitchPortGroupSet::New();
    EXPECT_TRUE(IsTrueResult(*RunCommand(*set, {{"portgroup-name", "Storage"}})));
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("Storage")->GetVlanId(), 20);

    EXPECT_TRUE(IsTrueResult(*RunCommand(*set, {{"portgroup-name", "Storage"}, {"vlan-id", "0"}})));
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("Storage")->GetVlanId(), 0);

    // Beyond the bounds the framework checks, the library still refuses.
    auto outside = RunCommand(*set, {{"portgroup-name", "Storage"}, {"vlan-id", "65536"}});
    EXPECT_EQ(outside->GetErrors(), std::vector<std::string>{"Invalid VLAN ID 65536: it must be between 0 and 4095"});
    EXPECT_EQ(NetworkFactory::GetPortGroupByName("Storage")->GetVlanId(), 0);
}

}  // namespace
