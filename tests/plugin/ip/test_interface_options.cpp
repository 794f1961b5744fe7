// The IP interface room's shared options at their edges: which interface
// names the name expression lets through, the connection-point rule over
// every combination of its three options, and how an interface created on a
// dedicated netstack takes its tag over from the default netstack; then the
// connection points made on a fresh default host, where a DV port's
// connection id is the time. Options are parsed by the framework's real
// parser; the tag take-over runs against a small in-memory set of interfaces.
#include <algorithm>
#include <cstdint>
#include <ctime>
#include <map>
#include <memory>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "framework/Runner.h"
#include "hostctl/HostFixture.h"
#include "hostctl/network/ip/NetstackInstance.h"
#include "ip/interface/InterfaceOptions.h"
#include "ip/interface/IpInterfaceAdd.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Network::PldNicTagType;
using Names = std::vector<std::string>;

const std::string kNoPoint =
    "A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection "
    "point is DVPort, --dvs-name and --dvport-id must be specified at the same time.";
const std::string kTwoPoints = "Only one connection point can be specified, vswitch port group or DVPort.";

bool NameAccepted(const std::string& name) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i", "", Required::No,
                     InterfaceNameConstraint());
    try {
        AutoCli::ParseArguments(*declared, {"--interface-name", name});
        return true;
    } catch (const AutoCli::UsageError&) {
        return false;
    }
}

TEST(InterfaceName, TakesPldAndANumberFrom0To255WithoutLeadingZeros) {
    for (const char* name :
         {"pld0", "pld9", "pld10", "pld99", "pld100", "pld199", "pld200", "pld249", "pld250", "pld255"}) {
        EXPECT_TRUE(NameAccepted(name)) << name;
    }
    for (const char* name : {"pld256", "pld260", "pld300", "pld999", "pld1000", "pld01", "pld00", "pld001", "PLD1",
                             "Pld1", "pld", "pld-1", "pld1x", "xpld1", "pld1 ", " pld1", "pld 1", ""}) {
        EXPECT_FALSE(NameAccepted(name)) << '"' << name << '"';
    }
}

// The messages the rule reports for the options given: p portgroup-name,
// s dvs-name, d dvport-id. Given empty, an option still counts as given.
Names ChoiceErrors(const Names& args, bool* passed = nullptr) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareConnectionPointParameters(declared, "");
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    const bool ok = CheckConnectionPointChoice(*AutoCli::ParseArguments(*declared, args), *output);
    if (passed) *passed = ok;
    return output->GetErrors();
}

TEST(ConnectionPointChoice, NeedsAPortGroupOrBothDistributedOptionsButNotBoth) {
    struct Case {
        Names args;
        Names errors;
    };
    const std::vector<Case> cases = {
        {{}, {kNoPoint}},
        {{"-p", "Management Network"}, {}},
        {{"-s", "dvSwitch0"}, {kNoPoint}},
        {{"-P", "11"}, {kNoPoint}},
        {{"-s", "dvSwitch0", "-P", "11"}, {}},
        {{"-p", "VM Network", "-s", "dvSwitch0"}, {kNoPoint}},
        {{"-p", "VM Network", "-P", "11"}, {kNoPoint}},
        {{"-p", "VM Network", "-s", "dvSwitch0", "-P", "11"}, {kTwoPoints}},
        {{"--portgroup-name="}, {}},
        {{"--dvs-name=", "--dvport-id="}, {}},
    };
    for (const Case& c : cases) {
        bool passed = false;
        const Names errors = ChoiceErrors(c.args, &passed);
        EXPECT_EQ(errors, c.errors) << ::testing::PrintToString(c.args);
        EXPECT_EQ(passed, c.errors.empty()) << ::testing::PrintToString(c.args);
    }
}

TEST(DedicatedNetstacks, AreNamedExactlyAndTheirTagsLeadBackToThem) {
    for (const char* key : {"migrix", "faultTolerance", "BrenvoProvisioning"}) {
        const auto dedicated = DedicatedNetstackByKey(key);
        ASSERT_TRUE(dedicated) << key;
        EXPECT_EQ(NetstackOfTag(dedicated->tag), key);
        // Only the provisioning netstack restarts the RFX daemon.
        EXPECT_EQ(dedicated->restartsRfxDaemon, std::string(key) == "BrenvoProvisioning") << key;
    }
    for (const char* key : {"defaultTcpipStack", "Migrix", "migrix ", "faulttolerance", "", "vmotion"}) {
        EXPECT_FALSE(DedicatedNetstackByKey(key)) << key;
    }
    for (PldNicTagType tag : {HostCtl::Network::PLDNIC_TAG_MANAGEMENT, HostCtl::Network::PLDNIC_TAG_BACKUP,
                              HostCtl::Network::PLDNIC_TAG_REPLICATION, HostCtl::Network::PLDNIC_TAG_STORAGE,
                              HostCtl::Network::PLDNIC_TAG_TELEMETRY}) {
        EXPECT_EQ(NetstackOfTag(tag), HostCtl::Network::NetstackInstance::DEFAULT_KEY) << tag;
    }
}

// A host's interfaces in memory: each interface's netstack and tags, and
// every AddTag call with its second argument.
struct FakeHost {
    struct Interface {
        std::string netstack;
        std::vector<PldNicTagType> tags;
    };
    std::map<std::string, Interface> interfaces;
    std::vector<std::pair<std::string, bool>> addTagCalls;
    // The interface whose RemoveTag the host refuses.
    std::string refusesRemoveTag;
};

class FakeNic : public HostCtl::Network::PldNic {
public:
    FakeNic(FakeHost& host, std::string name) : host_(host), name_(std::move(name)) {}

    std::string GetName() const override { return name_; }
    std::string GetNetstackInstance() const override { return host_.interfaces.at(name_).netstack; }
    std::vector<PldNicTagType> GetTags() const override { return host_.interfaces.at(name_).tags; }
    void AddTag(PldNicTagType tag, bool persistOnly) override {
        host_.addTagCalls.emplace_back(name_, persistOnly);
        auto& tags = host_.interfaces.at(name_).tags;
        if (std::find(tags.begin(), tags.end(), tag) == tags.end()) tags.push_back(tag);
    }
    void RemoveTag(PldNicTagType tag) override {
        if (name_ == host_.refusesRemoveTag) throw HostCtl::Lib::HostCtlException("Tags of " + name_ + " are locked");
        auto& tags = host_.interfaces.at(name_).tags;
        tags.erase(std::remove(tags.begin(), tags.end(), tag), tags.end());
    }

    // What the take-over does not use.
    HostCtl::Network::MacAddress GetMacAddress() const override { return {}; }
    int GetMtu() const override { return 1500; }
    void SetMtu(std::int64_t) override { Unused(); }
    int GetTsoMss() const override { return 65535; }
    bool IsEnabled() const override { return true; }
    void Enable() override { Unused(); }
    void Disable() override { Unused(); }
    std::unique_ptr<HostCtl::Network::ConnectionPoint> GetConnectionPoint() const override { return nullptr; }
    std::int64_t GetPortId() const override { return 0; }
    HostCtl::Network::IpConfig GetIpConfig() const override { Unused(); }
    HostCtl::Network::IpConfig GetDnsConfig() const override { Unused(); }
    void SetIpConfig(const HostCtl::Network::IpConfig&) override { Unused(); }
    void Remove() override { Unused(); }

private:
    [[noreturn]] static void Unused() { throw std::logic_error("not used by the tag take-over"); }

    FakeHost& host_;
    std::string name_;
};

class FakeInterfaces : public PldCtl::Network::PalladNicInfoImpl {
public:
    explicit FakeInterfaces(FakeHost& host) : host_(host) {}

    std::vector<std::unique_ptr<HostCtl::Network::PldNic>> GetPalladNicsByTag(PldNicTagType tag) override {
        std::vector<std::unique_ptr<HostCtl::Network::PldNic>> tagged;
        for (const auto& [name, interface] : host_.interfaces) {
            if (std::find(interface.tags.begin(), interface.tags.end(), tag) != interface.tags.end()) {
                tagged.push_back(std::make_unique<FakeNic>(host_, name));
            }
        }
        return tagged;
    }

private:
    FakeHost& host_;
};

TEST(AutoTagInterfaceOnDedicatedStack, TakesTheTagFromTheDefaultNetstackOnly) {
    const PldNicTagType migration = HostCtl::Network::PLDNIC_TAG_LIVE_MIGRATION;
    const PldNicTagType management = HostCtl::Network::PLDNIC_TAG_MANAGEMENT;
    FakeHost host;
    host.interfaces = {
        {"pld0", {"defaultTcpipStack", {management, migration}}},
        {"pld1", {"defaultTcpipStack", {migration}}},
        {"pld2", {"migrix", {migration}}},
        {"pld3", {"lab", {migration}}},
        {"pld4", {"defaultTcpipStack", {management}}},
        {"pld5", {"migrix", {}}},
    };
    FakeInterfaces interfaces(host);
    FakeNic created(host, "pld5");
    AutoTagInterfaceOnDedicatedStack(interfaces, created, migration);

    EXPECT_EQ(host.interfaces["pld0"].tags, (std::vector<PldNicTagType>{management}));
    EXPECT_TRUE(host.interfaces["pld1"].tags.empty());
    EXPECT_EQ(host.interfaces["pld2"].tags, (std::vector<PldNicTagType>{migration}));
    EXPECT_EQ(host.interfaces["pld3"].tags, (std::vector<PldNicTagType>{migration}));
    EXPECT_EQ(host.interfaces["pld4"].tags, (std::vector<PldNicTagType>{management}));
    EXPECT_EQ(host.interfaces["pld5"].tags, (std::vector<PldNicTagType>{migration}));
    // The new interface is tagged for good, not only in the stored configuration.
    EXPECT_EQ(host.addTagCalls, (std::vector<std::pair<std::string, bool>>{{"pld5", false}}));
}

// A take-over the host stops halfway gives the tag back to the interfaces
// it was already taken from, and passes the failure on.
TEST(AutoTagInterfaceOnDedicatedStack, GivesTheTagBackWhenTheTakeOverStops) {
    const PldNicTagType migration = HostCtl::Network::PLDNIC_TAG_LIVE_MIGRATION;
    FakeHost host;
    host.interfaces = {
        {"pld0", {"defaultTcpipStack", {migration}}},
        {"pld1", {"defaultTcpipStack", {migration}}},
        {"pld2", {"defaultTcpipStack", {migration}}},
        {"pld5", {"migrix", {}}},
    };
    host.refusesRemoveTag = "pld1";
    FakeInterfaces interfaces(host);
    FakeNic created(host, "pld5");
    try {
        AutoTagInterfaceOnDedicatedStack(interfaces, created, migration);
        ADD_FAILURE() << "the refusal was not passed on";
    } catch (const HostCtl::Lib::HostCtlException& e) {
        EXPECT_EQ(e.GetMessage(0), "Tags of pld1 are locked");
    }
    for (const char* name : {"pld0", "pld1", "pld2"}) {
        EXPECT_EQ(host.interfaces[name].tags, (std::vector<PldNicTagType>{migration})) << name;
    }
}

// Against a fresh copy of the default host, whose dvSwitch0 has the DV port
// 10 (in use by pld1, connection id 1717243002) and the free ports 11 and
// 22, never connected to (connection id 0).
class ConnectionPoints : public FreshHost {
protected:
    // The connection point the options name, and what was reported.
    std::pair<std::unique_ptr<HostCtl::Network::ConnectionPoint>, Names> Make(const Names& args) {
        boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
        DeclareConnectionPointParameters(declared, "");
        boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
        auto point = MakeConnectionPoint(*AutoCli::ParseArguments(*declared, args), *output);
        return {std::move(point), output->GetErrors()};
    }

    static std::uint32_t Now() { return static_cast<std::uint32_t>(std::time(nullptr)); }
};

TEST_F(ConnectionPoints, ANeverConnectedDVPortGetsTheCurrentTimeAsItsConnectionId) {
    const std::uint32_t before = Now();
    auto [point, errors] = Make({"-s", "dvSwitch0", "-P", "11"});
    const std::uint32_t after = Now();
    ASSERT_TRUE(point);
    EXPECT_TRUE(errors.empty());
    EXPECT_EQ(point->GetType(), HostCtl::Network::ConnectionPoint::TYPE_DV_PORT);
    const HostCtl::Network::DVPortParam param = point->GetDVPortParam();
    EXPECT_EQ(param.switchUuid, NetworkFactory::GetDVSwitchByName("dvSwitch0")->GetUUID());
    EXPECT_EQ(param.portId, "11");
    EXPECT_GE(param.connectionId, before);
    EXPECT_LE(param.connectionId, after);
    // Making the point records nothing: the port is connected only when an
    // interface is added on it.
    EXPECT_EQ(Stored("dvports", "id", "11").value("connectionId", -1), 0);
}

TEST_F(ConnectionPoints, AConnectedDVPortKeepsItsConnectionId) {
    auto [point, errors] = Make({"-s", "dvSwitch0", "-P", "10"});
    ASSERT_TRUE(point);
    EXPECT_TRUE(errors.empty());
    EXPECT_EQ(point->GetDVPortParam().connectionId, 1717243002u);
}

TEST_F(ConnectionPoints, AddingOnANeverConnectedDVPortStoresTheTime) {
    IpInterfaceAdd add;
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    const std::uint32_t before = Now();
    add.Execute(AutoCli::ParseArguments(*add.GetInputSpec(), {"-s", "dvSwitch0", "-P", "22", "-i", "pld9"}), output);
    const std::uint32_t after = Now();
    ASSERT_EQ(output->GetErrors(), Names{});
    const Json stored = Stored("dvports", "id", "22");
    ASSERT_TRUE(stored.is_object());
    EXPECT_GE(stored.value("connectionId", 0u), before);
    EXPECT_LE(stored.value("connectionId", 0u), after);
    EXPECT_EQ(Stored("interfaces", "name", "pld9").value("dvPortId", ""), "22");
}

TEST_F(ConnectionPoints, ThePortGroupIsNamedExactly) {
    auto [point, errors] = Make({"-p", "VM Network"});
    ASSERT_TRUE(point);
    EXPECT_TRUE(errors.empty());
    EXPECT_EQ(point->GetType(), HostCtl::Network::ConnectionPoint::TYPE_PORT_GROUP);
    EXPECT_EQ(point->GetPortGroupName(), "VM Network");
    EXPECT_EQ(point->GetPortsetName(), "vSwitch0");

    auto [other, otherErrors] = Make({"-p", "vm network"});
    EXPECT_FALSE(other);
    EXPECT_EQ(otherErrors, Names{"Invalid vswitch port group or DVPort parameters."});
}

// The MTU reaches the library whole, also past what the framework lets
// through: a value past 32 bits is refused, never cut down to one that fits.
TEST_F(ConnectionPoints, AnMtuIsNeverNarrowed) {
    const std::int64_t mtu = (std::int64_t{1} << 32) + 1500;
    IpInterfaceAdd add;
    boost::shared_ptr<CallSpec::Input> input = CallSpec::Input::New();
    input->SetString("portgroup-name", "VM Network");
    input->SetString("interface-name", "pld9");
    input->SetInt("mtu", std::to_string(mtu), mtu);
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    add.Execute(input, output);
    EXPECT_EQ(output->GetErrors(),
              Names{"Unable to add Pallad network interface. Error was : Invalid MTU value 4294968796 for interface "
                    "pld9: must be between 1280 and 9000"});
    EXPECT_TRUE(Stored("interfaces", "name", "pld9").is_null());
}

}  // namespace
