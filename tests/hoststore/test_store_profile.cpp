// Profiles: every way a profile can be wrong, and the message that says where.
#include <gtest/gtest.h>

#include "support/store_test_util.h"

namespace {

using PldCtl::Store::Json;
using PldCtl::Store::ParseProfile;
using PldCtl::Store::ProfileError;

std::string ErrorOf(const std::string& text) {
    try {
        ParseProfile(text, "t.json");
    } catch (const ProfileError& e) {
        return e.what();
    }
    return "(accepted)";
}

// A profile with the required header and the given sections.
std::string WithSections(const std::string& sections) {
    return R"({"format": "orvix-host-profile", "version": 1, )" + sections + "}";
}

TEST(ProfileTest, HeaderAndShapeErrors) {
    EXPECT_EQ(ErrorOf("[]"), "profile t.json: the top level must be a JSON object");
    EXPECT_EQ(ErrorOf(R"({"version": 1})"), "profile t.json: \"format\" must be \"orvix-host-profile\"");
    EXPECT_EQ(ErrorOf(R"({"format": "other", "version": 1})"),
              "profile t.json: \"format\" must be \"orvix-host-profile\"");
    EXPECT_EQ(ErrorOf(R"({"format": "orvix-host-profile"})"), "profile t.json: \"version\" must be an integer");
    EXPECT_EQ(ErrorOf(R"({"format": "orvix-host-profile", "version": 2})"),
              "profile t.json: version 2 is not supported (this build reads version 1)");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitchs": [])")), "profile t.json: unknown section 'vswitchs'");
    EXPECT_EQ(ErrorOf(WithSections(R"("system": [])")), "profile t.json: system: must be a JSON object");
    EXPECT_EQ(ErrorOf(WithSections(R"("nics": {})")), "profile t.json: nics: must be a JSON array of objects");
    EXPECT_EQ(ErrorOf(WithSections(R"("nics": [{"name": "a"}, 1])")), "profile t.json: nics[1]: must be a JSON object");
}

TEST(ProfileTest, BadJsonSaysLineAndColumn) {
    const std::string message = ErrorOf("{\"format\": \"orvix-host-profile\",\n  \"version\": 1,,\n}");
    EXPECT_EQ(message.rfind("profile t.json: parse error at line 2, column 16: syntax error", 0), 0u) << message;
    EXPECT_EQ(message.find("[json.exception"), std::string::npos) << message;
}

TEST(ProfileTest, KeyErrors) {
    EXPECT_EQ(ErrorOf(WithSections(R"("nics": [{"driver": "x"}])")),
              "profile t.json: nics[0]: key field 'name' is missing");
    EXPECT_EQ(ErrorOf(WithSections(R"("nics": [{"name": true}])")),
              "profile t.json: nics[0]: field 'name' must be a string or an integer, not boolean");
    EXPECT_EQ(ErrorOf(WithSections(R"("worlds": [{"id": 7}, {"id": 8}, {"id": 7}])")),
              "profile t.json: worlds[2]: duplicate key '7' (as worlds[0])");
    // Keys of several fields are unique as a whole.
    EXPECT_EQ(ErrorOf(WithSections(R"("dvswitches": [{"name": "a"}, {"name": "b"}],
                                      "dvports": [{"dvswitch": "a", "id": 1}, {"dvswitch": "b", "id": 1},
                                                  {"dvswitch": "a", "id": "1"}])")),
              "profile t.json: dvports[2]: duplicate key 'a|1' (as dvports[0])");
    // Positional collections have no key to repeat.
    EXPECT_EQ(ErrorOf(WithSections(R"("execLog": [{"command": "x"}, {"command": "x"}])")), "(accepted)");
}

TEST(ProfileTest, ParentErrors) {
    EXPECT_EQ(ErrorOf(WithSections(R"("portgroups": [{"name": "pg"}])")),
              "profile t.json: portgroups[0]: parent field 'vswitch' is missing");
    EXPECT_EQ(ErrorOf(WithSections(R"("portgroups": [{"name": "pg", "vswitch": null}])")),
              "profile t.json: portgroups[0]: parent field 'vswitch' is missing");
    EXPECT_EQ(ErrorOf(WithSections(R"("vswitches": [{"name": "vSwitch0"}, {"name": "vSwitch1"}],
                                      "portgroups": [{"name": "a", "vswitch": "vSwitch0"},
                                                     {"name": "b", "vswitch": "vSwitch1"},
                                                     {"name": "c", "vswitch": "vSwitch9"}])")),
              "profile t.json: portgroups[2]: vswitch 'vSwitch9' does not exist in vswitches");
    // The owner's section may be missing altogether.
    EXPECT_EQ(ErrorOf(WithSections(R"("interfaces": [{"name": "pld0", "netstack": "ns"}])")),
              "profile t.json: interfaces[0]: netstack 'ns' does not exist in netstacks");
    // Owners written after their objects are found; a port's owner is not checked.
    EXPECT_EQ(ErrorOf(WithSections(R"("interfaces": [{"name": "pld0", "netstack": "ns"}],
                                      "netstacks": [{"key": "ns"}],
                                      "ports": [{"id": 1, "portset": "anything"}])")),
              "(accepted)");
}

TEST(ProfileTest, KeyOfAndValidateWithoutOrigin) {
    const auto& routes = PldCtl::Store::Collection("routes");
    EXPECT_EQ(PldCtl::Store::KeyOf(routes, {{"netstack", "ns"}, {"network", "0.0.0.0/0"}, {"gateway", ""}}),
              "ns|0.0.0.0/0|");
    EXPECT_EQ(PldCtl::Store::KeyOf(PldCtl::Store::Collection("worlds"), {{"id", -12}}), "-12");
    EXPECT_THROW(PldCtl::Store::KeyOf(routes, {{"netstack", "ns"}}), ProfileError);
    EXPECT_THROW(PldCtl::Store::Collection("vswitchs"), std::invalid_argument);
    try {
        PldCtl::Store::ValidateProfile(Json::parse(WithSections(R"("nics": [{}])")));
        FAIL() << "accepted";
    } catch (const ProfileError& e) {
        EXPECT_STREQ(e.what(), "profile: nics[0]: key field 'name' is missing");
    }
}

TEST(ProfileTest, ProfileFiles) {
    OrvixTest::TempDir dir;
    EXPECT_EQ(
        ParseProfile(PldCtl::Store::ReadProfileFile(StoreTest::FixturePath("small-host.json")), "x")["nics"].size(),
        2u);
    auto errorOf = [](const std::string& file) {
        try {
            PldCtl::Store::ReadProfileFile(file);
        } catch (const ProfileError& e) {
            return std::string(e.what());
        }
        return std::string("(read)");
    };
    EXPECT_EQ(errorOf(dir / "missing.json"),
              "cannot read profile '" + (dir / "missing.json") + "': No such file or directory");
    EXPECT_EQ(errorOf(dir.Path()), "cannot read profile '" + dir.Path() + "': not a regular file");
    // The embedded default host is a valid profile.
    EXPECT_NO_THROW(ParseProfile(PldCtl::Store::DefaultProfileText(), "(embedded default)"));
}

}  // namespace
