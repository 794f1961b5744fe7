// The netstack commands run in-process against a fresh copy of the default
// host: what the transcripts cannot see (how a run ends, values the
// framework refuses before the command runs) and what the host keeps.
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "framework/Runner.h"
#include "hostctl/HostSession.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "ip/netstack/IpNetstackInstanceGet.h"
#include "ip/netstack/IpNetstackInstanceSet.h"
#include "ip/netstack/NetstackLookup.h"
#include "support/test_util.h"

namespace {

using namespace OrvixCli::NetworkNamespace;

boost::shared_ptr<CallSpec::Output> RunWithInput(AutoCli::Command& command,
                                                 const boost::shared_ptr<CallSpec::Input>& input) {
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    command.Execute(input, output);
    return output;
}

// Parsed by the framework's parser from the command's own declaration.
boost::shared_ptr<CallSpec::Output> RunCommand(AutoCli::Command& command, const std::vector<std::string>& args) {
    return RunWithInput(command, AutoCli::ParseArguments(*command.GetInputSpec(), args));
}

class NetstackRuns : public ::testing::Test {
protected:
    NetstackRuns() : db_("ORVIX_HOST_DB", dir_ / "host.db"), profile_("ORVIX_HOST_PROFILE", std::nullopt) {
        PldCtl::Lib::ReopenHost();
    }
    ~NetstackRuns() override { PldCtl::Lib::ReopenHost(); }

    static std::unique_ptr<HostCtl::Network::NetstackInstance> Instance(const std::string& key) {
        PldCtl::Network::NetworkInfoImpl networkInfo;
        return networkInfo.LookupNetstackInstanceByKey(key);
    }

    OrvixTest::TempDir dir_;
    OrvixTest::ScopedEnv db_;
    OrvixTest::ScopedEnv profile_;
};

TEST_F(NetstackRuns, AMissingInstanceEndsTheRunWithItsMessageAloneAndChangesNothing) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    auto lookup = CallSpec::Output::New();
    EXPECT_FALSE(FindNetstack(networkInfo, "nowhere", *lookup));
    EXPECT_EQ(lookup->GetErrors(), std::vector<std::string>{"Unable to find a Netstack instance nowhere"});
    auto found = CallSpec::Output::New();
    ASSERT_TRUE(FindNetstack(networkInfo, "migrix", *found));
    EXPECT_TRUE(found->GetErrors().empty());

    auto set = IpNetstackInstanceSet::New();
    auto missing = RunCommand(*set, {"-N", "nowhere", "-n", "Nowhere"});
    EXPECT_EQ(missing->GetErrors(), std::vector<std::string>{"Unable to find a Netstack instance nowhere"});
    EXPECT_FALSE(missing->GetResult());
    EXPECT_EQ(missing->CompleteCalls(), 0);

    auto get = IpNetstackInstanceGet::New();
    auto shown = RunCommand(*get, {"-N", "migrix"});
    EXPECT_TRUE(shown->GetErrors().empty());
    auto records = boost::dynamic_pointer_cast<MetaObj::MetaList>(shown->GetResult());
    ASSERT_TRUE(records);
    EXPECT_EQ(records->Size(), 1u);
    EXPECT_EQ(shown->CompleteCalls(), 1);
}

TEST_F(NetstackRuns, AnAlgorithmTheFrameworkWouldRefuseIsRefusedByTheHostAfterTheEarlierSettings) {
    auto set = IpNetstackInstanceSet::New();
    boost::shared_ptr<CallSpec::Input> input = CallSpec::Input::New();
    input->SetString("netstack", "migrix");
    input->SetString("name", "Migration");
    input->SetString("ccalgo", "vegas");
    input->SetBool("ipv6enabled", "false", false);
    auto output = RunWithInput(*set, input);
    EXPECT_EQ(output->GetErrors(),
              std::vector<std::string>{"Error setting configuration for the netstack instance migrix. Error was : "
                                       "Unknown congestion control algorithm vegas"});
    EXPECT_FALSE(output->GetResult());
    EXPECT_EQ(output->CompleteCalls(), 0);

    auto migrix = Instance("migrix");
    ASSERT_TRUE(migrix);
    EXPECT_EQ(migrix->GetName(), "Migration");
    EXPECT_EQ(migrix->GetCongestionControlAlgorithm(), "cubic");
    EXPECT_TRUE(migrix->GetIpv6Enabled());
}

TEST_F(NetstackRuns, TheLargestLimitIsKeptWholeAndOneBeyondItIsRefused) {
    auto set = IpNetstackInstanceSet::New();
    auto kept = RunCommand(*set, {"-N", "faultTolerance", "--maxconn", "2147483647"});
    EXPECT_TRUE(kept->GetErrors().empty());
    EXPECT_EQ(kept->CompleteCalls(), 1);
    EXPECT_EQ(Instance("faultTolerance")->GetMaxConnections(), 2147483647);

    // 2^32 + 2147483647 narrowed to 32 bits would read as the limit above.
    auto refused = RunCommand(*set, {"-N", "faultTolerance", "-m", "6442450943"});
    EXPECT_EQ(refused->GetErrors().size(), 1u);
    EXPECT_FALSE(refused->GetResult());
    EXPECT_EQ(Instance("faultTolerance")->GetMaxConnections(), 2147483647);
}

}  // namespace
