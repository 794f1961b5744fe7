// One sweep over every node of the tree the plug-in registers: each help
// renders with its enums expanded and every parameter described, and each
// leaf's output template renders in every formatter as a document a script
// can parse. A command added to the tree is covered without a line here.
#include <map>
#include <regex>
#include <set>
#include <sstream>

#include <gtest/gtest.h>

#include "framework/AutoCli.h"
#include "framework/Format.h"
#include "framework/Runner.h"
#include "support/documents.h"

extern "C" void AutoCli_RegisterNamespaces(boost::shared_ptr<AutoCli::Namespace> parent);

namespace {

using MetaObj::MetaObjectPtr;

struct Node {
    std::vector<std::string> words;
    boost::shared_ptr<AutoCli::NamespaceNode> node;
    std::string Path() const { return AutoCli::JoinNames(words, " "); }
};

void Collect(const Node& at, std::vector<Node>& nodes) {
    nodes.push_back(at);
    for (const auto& child : at.node->GetChildren()) {
        Node next{at.words, child.second};
        next.words.push_back(child.first);
        Collect(next, nodes);
    }
}

// A text that needs escaping in every machine format.
const std::string kSampleText = "a \"b\" <c> & 'd', e;\tf=%Name%\n\xC3\xA9";

MetaObjectPtr Sample(const MetaObjectPtr& templ, const AutoCli::FormatHints& hints, int variant);

// A field only the "fields:" hint names has no declared type: it gets the
// type that `choice` picks, so that over the variants each such field is
// rendered as each type.
MetaObjectPtr Untyped(int choice) {
    switch (choice % 4) {
        case 0:
            return MetaObj::MetaString::New(kSampleText);
        case 1:
            return MetaObj::MetaInt::New(-1234567890123);
        case 2:
            return MetaObj::MetaBool::New(true);
        default:
            auto list = MetaObj::MetaList::New(MetaObj::META_STRING);
            list->Append(kSampleText);
            list->Append("");
            return list;
    }
}

boost::shared_ptr<MetaObj::MetaStruct> SampleRecord(const MetaObj::MetaStruct& templ, const AutoCli::FormatHints& hints,
                                                    int variant) {
    auto record = MetaObj::MetaStruct::New(templ.GetTypeName());
    for (const auto& field : templ.GetFields()) record->SetField(field.first, Sample(field.second, hints, variant));
    if (const auto& named = hints.Fields(templ.GetTypeName())) {
        int choice = variant;
        for (const auto& name : *named) {
            if (!record->GetField(name)) record->SetField(name, Untyped(choice++));
        }
    }
    return record;
}

// A value of the template's shape with every field set, lists with two
// elements.
MetaObjectPtr Sample(const MetaObjectPtr& templ, const AutoCli::FormatHints& hints, int variant) {
    switch (templ->GetType()) {
        case MetaObj::META_BOOL:
            return MetaObj::MetaBool::New(variant % 2 == 0);
        case MetaObj::META_INT:
            return variant % 2 == 0 ? MetaObj::MetaInt::New(-42)
                                    : MetaObj::MetaInt::NewUnsigned(18446744073709551615ull);
        case MetaObj::META_STRING:
            return MetaObj::MetaString::New(kSampleText);
        case MetaObj::META_STRUCT:
            return SampleRecord(static_cast<const MetaObj::MetaStruct&>(*templ), hints, variant);
        case MetaObj::META_LIST:
            break;
    }
    const auto& list = static_cast<const MetaObj::MetaList&>(*templ);
    auto sample = MetaObj::MetaList::New(list.GetElementType(), list.GetElementTemplate());
    for (int i = 0; i < 2; ++i) {
        if (list.GetElementType() == MetaObj::META_STRUCT) {
            sample->Append(
                SampleRecord(static_cast<const MetaObj::MetaStruct&>(*list.GetElementTemplate()), hints, variant + i));
        } else {
            sample->Append(kSampleText);
        }
    }
    return sample;
}

// The record types of a template, each with the fields known for it: those
// the template declares and those its "fields:" hint names; `declaring`
// collects the types whose template declares fields itself.
void KnownFields(const MetaObjectPtr& templ, const AutoCli::FormatHints& hints,
                 std::map<std::string, std::set<std::string>>& types, std::set<std::string>& declaring) {
    if (!templ) return;
    if (templ->GetType() == MetaObj::META_LIST) {
        KnownFields(static_cast<const MetaObj::MetaList&>(*templ).GetElementTemplate(), hints, types, declaring);
    } else if (templ->GetType() == MetaObj::META_STRUCT) {
        const auto& record = static_cast<const MetaObj::MetaStruct&>(*templ);
        auto& fields = types[record.GetTypeName()];
        for (const auto& field : record.GetFields()) {
            fields.insert(field.first);
            KnownFields(field.second, hints, types, declaring);
        }
        if (!record.GetFields().empty()) declaring.insert(record.GetTypeName());
        if (const auto& named = hints.Fields(record.GetTypeName())) fields.insert(named->begin(), named->end());
    }
}

// The field names a hint refers to, for a record type whose fields are
// known: a misspelt one would be ignored by the formatters, showing a field
// without its unit or a header with a raw placeholder. Hints for record
// types the template does not show cannot be checked here (some commands
// keep such hints as their descriptions give them).
void ExpectHintsNameKnownFields(const std::string& path, const std::map<std::string, std::string>& hints,
                                const std::map<std::string, std::set<std::string>>& types,
                                const std::set<std::string>& declaring) {
    const auto hasDeclaredFields = [&](const std::string& type) { return declaring.count(type) > 0; };
    static const std::regex placeholder("%([^%]+)%");
    for (const auto& [key, value] : hints) {
        const std::size_t colon = key.find(':');
        const std::string kind = key.substr(0, colon);
        std::string type = colon == std::string::npos ? "" : key.substr(colon + 1);
        std::vector<std::string> named;
        if (kind == "header") {
            for (std::sregex_iterator m(value.begin(), value.end(), placeholder), end; m != end; ++m) {
                named.push_back((*m)[1]);
            }
        } else if (kind == "table-columns") {
            named = AutoCli::SplitNames(value);
        } else if (kind == "units") {
            const std::size_t dot = type.find('.');
            named.push_back(type.substr(dot + 1));
            type = type.substr(0, dot);
        } else {
            EXPECT_EQ(kind, "fields") << path << ": unknown formatter hint " << key;
            continue;
        }
        const auto known = types.find(type);
        if (known == types.end() || known->second.empty()) continue;
        // A header may name a field the list of shown fields leaves out (it
        // is shown in the header instead); with a template that declares no
        // fields of its own, such a name cannot be checked.
        if (kind == "header" && !hasDeclaredFields(type)) continue;
        for (const auto& field : named) {
            EXPECT_TRUE(known->second.count(field)) << path << ": hint " << key << " names no field '" << field << "'";
        }
    }
}

class TreeSweep : public ::testing::Test {
protected:
    void SetUp() override {
        root = AutoCli::Namespace::New();
        AutoCli_RegisterNamespaces(root);
        Collect(Node{{}, root}, nodes);
    }
    std::vector<Node> Leaves() const {
        std::vector<Node> leaves;
        for (const auto& n : nodes) {
            if (n.node->AsCommand()) leaves.push_back(n);
        }
        return leaves;
    }
    boost::shared_ptr<AutoCli::Namespace> root;
    std::vector<Node> nodes;
};

TEST_F(TreeSweep, EveryHelpRendersWithItsEnumsExpanded) {
    ASSERT_GT(Leaves().size(), 0u);
    for (const auto& n : nodes) {
        std::vector<std::string> args = n.words;
        args.push_back("--help");
        std::ostringstream out, err;
        EXPECT_EQ(AutoCli::Run(root, args, out, err), AutoCli::kExitOk) << n.Path() << ": " << err.str();
        EXPECT_EQ(out.str().rfind("Usage: orvixcli" + (n.words.empty() ? "" : " " + n.Path()), 0), 0u) << n.Path();
        EXPECT_EQ(out.str().find("%ENUM%"), std::string::npos) << n.Path();
        EXPECT_EQ(out.str().find("%FULLENUM%"), std::string::npos) << n.Path();
        EXPECT_TRUE(n.words.empty() || !n.node->GetDescription().empty()) << n.Path();

        AutoCli::Command* command = n.node->AsCommand();
        if (!command) continue;
        // AddParameter refuses a long or short name taken already, so
        // building the declaration checks that both are unique.
        boost::shared_ptr<CallSpec::InputSpec> declared;
        ASSERT_NO_THROW(declared = command->GetInputSpec()) << n.Path();
        for (const auto& p : declared->GetParameters()) {
            const std::string where = n.Path() + " --" + p->GetName();
            EXPECT_FALSE(p->GetDescription().empty()) << where;
            EXPECT_NE(out.str().find("--" + p->GetName()), std::string::npos) << where;
            // An enum placeholder without enum values would expand to nothing.
            const std::string& text = p->GetDescription();
            if (text.find("%ENUM%") != std::string::npos || text.find("%FULLENUM%") != std::string::npos) {
                const auto& c = p->GetConstraint();
                ASSERT_TRUE(c) << where;
                EXPECT_TRUE((c->GetType() == CallSpec::CONSTRAINT_STRING_ENUM && !c->GetStringEnum().empty()) ||
                            (c->GetType() == CallSpec::CONSTRAINT_INT_ENUM && !c->GetIntEnum().empty()))
                    << where;
            }
        }
    }
}

TEST_F(TreeSweep, EveryOutputTemplateRendersInEveryFormatter) {
    for (const auto& leaf : Leaves()) {
        const std::string path = leaf.Path();
        AutoCli::Command& command = *leaf.node->AsCommand();
        boost::shared_ptr<CallSpec::OutputSpec> outputSpec = command.GetOutputSpec();
        ASSERT_TRUE(outputSpec && outputSpec->GetTemplate()) << path;
        const MetaObjectPtr& templ = outputSpec->GetTemplate();

        // A fetcher answers with a record or a list; a changing command
        // ("operation", "operator" or no type at all) with true or false.
        const std::string type = command.GetMetaDataField("type");
        EXPECT_TRUE(type == "fetcher" || type == "operation" || type == "operator" || type.empty()) << path;
        if (type == "fetcher") {
            EXPECT_TRUE(templ->GetType() == MetaObj::META_STRUCT || templ->GetType() == MetaObj::META_LIST) << path;
        } else {
            EXPECT_EQ(templ->GetType(), MetaObj::META_BOOL) << path;
        }
        if (templ->GetType() == MetaObj::META_LIST) {
            const auto& list = static_cast<const MetaObj::MetaList&>(*templ);
            ASSERT_TRUE(list.GetElementType() == MetaObj::META_STRING || list.GetElementTemplate())
                << path << ": a list of records names its record type by an element template";
        }
        const std::string& defaultFormatter = command.GetDefaultOutputFormatter();
        EXPECT_TRUE(defaultFormatter.empty() || AutoCli::FindFormatter(defaultFormatter)) << path;

        const AutoCli::FormatHints hints(command.GetDefaultOutputParameters());
        std::map<std::string, std::set<std::string>> types;
        std::set<std::string> declaring;
        KnownFields(templ, hints, types, declaring);
        ExpectHintsNameKnownFields(path, command.GetDefaultOutputParameters(), types, declaring);

        for (int variant = 0; variant < 4; ++variant) {
            const MetaObjectPtr sample = Sample(templ, hints, variant);
            for (const auto& name : AutoCli::FormatterNames()) {
                std::ostringstream out;
                ASSERT_NO_THROW(AutoCli::FindFormatter(name)->Render(sample, hints, out)) << path << " " << name;
                const bool valid = name == "json"  ? OrvixTest::IsValidJson(out.str())
                                   : name == "xml" ? OrvixTest::IsWellFormedXml(out.str())
                                                   : true;
                EXPECT_TRUE(valid) << path << " " << name << "\n" << out.str();
            }
        }
    }
}

}  // namespace
