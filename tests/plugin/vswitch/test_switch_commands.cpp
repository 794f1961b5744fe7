// The standard switch and port group commands run in-process against a fresh
// copy of the default host: what the transcripts cannot see (the run's
// outcome object, values the framework would refuse before the command
// runs) and what the host keeps after a change.
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "hostctl/HostSession.h"
#include "hostctl/network/NetworkFactory.h"
#include "support/test_util.h"
#include "vswitch/VirtualSwitchStandardList.h"
#include "vswitch/VirtualSwitchStandardSet.h"
#include "vswitch/VirtualSwitchStandardUplinkAdd.h"
#include "vswitch/VirtualSwitchStandardUplinkRemove.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Network::NetworkFactory;
using Arguments = std::vector<std::pair<std::string, std::string>>;

// Builds the input as the parser would, from the command's own declaration
// (so a misspelt option name fails the test), but without the constraints:
// values the framework refuses can still reach the command.
boost::shared_ptr<CallSpec::Output> RunCommand(AutoCli::Command& command, const Arguments& arguments) {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = command.GetInputSpec();
    boost::shared_ptr<CallSpec::Input> input = CallSpec::Input::New();
    for (const auto& [name, text] : arguments) {
        boost::shared_ptr<CallSpec::ParameterSpec> parameter = inputSpec->FindByName(name);
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
    SwitchCommands() : db_("ORVIX_HOST_DB", dir_ / "host.db"), profile_("ORVIX_HOST_PROFILE", std::nullopt) {
        PldCtl::Lib::ReopenHost();
    }
    ~SwitchCommands() override { PldCtl::Lib::ReopenHost(); }

    static std::unique_ptr<HostCtl::Network::VirtualSwitch> Switch(const std::string& name) {
        auto vswitch = NetworkFactory::GetVirtualSwitchById(name);
        if (!vswitch) throw std::runtime_error("no switch " + name);
        return vswitch;
    }

    OrvixTest::TempDir dir_;
    OrvixTest::ScopedEnv db_;
    OrvixTest::ScopedEnv profile_;
};

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

TEST_F(SwitchCommands, SetTakesACdpWordTheFrameworkWouldRefuseAsBoth) {
    auto set = VirtualSwitchStandardSet::New();
    EXPECT_TRUE(IsTrueResult(*RunCommand(*set, {{"vswitch-name", "vSwitch1"}, {"cdp-status", "down"}})));
    EXPECT_TRUE(IsTrueResult(*RunCommand(*set, {{"vswitch-name", "vSwitch1"}, {"cdp-status", "Down"}})));
    EXPECT_EQ(Switch("vSwitch1")->GetCDPStatus(), "both");
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

}  // namespace
