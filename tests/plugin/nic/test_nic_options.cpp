// The NIC offload and driver-parameter helpers against a NIC held in memory:
// which record each option edits and what reaches the NIC (mask bits,
// untouched members, values that are not narrowed), how a row shows a NIC
// that cannot answer, and how a change ends. Options are parsed by the
// framework's real parser from the declarations the commands use.
#include <map>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "framework/Runner.h"
#include "hostctl/Lib.h"
#include "nic/NicOptions.h"
#include "nic/NicPauseParamsSet.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Lib::HostCtlException;
using HostCtl::Network::CoalesceParams;
using HostCtl::Network::OffloadSettings;
using HostCtl::Network::PauseParams;
using HostCtl::Network::RingParams;
using HostCtl::Network::SoftwareSimulation;
using Names = std::vector<std::string>;

// A NIC whose driver records live in memory. A record that is absent cannot
// be read (HostCtlException, as a driver that does not support it); every
// record handed back is kept, so a test sees exactly what was sent.
class MemoryPnic : public HostCtl::Network::Pnic {
public:
    explicit MemoryPnic(std::string name) : name_(std::move(name)) {}

    std::optional<OffloadSettings> offloads;
    std::optional<SoftwareSimulation> simulation;
    std::optional<CoalesceParams> coalesce;
    std::optional<PauseParams> pause;
    // Set when reading the pause record fills it and then fails.
    bool pauseFailsAfterFilling = false;
    RingParams presetRing;
    RingParams currentRing;

    std::vector<OffloadSettings> sentOffloads;
    std::vector<SoftwareSimulation> sentSimulations;
    std::vector<CoalesceParams> sentCoalesce;
    std::vector<PauseParams> sentPause;
    std::vector<RingParams> sentRings;

    std::string GetName() const override { return name_; }
    std::unique_ptr<HostCtl::Network::PciDevice> GetPciDevice() const override { return nullptr; }
    int GetDuplex() const override { return HostCtl::Network::DUPLEX_FULL; }
    bool IsLinkUp() const override { return true; }
    bool IsLinkStatusUp() const override { return true; }
    bool IsAdminUp() const override { return true; }
    std::uint32_t GetLinkSpeed() const override { return 1000; }
    void SetLinkSpeedDuplex(std::int64_t, int) override { Unexpected(); }
    std::string GetDriverName() const override { return "memory"; }
    HostCtl::Network::MacAddress GetMacAddress() const override { return HostCtl::Network::MacAddress(); }
    void SetAdminUp(bool) override { Unexpected(); }
    std::uint32_t GetMtu() const override { return 1500; }
    void GetPnicInfo(HostCtl::Network::PnicInfo&) override { Unexpected(); }
    void GetPauseParams(PauseParams& params) override {
        if (pause) params = *pause;
        if (!pause || pauseFailsAfterFilling) Unsupported("pause parameters");
    }
    void GetCoalesceParams(CoalesceParams& params) override { params = Read(coalesce, "coalesce parameters"); }
    void GetRingParams(RingParams& preset, RingParams& current) override {
        preset = presetRing;
        current = currentRing;
    }
    void GetOffloadSettings(OffloadSettings& settings) override { settings = Read(offloads, "offload settings"); }
    void GetSoftwareSimulation(SoftwareSimulation& value) override { value = Read(simulation, "software simulation"); }
    void GetDriverInfo(HostCtl::Network::DriverInfo&) override { Unexpected(); }
    void SetPnicInfo(const HostCtl::Network::PnicInfo&) override { Unexpected(); }
    void SetPauseParams(const PauseParams& params) override { sentPause.push_back(params); }
    void SetCoalesceParams(const CoalesceParams& params) override { sentCoalesce.push_back(params); }
    void SetRingParams(const RingParams& params) override { sentRings.push_back(params); }
    void SetOffloadSettings(const OffloadSettings& settings) override { sentOffloads.push_back(settings); }
    void SetSoftwareSimulation(const SoftwareSimulation& value) override { sentSimulations.push_back(value); }
    void GetRegisters(std::vector<std::uint32_t>&) override { Unexpected(); }
    void GetEeprom(std::vector<std::uint8_t>&, std::int64_t, std::int64_t) override { Unexpected(); }
    void SetEepromValue(std::int64_t, std::int64_t, std::int64_t) override { Unexpected(); }
    void SetEepromFromFile(std::int64_t, const std::string&) override { Unexpected(); }
    void RestartNegotiation() override { Unexpected(); }
    void RunSelfTest(HostCtl::Network::SelfTestResult&, bool) override { Unexpected(); }

private:
    template <typename Record>
    Record Read(const std::optional<Record>& record, const std::string& what) const {
        if (!record) Unsupported(what);
        return *record;
    }
    [[noreturn]] void Unsupported(const std::string& what) const {
        throw HostCtlException("The driver of NIC " + name_ + " does not support " + what);
    }
    [[noreturn]] static void Unexpected() { throw std::logic_error("not used by these commands"); }

    std::string name_;
};

// The host's NICs, each made anew from its template on every lookup.
class MemoryNics : public HostCtl::Network::NetworkInfo {
public:
    std::map<std::string, MemoryPnic*> nics;

    std::vector<std::unique_ptr<HostCtl::Network::Pnic>> GetPnics() override {
        std::vector<std::unique_ptr<HostCtl::Network::Pnic>> all;
        for (const auto& entry : nics) all.push_back(std::make_unique<MemoryPnic>(*entry.second));
        return all;
    }
    std::unique_ptr<HostCtl::Network::Pnic> GetPnicByName(const std::string& name) override {
        auto found = nics.find(name);
        if (found == nics.end()) return nullptr;
        return std::make_unique<Forwarding>(*found->second);
    }
    int GetNetstackInstanceState(const std::string&) override { return 0; }

private:
    // Hands every call to the NIC in the map, so what a change sends stays
    // visible to the test after the command dropped its object.
    class Forwarding : public MemoryPnic {
    public:
        explicit Forwarding(MemoryPnic& target) : MemoryPnic(target.GetName()), target_(target) {}
        void GetOffloadSettings(OffloadSettings& settings) override { target_.GetOffloadSettings(settings); }
        void SetOffloadSettings(const OffloadSettings& settings) override { target_.SetOffloadSettings(settings); }

    private:
        MemoryPnic& target_;
    };
};

boost::shared_ptr<CallSpec::Input> Parse(void (*declare)(const boost::shared_ptr<CallSpec::InputSpec>&),
                                         const Names& args) {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    declare(declared);
    return AutoCli::ParseArguments(*declared, args);
}

std::string Text(const boost::shared_ptr<MetaObj::MetaStruct>& record, const std::string& field) {
    auto value = boost::dynamic_pointer_cast<MetaObj::MetaString>(record->GetField(field));
    return value ? value->GetValue() : "<not a text>";
}

bool Flag(const boost::shared_ptr<MetaObj::MetaStruct>& record, const std::string& field) {
    auto value = boost::dynamic_pointer_cast<MetaObj::MetaBool>(record->GetField(field));
    if (!value || !value->HasValue()) throw std::logic_error(field + " is not a bool");
    return value->GetValue();
}

// Every field of a row after "NIC", in the row's order.
Names ValuesOf(const boost::shared_ptr<MetaObj::MetaStruct>& record) {
    Names values;
    for (const auto& field : record->GetFields()) {
        if (field.first != kNicField) values.push_back(Text(record, field.first));
    }
    return values;
}

OffloadSettings Offloads(bool rx, bool tx, bool sg, bool tso) {
    OffloadSettings settings;
    settings.rxChecksum = rx;
    settings.txChecksum = tx;
    settings.scatterGather = sg;
    settings.tso = tso;
    return settings;
}

TEST(OffloadFamilies, ASetSendsOnlyItsOwnMaskBitsAndChangesOnlyItsOwnMembers) {
    struct Case {
        OffloadFamily family;
        bool enable;
        std::uint8_t mask;
        OffloadSettings sent;
    };
    // The NIC starts with RX checksum and scatter-gather off, TX checksum and
    // TSO on, so that a family touching a member not its own shows.
    const Case cases[] = {
        {OffloadFamily::Checksum, true, 0x03, Offloads(true, true, false, true)},
        {OffloadFamily::Checksum, false, 0x03, Offloads(false, false, false, true)},
        {OffloadFamily::Segmentation, false, 0x08, Offloads(false, true, false, false)},
        {OffloadFamily::Segmentation, true, 0x08, Offloads(false, true, false, true)},
        {OffloadFamily::ScatterGather, true, 0x04, Offloads(false, true, true, true)},
        {OffloadFamily::ScatterGather, false, 0x04, Offloads(false, true, false, true)},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(OffloadRecordType(c.family) + (c.enable ? " on" : " off"));
        MemoryPnic pnic("hwnic0");
        pnic.offloads = Offloads(false, true, false, true);
        SetOffload(c.family, pnic, c.enable);
        ASSERT_EQ(pnic.sentOffloads.size(), 1u);
        const OffloadSettings& sent = pnic.sentOffloads[0];
        EXPECT_EQ(sent.mask, c.mask);
        EXPECT_EQ(sent.rxChecksum, c.sent.rxChecksum);
        EXPECT_EQ(sent.txChecksum, c.sent.txChecksum);
        EXPECT_EQ(sent.scatterGather, c.sent.scatterGather);
        EXPECT_EQ(sent.tso, c.sent.tso);
    }
}

TEST(OffloadFamilies, RowsShowTheirOwnMembersAndNotAvailableForANicThatCannotAnswer) {
    MemoryPnic pnic("hwnic3");
    pnic.offloads = Offloads(true, false, false, true);
    EXPECT_EQ(ValuesOf(OffloadRow(OffloadFamily::Checksum, pnic)), (Names{"on", "off"}));
    EXPECT_EQ(ValuesOf(OffloadRow(OffloadFamily::Segmentation, pnic)), Names{"on"});
    EXPECT_EQ(ValuesOf(OffloadRow(OffloadFamily::ScatterGather, pnic)), Names{"off"});

    pnic.offloads.reset();
    for (OffloadFamily family : {OffloadFamily::Checksum, OffloadFamily::Segmentation, OffloadFamily::ScatterGather}) {
        auto row = OffloadRow(family, pnic);
        EXPECT_EQ(Text(row, kNicField), "hwnic3");
        EXPECT_EQ(ValuesOf(row), Names(OffloadFields(family).size() - 1, "N/A"));
    }
    // A family's set needs the current record: a NIC that cannot give it
    // is not changed.
    EXPECT_THROW(SetOffload(OffloadFamily::Checksum, pnic, true), HostCtlException);
    EXPECT_TRUE(pnic.sentOffloads.empty());
}

// Whether the feature at `position` of the record is the one of mask `bit`.
bool OwnFeature(std::size_t position, std::uint32_t bit) {
    return (std::uint32_t{1} << position) == bit;
}

// Each option of software set, alone, with the mask bit and the listing
// field of the feature it stands for in the NIC's record.
TEST(SoftwareSimulationOptions, EachOptionSetsItsOwnFeatureAndTheListingShowsItInItsOwnField) {
    struct Case {
        const char* option;
        std::uint32_t bit;
        const char* field;
    };
    const Case cases[] = {
        {"ipv4cso", 0x0001, "IPv4 CSO"},         {"ipv4tso", 0x0002, "IPv4 TSO"},
        {"sg", 0x0004, "Scatter Gather"},        {"obo", 0x0008, "Offset Based Offload"},
        {"vxlanencap", 0x0010, "VXLAN Encap"},   {"ipv6tso", 0x0020, "IPv6 TSO"},
        {"ipv6tsoext", 0x0040, "IPv6 TSO Ext"},  {"ipv6cso", 0x0080, "IPv6 CSO"},
        {"ipv6csoext", 0x0100, "IPv6 CSO Ext"},  {"highdma", 0x0200, "High DMA"},
        {"sgsp", 0x0400, "Scatter Gather MP"},   {"tagging", 0x0800, "VLAN Tagging"},
        {"untagging", 0x1000, "VLAN Untagging"}, {"geneveoffload", 0x2000, "Geneve Offload"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.option);
        for (bool value : {true, false}) {
            const SoftwareSimulation sent = SoftwareSimulationFromOptions(
                *Parse(AddSoftwareSimulationParameters, {std::string("--") + c.option, value ? "true" : "false"}));
            EXPECT_EQ(sent.mask, c.bit);
            for (std::size_t feature = 0; feature < sent.enabled.size(); ++feature) {
                EXPECT_EQ(sent.enabled[feature], OwnFeature(feature, c.bit) && value) << "feature " << feature;
            }
        }

        MemoryPnic pnic("hwnic0");
        SoftwareSimulation stored;
        for (std::size_t feature = 0; feature < stored.enabled.size(); ++feature) {
            stored.enabled[feature] = OwnFeature(feature, c.bit);
        }
        pnic.simulation = stored;
        auto row = SoftwareSimulationRow(pnic);
        for (const std::string& field : SoftwareSimulationFields()) {
            if (field == kNicField) continue;
            EXPECT_EQ(Text(row, field), field == c.field ? "on" : "off") << field;
        }
    }
}

TEST(SoftwareSimulationOptions, NoOptionMarksNothingAndSeveralMarkEachOfThem) {
    EXPECT_EQ(SoftwareSimulationFromOptions(*Parse(AddSoftwareSimulationParameters, {})).mask, 0u);
    const SoftwareSimulation sent = SoftwareSimulationFromOptions(
        *Parse(AddSoftwareSimulationParameters, {"--sg", "false", "--geneveoffload", "yes", "--ipv4cso=1"}));
    EXPECT_EQ(sent.mask, 0x2005u);
    EXPECT_TRUE(sent.enabled[SoftwareSimulation::GENEVE_OFFLOAD]);
    EXPECT_TRUE(sent.enabled[SoftwareSimulation::IPV4_CSO]);
    EXPECT_FALSE(sent.enabled[SoftwareSimulation::SCATTER_GATHER]);

    MemoryPnic silent("hwnic5");
    EXPECT_EQ(ValuesOf(SoftwareSimulationRow(silent)), Names(14, "N/A"));
}

CoalesceParams Coalesce() {
    CoalesceParams params;
    params.adaptiveRx = true;
    params.adaptiveTx = false;
    params.sampleInterval = 2;
    params.rxUsecs = 50;
    params.rxMaxFrames = 64;
    params.txUsecs = 16;
    params.txMaxFrames = 4294967295;
    return params;
}

// What coalesce set sends for the options given: the members whose option
// was given overwritten, the others as read.
CoalesceParams CoalesceSent(const Names& args) {
    MemoryPnic pnic("hwnic2");
    pnic.coalesce = Coalesce();
    RewriteCoalesce(*Parse(AddCoalesceParameters, args), pnic);
    if (pnic.sentCoalesce.size() != 1) throw std::logic_error("not sent once");
    return pnic.sentCoalesce[0];
}

TEST(CoalesceOptions, GivenOptionsOverwriteTheirMemberUnnarrowedAndTheOthersKeepWhatWasRead) {
    CoalesceParams sent = CoalesceSent({});
    EXPECT_EQ(sent.rxUsecs, 50);
    EXPECT_EQ(sent.txMaxFrames, 4294967295);
    EXPECT_TRUE(sent.adaptiveRx);

    // Values outside the NIC's 32 bits reach the record as typed, for the
    // library to refuse rather than to store wrapped around.
    sent = CoalesceSent({"-r", "4294967296", "--tx-usecs=-1", "-A", "true", "--adaptive-rx", "false", "-i", "3600"});
    EXPECT_EQ(sent.rxUsecs, 4294967296);
    EXPECT_EQ(sent.txUsecs, -1);
    EXPECT_TRUE(sent.adaptiveTx);
    EXPECT_FALSE(sent.adaptiveRx);
    EXPECT_EQ(sent.sampleInterval, 3600);
    EXPECT_EQ(sent.rxMaxFrames, 64);
    EXPECT_EQ(sent.txMaxFrames, 4294967295);

    sent = CoalesceSent({"-R", "7", "-T", "9"});
    EXPECT_EQ(sent.rxMaxFrames, 7);
    EXPECT_EQ(sent.txMaxFrames, 9);
    EXPECT_EQ(sent.rxUsecs, 50);
    EXPECT_EQ(sent.sampleInterval, 2);

    EXPECT_THROW(Parse(AddCoalesceParameters, {"-i", "0"}), AutoCli::UsageError);
    EXPECT_THROW(Parse(AddCoalesceParameters, {"--sample-interval", "3601"}), AutoCli::UsageError);
}

TEST(CoalesceOptions, RowsShowCountsInDecimalAndAdaptiveSwitchesCapitalised) {
    MemoryPnic pnic("hwnic2");
    pnic.coalesce = Coalesce();
    EXPECT_EQ(ValuesOf(CoalesceRow(pnic)), (Names{"50", "64", "16", "4294967295", "On", "Off", "2"}));
    pnic.coalesce.reset();
    EXPECT_EQ(ValuesOf(CoalesceRow(pnic)), Names(7, "N/A"));
}

TEST(PauseRows, ResolutionsNeedBothDirectionsAndAnUnsupportedNicShowsEverythingFalse) {
    struct Case {
        const char* why;
        PauseParams read;
        bool failsAfterFilling;
        // Supported, auto, RX, TX, resolution available, RX resolution, TX resolution.
        std::vector<bool> shown;
    };
    const Case cases[] = {
        {"both directions resolved and paused",
         {true, true, true, false, 1, 1},
         false,
         {true, true, true, false, true, true, true}},
        {"only RX has a resolution",
         {true, true, false, true, 1, 0},
         false,
         {true, true, false, true, false, false, false}},
        {"only TX has a resolution",
         {true, false, true, true, 0, 1},
         false,
         {true, false, true, true, false, false, false}},
        {"resolved but not paused by it",
         {true, true, true, true, 2, 1},
         false,
         {true, true, true, true, true, false, true}},
        {"not supported, whatever else it says",
         {false, true, true, true, 1, 1},
         false,
         {false, false, false, false, false, false, false}},
        {"failed after filling the record",
         {true, true, true, true, 1, 1},
         true,
         {false, false, false, false, false, false, false}},
    };
    const char* const fields[] = {"Pause Params Supported",
                                  "Auto Negotiation",
                                  "Pause RX",
                                  "Pause TX",
                                  "Auto Negotiation Resolution Avail",
                                  "RX Auto Negotiation Resolution",
                                  "TX Auto Negotiation Resolution"};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.why);
        MemoryPnic pnic("hwnic1");
        pnic.pause = c.read;
        pnic.pauseFailsAfterFilling = c.failsAfterFilling;
        auto row = PauseRow(pnic);
        for (std::size_t i = 0; i < c.shown.size(); ++i) EXPECT_EQ(Flag(row, fields[i]), c.shown[i]) << fields[i];
    }
}

TEST(PauseOptions, OnlyTheGivenSwitchesChangeAndTheRecordIsSentEvenWithoutAny) {
    boost::shared_ptr<CallSpec::InputSpec> declared = NicPauseParamsSet::New()->GetInputSpec();
    MemoryPnic pnic("hwnic1");
    pnic.pause = PauseParams{true, true, false, true, 1, 1};
    auto send = [&](const Names& args) {
        RewritePause(*AutoCli::ParseArguments(*declared, args), pnic);
        pnic.pause = pnic.sentPause.back();
        return pnic.sentPause.back();
    };
    PauseParams sent = send({"-n", "hwnic1"});
    EXPECT_EQ(pnic.sentPause.size(), 1u);
    EXPECT_TRUE(sent.autoNegotiate);
    EXPECT_FALSE(sent.rx);
    EXPECT_TRUE(sent.tx);
    sent = send({"-n", "hwnic1", "--rx", "true"});
    EXPECT_TRUE(sent.autoNegotiate);
    EXPECT_TRUE(sent.rx);
    EXPECT_TRUE(sent.tx);
    sent = send({"-n", "hwnic1", "-a", "false", "-t", "false"});
    EXPECT_FALSE(sent.autoNegotiate);
    EXPECT_TRUE(sent.rx);
    EXPECT_FALSE(sent.tx);
    EXPECT_TRUE(sent.supported);
    EXPECT_EQ(sent.rxResolution, 1);
}

TEST(RingOptions, EachSizeCarriesItsMaskBitAndNoSizeMarksNothing) {
    struct Case {
        Names args;
        std::uint8_t mask;
        std::int64_t rx, rxMini, rxJumbo, tx;
    };
    const Case cases[] = {
        {{}, 0, 0, 0, 0, 0},
        {{"-r", "512"}, 0x1, 512, 0, 0, 0},
        {{"--rx-mini", "4294967296"}, 0x2, 0, 4294967296, 0, 0},
        {{"-j", "-1"}, 0x4, 0, 0, -1, 0},
        {{"--tx=0"}, 0x8, 0, 0, 0, 0},
        {{"-t", "9", "-r", "8", "-m", "7", "-j", "6"}, 0xf, 8, 7, 6, 9},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(::testing::PrintToString(c.args));
        const RingParams sizes = RingSizesFromOptions(*Parse(AddRingSizeParameters, c.args));
        EXPECT_EQ(sizes.mask, c.mask);
        EXPECT_EQ(sizes.rx, c.rx);
        EXPECT_EQ(sizes.rxMini, c.rxMini);
        EXPECT_EQ(sizes.rxJumbo, c.rxJumbo);
        EXPECT_EQ(sizes.tx, c.tx);
    }
}

TEST(RingOptions, PresetAndCurrentComeFromTheirOwnRecordOfTheSameRead) {
    MemoryPnic pnic("hwnic2");
    pnic.presetRing = RingParams{0, 8192, 0, 2048, 8192};
    pnic.currentRing = RingParams{0, 2048, 1, 512, 1024};
    auto preset = RingRecord(pnic, RingChoice::Preset);
    auto current = RingRecord(pnic, RingChoice::Current);
    auto number = [](const boost::shared_ptr<MetaObj::MetaStruct>& record, const char* field) {
        return boost::dynamic_pointer_cast<MetaObj::MetaInt>(record->GetField(field))->GetValue();
    };
    EXPECT_EQ(number(preset, "RX"), 8192);
    EXPECT_EQ(number(preset, "RX Jumbo"), 2048);
    EXPECT_EQ(number(current, "RX Mini"), 1);
    EXPECT_EQ(number(current, "TX"), 1024);
}

class Changes : public ::testing::Test {
protected:
    Changes() : pnic_("hwnic0") {
        pnic_.offloads = Offloads(true, true, true, true);
        nics_.nics["hwnic0"] = &pnic_;
    }

    boost::shared_ptr<CallSpec::Output> Change(const std::string& name) {
        boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
        boost::shared_ptr<CallSpec::InputSpec> declared = OffloadSetInput("", "");
        ChangeNic(nics_, AutoCli::ParseArguments(*declared, {"-n", name, "-e", "0"}), output, "hwnic",
                  MissingNic::PnicNotFound,
                  [](HostCtl::Network::Pnic& pnic) { SetOffload(OffloadFamily::Segmentation, pnic, false); });
        return output;
    }

    MemoryPnic pnic_;
    MemoryNics nics_;
};

TEST_F(Changes, ASuccessEndsWithAValuelessBooleanAndAFailureWithItsMessageAlone) {
    auto done = Change("hwnic0");
    EXPECT_TRUE(done->GetErrors().empty());
    auto result = boost::dynamic_pointer_cast<MetaObj::MetaBool>(done->GetResult());
    ASSERT_TRUE(result);
    EXPECT_FALSE(result->HasValue());
    EXPECT_EQ(done->CompleteCalls(), 1);
    ASSERT_EQ(pnic_.sentOffloads.size(), 1u);
    EXPECT_FALSE(pnic_.sentOffloads[0].tso);

    auto missing = Change("hwnic9");
    EXPECT_EQ(missing->GetErrors(), Names{"Pnic with name hwnic9 not found"});
    EXPECT_FALSE(missing->GetResult());
    EXPECT_EQ(missing->CompleteCalls(), 0);

    pnic_.offloads.reset();
    auto refused = Change("hwnic0");
    EXPECT_EQ(refused->GetErrors(), Names{"The driver of NIC hwnic0 does not support offload settings"});
    EXPECT_FALSE(refused->GetResult());
    EXPECT_EQ(refused->CompleteCalls(), 0);
    EXPECT_EQ(pnic_.sentOffloads.size(), 1u);
}

TEST_F(Changes, AListingGoesOnPastANicThatCannotAnswer) {
    MemoryPnic silent("hwnic1");
    nics_.nics["hwnic1"] = &silent;
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    ListNicRows(nics_, CallSpec::Input::New(), output, "", MissingNic::PnicNotFound,
                MetaObj::MetaStruct::New("CSOSettings"),
                [](HostCtl::Network::Pnic& pnic) { return OffloadRow(OffloadFamily::Checksum, pnic); });
    EXPECT_TRUE(output->GetErrors().empty());
    auto rows = boost::dynamic_pointer_cast<MetaObj::MetaList>(output->GetResult());
    ASSERT_TRUE(rows);
    ASSERT_EQ(rows->Size(), 2u);
    auto first = boost::dynamic_pointer_cast<MetaObj::MetaStruct>(rows->GetElements()[0]);
    auto second = boost::dynamic_pointer_cast<MetaObj::MetaStruct>(rows->GetElements()[1]);
    EXPECT_EQ(ValuesOf(first), (Names{"on", "on"}));
    EXPECT_EQ(Text(second, kNicField), "hwnic1");
    EXPECT_EQ(ValuesOf(second), (Names{"N/A", "N/A"}));
}

}  // namespace
