// Netstack instances as the library keeps them: configured values against
// the ones in force, the refusals, removal, and the host's algorithm list.
#include "hostctl/ip/IpHost.h"
#include "support/test_util.h"

namespace {

using HostCtl::Network::NetstackInstance;
using PldCtl::Network::NetstackInstanceImpl;

class Netstacks : public IpHost {
protected:
    PldCtl::Network::NetworkInfoImpl network_;

    std::unique_ptr<NetstackInstance> Lookup(const std::string& key) {
        auto instance = network_.LookupNetstackInstanceByKey(key);
        if (!instance) throw std::runtime_error("no netstack " + key);
        return instance;
    }
};

TEST_F(Netstacks, AddCreatesInTheKernelOrInTheConfigurationOnly) {
    NetstackInstanceImpl running("lab1", 5000, "cubic", false, NetstackInstance::STATE_CONFIGURED);
    network_.AddNetstackInstance(&running, false);
    auto lab1 = Lookup("lab1");
    EXPECT_EQ(lab1->GetState(), NetstackInstance::STATE_IN_KERNEL);
    EXPECT_EQ(lab1->GetName(), "lab1");
    EXPECT_EQ(lab1->GetCurrentMaxConnections(), 5000);
    EXPECT_EQ(lab1->GetCongestionControlAlgorithm(), "cubic");
    EXPECT_FALSE(lab1->GetCurrentIpv6Enabled());

    NetstackInstanceImpl configured("lab2", 11000, "newreno", true, NetstackInstance::STATE_CONFIGURED);
    network_.AddNetstackInstance(&configured, true);
    auto lab2 = Lookup("lab2");
    EXPECT_EQ(network_.GetNetstackInstanceState("lab2"), NetstackInstance::STATE_CONFIGURED);
    EXPECT_EQ(lab2->GetMaxConnections(), 11000);
    EXPECT_EQ(lab2->GetCurrentMaxConnections(), 0);
    EXPECT_TRUE(lab2->GetIpv6Enabled());
    EXPECT_FALSE(lab2->GetCurrentIpv6Enabled());
    EXPECT_EQ(network_.GetNetstackInstanceState("nope"), 0);

    std::vector<std::string> keys;
    for (const auto& instance : network_.ListNetstackInstances()) keys.push_back(instance->GetKey());
    EXPECT_EQ(keys, (std::vector<std::string>{kDefault, "migrix", "faultTolerance", "lab1", "lab2"}));
}

TEST_F(Netstacks, RefusedAddsWriteNothing) {
    const Json before = Dump();
    auto add = [&](const std::string& key, std::int64_t max, const std::string& algorithm) {
        NetstackInstanceImpl instance(key, max, algorithm, true, NetstackInstance::STATE_CONFIGURED);
        return MessageOf([&] { network_.AddNetstackInstance(&instance, false); });
    };
    EXPECT_EQ(add("migrix", 11000, "newreno"), "Netstack instance migrix already exists");
    EXPECT_EQ(add("a b", 11000, "newreno"),
              "Invalid netstack instance name a b: use 1 to 64 letters, digits, '-', '_' or '.'");
    EXPECT_EQ(add("", 11000, "newreno"),
              "Invalid netstack instance name : use 1 to 64 letters, digits, '-', '_' or '.'");
    EXPECT_EQ(add("a|b", 11000, "newreno"),
              "Invalid netstack instance name a|b: use 1 to 64 letters, digits, '-', '_' or '.'");
    EXPECT_EQ(add(std::string(65, 'k'), 11000, "newreno").substr(0, 30), "Invalid netstack instance name");
    EXPECT_EQ(add(std::string(64, 'k'), 11000, "bbr"), "Unknown congestion control algorithm bbr");
    EXPECT_EQ(add("lab", 0, "newreno"),
              "Invalid maximum connections value 0 for netstack instance lab: must be between 1 and 2147483647");
    EXPECT_EQ(Dump(), before);
}

TEST_F(Netstacks, SettersChangeTheConfigurationAndEnableAppliesIt) {
    auto ft = Lookup("faultTolerance");
    ft->SetMaxConnections(2147483647, true);
    ft->SetIpv6Enabled(false, true);
    ft->SetCongestionControlAlgorithm("cubic", true);
    ft->SetName("Fault tolerance", true);
    EXPECT_EQ(ft->GetMaxConnections(), 2147483647);
    EXPECT_EQ(ft->GetCurrentMaxConnections(), 0);
    EXPECT_EQ(ft->GetName(), "Fault tolerance");
    EXPECT_EQ(MessageOf([&] { ft->SetMaxConnections(2147483648LL, true); }),
              "Invalid maximum connections value 2147483648 for netstack instance faultTolerance: must be between 1 "
              "and 2147483647");
    EXPECT_EQ(MessageOf([&] { ft->SetMaxConnections(-1, true); }),
              "Invalid maximum connections value -1 for netstack instance faultTolerance: must be between 1 and "
              "2147483647");
    EXPECT_EQ(MessageOf([&] { ft->SetCongestionControlAlgorithm("Cubic", true); }),
              "Unknown congestion control algorithm Cubic");

    ft->Enable();
    auto fresh = Lookup("faultTolerance");
    EXPECT_EQ(fresh->GetState(), NetstackInstance::STATE_IN_KERNEL);
    EXPECT_EQ(fresh->GetCurrentMaxConnections(), 2147483647);
    EXPECT_FALSE(fresh->GetCurrentIpv6Enabled());
    EXPECT_EQ(fresh->GetCongestionControlAlgorithm(), "cubic");

    // In the kernel a setter still changes only the configuration.
    fresh->SetMaxConnections(100, true);
    EXPECT_EQ(Lookup("faultTolerance")->GetCurrentMaxConnections(), 2147483647);

    fresh->Disable();
    EXPECT_EQ(fresh->GetState(), NetstackInstance::STATE_CONFIGURED);
    EXPECT_EQ(fresh->GetCurrentMaxConnections(), 0);
    EXPECT_EQ(Stored("netstacks", "key", "faultTolerance")["maxConnections"], 100);
    EXPECT_EQ(MessageOf([&] { Lookup(kDefault)->Disable(); }), "The default netstack instance cannot be disabled");
    EXPECT_EQ(Lookup(kDefault)->GetState(), NetstackInstance::STATE_IN_KERNEL);
}

TEST_F(Netstacks, RemoveRefusesTheDefaultAndInstancesWithInterfaces) {
    EXPECT_EQ(MessageOf([&] { network_.RemoveNetstackInstance(kDefault, false); }),
              "The default netstack instance cannot be removed");
    EXPECT_EQ(MessageOf([&] { network_.RemoveNetstackInstance("migrix", false); }),
              "Netstack instance migrix still has interfaces: pld2");
    EXPECT_EQ(MessageOf([&] { network_.RemoveNetstackInstance("nope", false); }),
              "Netstack instance nope does not exist");
    EXPECT_TRUE(network_.LookupNetstackInstanceByKey("migrix"));

    // Its routes and neighbors go with it.
    Nic("pld2")->Remove();
    network_.RemoveNetstackInstance("migrix", false);
    EXPECT_EQ(network_.LookupNetstackInstanceByKey("migrix"), nullptr);
    for (const char* section : {"routes", "neighbors", "connections"}) {
        EXPECT_TRUE(Stored(section, "netstack", "migrix").is_null()) << section;
    }
    auto snapshot = std::make_unique<NetstackInstanceImpl>("migrix", 1, "newreno", true, 2);
    EXPECT_EQ(MessageOf([&] { snapshot->Enable(); }), "Netstack instance migrix does not exist");
}

TEST_F(Netstacks, TheAlgorithmListComesFromTheHostAndSurvivesABrokenOne) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1,
        "system": {"congestionControlAlgorithms": ["cubic", "bbr"]},
        "netstacks": [{"key": "defaultTcpipStack"}]})");
    EXPECT_EQ(NetstackInstanceImpl::GetCongestionControlAlgorithmList(), (std::vector<std::string>{"cubic", "bbr"}));
    Lookup(kDefault)->SetCongestionControlAlgorithm("bbr", true);
    EXPECT_EQ(MessageOf([&] { Lookup(kDefault)->SetCongestionControlAlgorithm("newreno", true); }),
              "Unknown congestion control algorithm newreno");

    OrvixTest::WriteFile(DbPath(), std::string(4096, 'x'));
    PldCtl::Lib::ReopenHost();
    EXPECT_EQ(NetstackInstanceImpl::GetCongestionControlAlgorithmList(),
              (std::vector<std::string>{"newreno", "cubic"}));
}

TEST_F(Netstacks, AHostThatNamesNoAlgorithmsOffersTheLibrarysOwn) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1, "netstacks": [{"key": "defaultTcpipStack"}]})");
    EXPECT_EQ(NetstackInstanceImpl::GetCongestionControlAlgorithmList(),
              (std::vector<std::string>{"newreno", "cubic"}));
    Lookup(kDefault)->SetCongestionControlAlgorithm("cubic", true);
    EXPECT_EQ(Lookup(kDefault)->GetCongestionControlAlgorithm(), "cubic");
}

TEST_F(Netstacks, InjectedFaultsFailTheirOperation) {
    ArmFault("NetworkInfoImpl::AddNetstackInstance", "lab", "add failed");
    ArmFault("NetworkInfoImpl::ListNetstackInstances", "", "list failed");
    ArmFault("NetstackInstanceImpl::Enable", "faultTolerance", "enable failed");
    ArmFault("NetstackInstanceImpl::Disable", "migrix", "disable failed");
    NetstackInstanceImpl lab("lab", 11000, "newreno", true, 2);
    EXPECT_EQ(MessageOf([&] { network_.AddNetstackInstance(&lab, false); }), "add failed");
    EXPECT_EQ(network_.LookupNetstackInstanceByKey("lab"), nullptr);
    EXPECT_EQ(MessageOf([&] { network_.ListNetstackInstances(); }), "list failed");
    EXPECT_EQ(MessageOf([&] { Lookup("faultTolerance")->Enable(); }), "enable failed");
    EXPECT_EQ(Lookup("faultTolerance")->GetState(), NetstackInstance::STATE_CONFIGURED);
    EXPECT_EQ(MessageOf([&] { Lookup("migrix")->Disable(); }), "disable failed");
    EXPECT_EQ(Lookup("migrix")->GetState(), NetstackInstance::STATE_IN_KERNEL);
}

}  // namespace
