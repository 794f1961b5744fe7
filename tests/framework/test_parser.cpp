// Argument parsing and checking: the forms, the types and the constraints,
// with the one-line messages a user sees.
#include <gtest/gtest.h>

#include "framework/Runner.h"

namespace {

using CallSpec::ParameterConstraint;
using CallSpec::ParameterSpec;
using CallSpec::Required;

boost::shared_ptr<ParameterSpec> Param(
    const std::string& name, CallSpec::ParameterType type, const std::string& letter, Required required = Required::No,
    boost::shared_ptr<ParameterConstraint> c = boost::shared_ptr<ParameterConstraint>()) {
    auto p = ParameterSpec::New(name, type);
    p->SetShortName(letter);
    p->SetRequired(required);
    if (c) p->SetConstraint(c);
    return p;
}

const char kInterfacePattern[] = "pld([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])";

// A declaration like a real command's, its constraints built by the
// framework's factories: a required string, an int range, a bool, a flag, a
// string enum, a regex and an int enum.
boost::shared_ptr<CallSpec::InputSpec> SampleSpec() {
    auto declared = CallSpec::InputSpec::New();
    declared->AddParameter(Param("vswitch-name", CallSpec::PARAM_STRING, "v", Required::Yes));
    declared->AddParameter(Param("ports", CallSpec::PARAM_INT, "P", Required::No, CallSpec::IntRange(1, 4096)));
    declared->AddParameter(Param("enabled", CallSpec::PARAM_BOOL, "e"));
    declared->AddParameter(Param("use-vswitch", CallSpec::PARAM_FLAG, "u"));
    declared->AddParameter(
        Param("cdp-status", CallSpec::PARAM_STRING, "c", Required::No,
              CallSpec::StringEnum(
                  {{"down", "Down"}, {"listen", "Listen only"}, {"advertise", ""}, {"both", "Listen and advertise"}})));
    declared->AddParameter(
        Param("interface-name", CallSpec::PARAM_STRING, "i", Required::No, CallSpec::StringRegex(kInterfacePattern)));
    declared->AddParameter(Param("mtu", CallSpec::PARAM_INT, "m"));
    declared->AddParameter(Param("level", CallSpec::PARAM_INT, "l", Required::No, CallSpec::IntEnum({1, 3})));
    return declared;
}

std::string UsageMessage(const std::vector<std::string>& args) {
    try {
        AutoCli::ParseArguments(*SampleSpec(), args);
    } catch (const AutoCli::UsageError& e) {
        return e.what();
    }
    return "(accepted)";
}

TEST(Parser, AcceptsEveryFormAndReadsTypedValues) {
    auto in = AutoCli::ParseArguments(
        *SampleSpec(), {"--vswitch-name=vSwitch0", "-P", "4096", "--enabled", "YES", "-u", "-c=listen", "--mtu", "-1"});
    EXPECT_EQ(in->GetString("vswitch-name"), "vSwitch0");
    EXPECT_EQ(in->GetInt("ports"), 4096);
    EXPECT_EQ(in->GetString("ports"), "4096");  // the text as typed
    EXPECT_TRUE(in->GetBool("enabled"));
    EXPECT_TRUE(in->GetFlag("use-vswitch"));
    EXPECT_EQ(in->GetString("cdp-status"), "listen");
    EXPECT_EQ(in->GetInt("mtu"), -1);  // a negative number is a value, not an option

    // What was not given reads as "", 0, false - and is not set.
    EXPECT_FALSE(in->IsSet("interface-name"));
    EXPECT_EQ(in->GetString("interface-name"), "");
    EXPECT_EQ(in->GetInt("level"), 0);

    auto other = AutoCli::ParseArguments(*SampleSpec(), {"-v", "x", "--enabled=0", "--ports=+7", "--mtu=-0"});
    EXPECT_FALSE(other->GetBool("enabled"));
    EXPECT_TRUE(other->IsSet("enabled"));
    EXPECT_EQ(other->GetInt("ports"), 7);
    EXPECT_FALSE(other->GetFlag("use-vswitch"));
}

TEST(Parser, BoolWordsAndIntegers) {
    bool b = false;
    for (const char* yes : {"true", "TRUE", "1", "yes", "Yes"}) {
        EXPECT_TRUE(AutoCli::ParseBoolWord(yes, b) && b) << yes;
    }
    for (const char* no : {"false", "False", "0", "no", "NO"}) {
        EXPECT_TRUE(AutoCli::ParseBoolWord(no, b) && !b) << no;
    }
    for (const char* bad : {"", "y", "on", "2", "truee"}) EXPECT_FALSE(AutoCli::ParseBoolWord(bad, b)) << bad;

    std::int64_t v = 0;
    EXPECT_TRUE(AutoCli::ParseInt64("9223372036854775807", v));
    EXPECT_EQ(v, INT64_MAX);
    EXPECT_TRUE(AutoCli::ParseInt64("-9223372036854775808", v));
    EXPECT_EQ(v, INT64_MIN);
    for (const char* bad : {"9223372036854775808", "-9223372036854775809", "", "-", "+", "1.5", " 1", "1 ", "0x10",
                            "99999999999999999999999"}) {
        EXPECT_FALSE(AutoCli::ParseInt64(bad, v)) << bad;
    }
}

TEST(Parser, RefusesBadCommandLinesWithOneLineMessages) {
    const std::vector<std::pair<std::vector<std::string>, std::string>> cases = {
        {{}, "Missing required option --vswitch-name"},
        {{"-v", "a", "--vswitch-nam=b"}, "Unknown option --vswitch-nam. Did you mean --vswitch-name?"},
        {{"-v", "a", "--bogus"}, "Unknown option --bogus"},
        {{"-v", "a", "-x", "1"}, "Unknown option -x"},
        {{"-v", "a", "-mtu", "1"}, "Unknown option -mtu. Did you mean --mtu?"},
        {{"-v", "a", "-v", "b"}, "Option --vswitch-name is given more than once"},
        {{"-v", "a", "stray"}, "Unexpected argument 'stray'"},
        {{"-v"}, "Option --vswitch-name needs a value"},
        {{"-v", "a", "--enabled"}, "Option --enabled needs a value (true or false)"},
        {{"-v", "a", "--enabled", "--mtu", "3"}, "Option --enabled needs a value (true or false)"},
        {{"-v", "a", "--enabled=maybe"}, "Invalid value 'maybe' for --enabled: expected true or false"},
        {{"-v", "a", "--use-vswitch=true"}, "Option --use-vswitch takes no value"},
        {{"-v", "a", "--ports=abc"}, "Invalid value 'abc' for --ports: expected an integer"},
        {{"-v", "a", "--mtu=12345678901234567890"},
         "Value 12345678901234567890 for --mtu does not fit a 64-bit integer"},
        {{"-v", "a", "--ports=4097"}, "Value 4097 for --ports is out of range: it must be between 1 and 4096"},
        {{"-v", "a", "--ports=0"}, "Value 0 for --ports is out of range: it must be between 1 and 4096"},
        {{"-v", "a", "--level=2"}, "Value 2 for --level is not allowed: it must be one of 1, 3"},
        {{"-v", "a", "--cdp-status=bothh"},
         "Invalid value 'bothh' for --cdp-status: it must be one of down, listen, advertise, both. Did you mean "
         "'both'?"},
        {{"-v", "a", "--cdp-status=Listen"},
         "Invalid value 'Listen' for --cdp-status: it must be one of down, listen, advertise, both. Did you mean "
         "'listen'?"},
        // The regex must match the whole value, not a part of it.
        {{"-v", "a", "--interface-name=pld256"},
         std::string("Invalid value 'pld256' for --interface-name: it must match ") + kInterfacePattern},
        {{"-v", "a", "--interface-name=xpld1"},
         std::string("Invalid value 'xpld1' for --interface-name: it must match ") + kInterfacePattern},
    };
    for (const auto& c : cases) {
        std::string line;
        for (const auto& a : c.first) line += a + " ";
        EXPECT_EQ(UsageMessage(c.first), c.second) << line;
    }
    EXPECT_EQ(UsageMessage({"-v", "a", "--ports=1", "--interface-name=pld255", "--level=3", "--cdp-status=both"}),
              "(accepted)");
}

TEST(Parser, SpecRefusesClashingDeclarations) {
    auto declared = CallSpec::InputSpec::New();
    declared->AddParameter(Param("vswitch-name", CallSpec::PARAM_STRING, "v"));
    EXPECT_THROW(declared->AddParameter(Param("vswitch-name", CallSpec::PARAM_STRING, "x")), std::invalid_argument);
    EXPECT_THROW(declared->AddParameter(Param("vlan-id", CallSpec::PARAM_INT, "v")), std::invalid_argument);
    EXPECT_THROW(ParameterSpec::New("p", CallSpec::PARAM_INT)->SetShortName("ab"), std::invalid_argument);
}

// A constraint no value could meet, or one that cannot be checked, is a
// mistake in the declaration: it is refused when the command declares it,
// not discovered by a user.
TEST(ConstraintFactories, RefuseConstraintsThatCannotWork) {
    EXPECT_THROW(CallSpec::IntRange(5, 1), std::invalid_argument);
    EXPECT_THROW(CallSpec::IntEnum({}), std::invalid_argument);
    EXPECT_THROW(CallSpec::StringEnum({}), std::invalid_argument);
    EXPECT_THROW(CallSpec::StringRegex("pld("), std::invalid_argument);
    // A range of one value and the widest range are fine.
    EXPECT_NO_THROW(CallSpec::IntRange(7, 7));
    EXPECT_NO_THROW(CallSpec::IntRange(INT64_MIN, INT64_MAX));
}

TEST(ConstraintFactories, EnumsExpandInHelpInTheirDeclaredOrder) {
    auto cdp = SampleSpec()->FindByName("cdp-status");
    cdp->SetDescription("One of %ENUM%:%FULLENUM%");
    EXPECT_EQ(AutoCli::ExpandDescription(*cdp, "  "),
              "One of down, listen, advertise, both:\n  down: Down\n  listen: Listen only\n  advertise\n  both: "
              "Listen and advertise");
    auto level = SampleSpec()->FindByName("level");
    level->SetDescription("%ENUM% (%FULLENUM%)");
    EXPECT_EQ(AutoCli::ExpandDescription(*level, "-"), "1, 3 (\n-1\n-3)");
}

TEST(ConstraintFactories, ARangeAdmitsItsBoundsAndNamesThemWhenRefusing) {
    auto declared = CallSpec::InputSpec::New();
    declared->AddParameter(Param("delta", CallSpec::PARAM_INT, "d", Required::No, CallSpec::IntRange(-5, INT64_MAX)));
    EXPECT_EQ(AutoCli::ParseArguments(*declared, {"-d", "-5"})->GetInt("delta"), -5);
    EXPECT_EQ(AutoCli::ParseArguments(*declared, {"-d", "9223372036854775807"})->GetInt("delta"), INT64_MAX);
    try {
        AutoCli::ParseArguments(*declared, {"--delta=-6"});
        ADD_FAILURE() << "-6 accepted";
    } catch (const AutoCli::UsageError& e) {
        EXPECT_STREQ(e.what(), "Value -6 for --delta is out of range: it must be between -5 and 9223372036854775807");
    }
}

TEST(Parser, SuggestsOnlyCloseWords) {
    const std::vector<std::string> words = {"list", "add", "remove", "set", "policy", "portgroup"};
    EXPECT_EQ(AutoCli::SuggestClosest("lst", words), "list");
    EXPECT_EQ(AutoCli::SuggestClosest("remvoe", words), "remove");
    EXPECT_EQ(AutoCli::SuggestClosest("port", words), "portgroup");  // a word cut short
    EXPECT_EQ(AutoCli::SuggestClosest("firewall", words), "");
}

}  // namespace
