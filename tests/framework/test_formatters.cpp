// The six output formatters, compared on complete rendered text.
#include <cstdint>
#include <limits>
#include <map>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "framework/Format.h"
#include "framework/MetaObj.h"
#include "support/documents.h"

namespace {

using AutoCli::FindFormatter;
using AutoCli::FormatHints;
using AutoCli::FormatterNames;
using MetaObj::MetaBool;
using MetaObj::MetaInt;
using MetaObj::MetaList;
using MetaObj::MetaObjectPtr;
using MetaObj::MetaString;
using MetaObj::MetaStruct;
using Hints = std::map<std::string, std::string>;
using StructPtr = boost::shared_ptr<MetaStruct>;

std::string Render(const std::string& formatter, const MetaObjectPtr& result, const Hints& hints = {}) {
    const AutoCli::Formatter* f = FindFormatter(formatter);
    if (!f) throw std::invalid_argument("no formatter " + formatter);
    std::ostringstream out;
    f->Render(result, FormatHints(hints), out);
    return out.str();
}

StructPtr Beacon(bool enabled) {
    StructPtr beacon = MetaStruct::New("BeaconConfig");
    beacon->SetField("Enabled", enabled);
    beacon->SetField("Interval", 1);
    return beacon;
}

StructPtr Switch(const std::string& name, int ports, const std::vector<std::string>& uplinks) {
    StructPtr s = MetaStruct::New("VirtualSwitch");
    s->SetField("Name", name);
    s->SetField("Num Ports", ports);
    s->SetField("Uplinks", uplinks);
    return s;
}

// A switch with every kind of field: scalars, string lists (one empty), a
// nested record, a list of records, and a template that must stay hidden.
StructPtr RichSwitch() {
    StructPtr s = Switch("vSwitch0", 128, {"hwnic0", "hwnic1"});
    s->SetField("MTU", 1500);
    s->SetField("Comment", "");
    s->SetField("Portgroups", std::vector<std::string>{});
    s->SetField("Notes", MetaString::New());
    s->SetField("Beacon", Beacon(false));
    boost::shared_ptr<MetaList> ports = MetaList::New(MetaObj::META_STRUCT, MetaStruct::New("Port"));
    StructPtr first = MetaStruct::New("Port");
    first->SetField("ID", 1);
    first->SetField("Client", "vm1");
    StructPtr second = MetaStruct::New("Port");
    second->SetField("ID", 2);
    ports->Append(first);
    ports->Append(second);
    s->SetField("Ports", ports);
    return s;
}

boost::shared_ptr<MetaList> SwitchList(const std::vector<StructPtr>& switches) {
    boost::shared_ptr<MetaList> list = MetaList::New(MetaObj::META_STRUCT, MetaStruct::New("VirtualSwitch"));
    for (const auto& s : switches) list->Append(s);
    return list;
}

boost::shared_ptr<MetaList> Strings(const std::vector<std::string>& items) {
    boost::shared_ptr<MetaList> list = MetaList::New(MetaObj::META_STRING);
    for (const auto& item : items) list->Append(item);
    return list;
}

TEST(Formatters, AbsentValuesPrintNothingAnywhere) {
    for (const auto& name : FormatterNames()) {
        for (const MetaObjectPtr& empty : {MetaObjectPtr(), MetaObjectPtr(MetaBool::New()),
                                           MetaObjectPtr(MetaString::New()), MetaObjectPtr(MetaInt::New())}) {
            EXPECT_EQ(Render(name, empty), "") << name;
        }
        // A template field, and a template element of a list, read as if
        // they had never been set.
        StructPtr withTemplate = Switch("vSwitch0", 8, {"hwnic0"});
        withTemplate->SetField("Notes", MetaString::New());
        withTemplate->SetField("Count", MetaInt::New());
        boost::shared_ptr<MetaList> strings = Strings({"a"});
        strings->Append(MetaString::New());
        strings->Append("b");
        EXPECT_EQ(Render(name, withTemplate), Render(name, Switch("vSwitch0", 8, {"hwnic0"}))) << name;
        EXPECT_EQ(Render(name, strings), Render(name, Strings({"a", "b"}))) << name;
    }
}

TEST(Formatters, HintsForOtherTypesAndFieldsAreIgnored) {
    Hints unrelated{{"fields:Nope", "Name"},          {"header:Nope", "Nope %Name%"},
                    {"table-columns:Nope", "Name"},   {"units:Nope.Num Ports", "ports"},
                    {"units:VirtualSwitch.Zzz", "x"}, {"fields:VirtualSwitch", "Ghost, Name"}};
    MetaObjectPtr list = SwitchList({RichSwitch(), Switch("vSwitch1", 8, {})});
    for (const auto& name : FormatterNames()) {
        EXPECT_EQ(Render(name, list, unrelated), Render(name, list)) << name;
    }
}

TEST(SimpleFormatter, RecordWithHeaderUnitsListsAndNesting) {
    Hints hints{{"header:VirtualSwitch", "Switch %Name% (%Num Ports% ports, %Missing%) 100% %MTU%"},
                {"units:VirtualSwitch.MTU", "bytes"},
                {"units:BeaconConfig.Interval", "sec"},
                {"header:BeaconConfig", "Beacon every %Interval%"},
                {"header:Port", "<NONE>"}};
    EXPECT_EQ(Render("simple", RichSwitch(), hints),
              "Switch vSwitch0 (128 ports, %Missing%) 100% 1500 bytes\n"
              "   Name: vSwitch0\n"
              "   Num Ports: 128\n"
              "   Uplinks: hwnic0, hwnic1\n"
              "   MTU: 1500 bytes\n"
              "   Comment: \n"
              "   Portgroups: \n"
              "   Beacon:\n"
              "      Beacon every 1 sec\n"
              "      Enabled: false\n"
              "      Interval: 1 sec\n"
              "   Ports:\n"
              "      ID: 1\n"
              "      Client: vm1\n"
              "\n"
              "      ID: 2\n");
}

TEST(SimpleFormatter, FieldsHintOrdersAndFilters) {
    StructPtr s = RichSwitch();
    EXPECT_EQ(Render("simple", s, {{"fields:VirtualSwitch", "Uplinks,Ghost,Name,Uplinks"}}),
              "   Uplinks: hwnic0, hwnic1\n"
              "   Name: vSwitch0\n");
    // A hint naming none of the fields (here only because of a stray blank)
    // is no reason to print an empty record.
    EXPECT_EQ(Render("simple", s, {{"fields:VirtualSwitch", "Name ,Ghost"}}), Render("simple", s));
    EXPECT_EQ(Render("simple", s, {{"fields:BeaconConfig", "Interval"}, {"fields:VirtualSwitch", "Beacon"}}),
              "   Beacon:\n"
              "      Interval: 1\n");
}

TEST(SimpleFormatter, ScalarsAndStringListsAtTopLevel) {
    EXPECT_EQ(Render("simple", Strings({"hwnic0", "hwnic1"})), "hwnic0\nhwnic1\n");
    EXPECT_EQ(Render("simple", Strings({})), "");
    // A successful operation prints nothing; anything else is printed.
    EXPECT_EQ(Render("simple", MetaBool::New(true)), "");
    EXPECT_EQ(Render("simple", MetaBool::New(false)), "false\n");
    EXPECT_EQ(Render("simple", MetaString::New("done")), "done\n");
    EXPECT_EQ(Render("simple", MetaInt::NewUnsigned(std::numeric_limits<std::uint64_t>::max())),
              "18446744073709551615\n");
    EXPECT_EQ(Render("simple", MetaInt::New(-5)), "-5\n");
}

TEST(TableFormatter, ColumnsWidthsAndCells) {
    StructPtr first = Switch("vSwitch0", 128, {"hwnic0", "hwnic1"});
    first->SetField("MTU", 1500);
    StructPtr second = Switch("Zürich-10", 8, {});
    second->SetField("Beacon", Beacon(true));
    Hints units{{"units:VirtualSwitch.MTU", "bytes"}, {"units:BeaconConfig.Interval", "sec"}};
    // Widths count characters, not bytes; empty trailing cells leave no
    // blanks behind.
    EXPECT_EQ(Render("table", SwitchList({first, second}), units),
              "Name       Num Ports  Uplinks         MTU         Beacon\n"
              "---------  ---------  --------------  ----------  --------------------------------\n"
              "vSwitch0   128        hwnic0, hwnic1  1500 bytes\n"
              "Zürich-10  8                                      {Enabled: true, Interval: 1 sec}\n");

    // A record list as a cell, and a single record as a one-row table.
    EXPECT_EQ(Render("table", RichSwitch(), {{"fields:VirtualSwitch", "Name,Ports"}}),
              "Name      Ports\n"
              "--------  -----------------------------\n"
              "vSwitch0  {ID: 1, Client: vm1}, {ID: 2}\n");
}

TEST(TableFormatter, ColumnHints) {
    MetaObjectPtr list = SwitchList({Switch("vSwitch0", 128, {"hwnic0"}), Switch("vSwitch1", 8, {})});
    const std::string byColumns =
        "Uplinks  Name      Ghost\n"
        "-------  --------  -----\n"
        "hwnic0   vSwitch0\n"
        "         vSwitch1\n";
    EXPECT_EQ(Render("table", list, {{"table-columns:VirtualSwitch", "Uplinks,Name,Ghost"}}), byColumns);
    // The type's own list beats the general one, which beats "fields:".
    EXPECT_EQ(Render("table", list,
                     {{"table-columns:VirtualSwitch", "Uplinks,Name,Ghost"},
                      {"table-columns", "Num Ports"},
                      {"fields:VirtualSwitch", "Name"}}),
              byColumns);
    EXPECT_EQ(Render("table", list, {{"table-columns", "Num Ports"}, {"fields:VirtualSwitch", "Name"}}),
              "Num Ports\n"
              "---------\n"
              "128\n"
              "8\n");
    EXPECT_EQ(Render("table", list, {{"table-columns:VirtualSwitch", ""}, {"fields:VirtualSwitch", "Name"}}),
              "Name\n"
              "--------\n"
              "vSwitch0\n"
              "vSwitch1\n");
    EXPECT_EQ(Render("table", list, {{"table-columns", "Ghost,Ghoul"}}), Render("table", list));
}

TEST(TableFormatter, EmptyListsAndNonRecords) {
    StructPtr shape = MetaStruct::New("VirtualSwitch");
    shape->SetField("Name", MetaString::New());
    shape->SetField("Num Ports", MetaInt::New());
    boost::shared_ptr<MetaList> shaped = MetaList::New(MetaObj::META_STRUCT, shape);
    EXPECT_EQ(Render("table", shaped), "Name  Num Ports\n----  ---------\n");
    EXPECT_EQ(Render("csv", shaped), "Name,Num Ports\n");
    EXPECT_EQ(Render("table", SwitchList({}), {{"fields:VirtualSwitch", "Name,MTU"}}), "Name  MTU\n----  ---\n");
    EXPECT_EQ(Render("csv", SwitchList({}), {{"table-columns", "Name,MTU"}}), "Name,MTU\n");
    for (const char* name : {"table", "csv"}) {
        EXPECT_EQ(Render(name, SwitchList({})), "") << name;
        EXPECT_EQ(Render(name, MetaList::New(MetaObj::META_STRUCT), {{"table-columns:VirtualSwitch", "Name"}}), "")
            << name;
    }
    EXPECT_EQ(Render("table", Strings({"a", "b"})), "a\nb\n");
    EXPECT_EQ(Render("table", MetaInt::New(42)), "42\n");
    EXPECT_EQ(Render("table", MetaBool::New(true)), "");
}

TEST(CsvFormatter, QuotingAndCells) {
    StructPtr odd = MetaStruct::New("VirtualSwitch");
    odd->SetField("Name", "a,b");
    odd->SetField("Desc", "say \"hi\"");
    odd->SetField("Notes", "line1\nline2\r");
    odd->SetField("Uplinks", std::vector<std::string>{"x", "y"});
    odd->SetField("MTU", 1500);
    odd->SetField("Beacon", Beacon(true));
    StructPtr plain = MetaStruct::New("VirtualSwitch");
    plain->SetField("Name", "vSwitch1");
    plain->SetField("Uplinks", std::vector<std::string>{"x"});
    plain->SetField("Big", std::numeric_limits<unsigned long long>::max());
    EXPECT_EQ(Render("csv", SwitchList({odd, plain}), {{"units:VirtualSwitch.MTU", "bytes"}}),
              "Name,Desc,Notes,Uplinks,MTU,Beacon,Big\n"
              "\"a,b\",\"say \"\"hi\"\"\",\"line1\nline2\r\",\"x,y\",1500,\"{Enabled: true, Interval: 1}\",\n"
              "vSwitch1,,,x,,,18446744073709551615\n");
    EXPECT_EQ(Render("csv", plain, {{"fields:VirtualSwitch", "Uplinks,Name"}}), "Uplinks,Name\nx,vSwitch1\n");
    EXPECT_EQ(Render("csv", Strings({"plain", "with,comma", ""})), "plain\n\"with,comma\"\n\n");
    EXPECT_EQ(Render("csv", MetaBool::New(true)), "true\n");
    EXPECT_EQ(Render("csv", MetaString::New("\"")), "\"\"\"\"\n");
}

TEST(JsonFormatter, StructureOrderAndNumbers) {
    StructPtr s = RichSwitch();
    s->SetField("Big", std::numeric_limits<unsigned long long>::max());
    s->SetField("Negative", -5);
    const std::string json =
        Render("json", s, {{"fields:VirtualSwitch", "Uplinks,Name"}, {"units:VirtualSwitch.MTU", "bytes"}});
    EXPECT_EQ(json,
              "{\n"
              "  \"Uplinks\": [\n"
              "    \"hwnic0\",\n"
              "    \"hwnic1\"\n"
              "  ],\n"
              "  \"Name\": \"vSwitch0\",\n"
              "  \"Num Ports\": 128,\n"
              "  \"MTU\": 1500,\n"
              "  \"Comment\": \"\",\n"
              "  \"Portgroups\": [],\n"
              "  \"Beacon\": {\n"
              "    \"Enabled\": false,\n"
              "    \"Interval\": 1\n"
              "  },\n"
              "  \"Ports\": [\n"
              "    {\n"
              "      \"ID\": 1,\n"
              "      \"Client\": \"vm1\"\n"
              "    },\n"
              "    {\n"
              "      \"ID\": 2\n"
              "    }\n"
              "  ],\n"
              "  \"Big\": 18446744073709551615,\n"
              "  \"Negative\": -5\n"
              "}\n");
    EXPECT_TRUE(OrvixTest::IsValidJson(json));
    EXPECT_EQ(Render("json", SwitchList({})), "[]\n");
    EXPECT_EQ(Render("json", MetaStruct::New("Empty")), "{}\n");
    EXPECT_EQ(Render("json", Strings({"a"})), "[\n  \"a\"\n]\n");
    EXPECT_EQ(Render("json", MetaBool::New(true)), "true\n");
    EXPECT_EQ(Render("json", MetaInt::New(7)), "7\n");
}

TEST(JsonFormatter, EscapingKeepsOutputValid) {
    const std::string nasty = std::string("q\"b\\s/\n\t\r\b\f\x01\x1f\x7f") + "é€😀\xEF\xBF\xBD" + "\xFF" + "\xC3" +
                              "\xED\xA0\x80" + "\xC0\xAF" + "\xF4\x90\x80\x80" + "end\xE2\x82";
    StructPtr record = MetaStruct::New("T");
    record->SetField("Key \"1\"\n", nasty);
    const std::string json = Render("json", record);
    EXPECT_EQ(json,
              "{\n  \"Key \\\"1\\\"\\n\": \"q\\\"b\\\\s/\\n\\t\\r\\b\\f\\u0001\\u001f\x7f"
              "é€😀\xEF\xBF\xBD"
              "\\ufffd\\ufffd\\ufffd\\ufffd\\ufffd\\ufffd\\ufffd\\ufffd\\ufffd\\ufffd\\ufffd"
              "end\\ufffd\\ufffd\"\n}\n");
    EXPECT_TRUE(OrvixTest::IsValidJson(json));
    for (const MetaObjectPtr& value : {MetaObjectPtr(RichSwitch()), MetaObjectPtr(Strings({nasty, ""})),
                                       MetaObjectPtr(SwitchList({RichSwitch(), Switch("x", 1, {})}))}) {
        EXPECT_TRUE(OrvixTest::IsValidJson(Render("json", value)));
    }
}

TEST(XmlFormatter, StructureOfRecordsListsAndScalars) {
    StructPtr s = RichSwitch();
    s->SetField("Big", std::numeric_limits<unsigned long long>::max());
    EXPECT_EQ(
        Render("xml", SwitchList({s}), {{"fields:VirtualSwitch", "Ports,Name"}, {"units:VirtualSwitch.MTU", "b"}}),
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
        "<output>\n"
        "  <list type=\"structure\">\n"
        "    <structure typeName=\"VirtualSwitch\">\n"
        "      <field name=\"Ports\">\n"
        "        <list type=\"structure\">\n"
        "          <structure typeName=\"Port\">\n"
        "            <field name=\"ID\"><integer>1</integer></field>\n"
        "            <field name=\"Client\"><string>vm1</string></field>\n"
        "          </structure>\n"
        "          <structure typeName=\"Port\">\n"
        "            <field name=\"ID\"><integer>2</integer></field>\n"
        "          </structure>\n"
        "        </list>\n"
        "      </field>\n"
        "      <field name=\"Name\"><string>vSwitch0</string></field>\n"
        "      <field name=\"Num Ports\"><integer>128</integer></field>\n"
        "      <field name=\"Uplinks\"><list type=\"string\"><string>hwnic0</string>"
        "<string>hwnic1</string></list></field>\n"
        "      <field name=\"MTU\"><integer>1500</integer></field>\n"
        "      <field name=\"Comment\"><string></string></field>\n"
        "      <field name=\"Portgroups\"><list type=\"string\"></list></field>\n"
        "      <field name=\"Beacon\">\n"
        "        <structure typeName=\"BeaconConfig\">\n"
        "          <field name=\"Enabled\"><boolean>false</boolean></field>\n"
        "          <field name=\"Interval\"><integer>1</integer></field>\n"
        "        </structure>\n"
        "      </field>\n"
        "      <field name=\"Big\"><integer>18446744073709551615</integer></field>\n"
        "    </structure>\n"
        "  </list>\n"
        "</output>\n");
    const std::string prolog = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<output>\n";
    EXPECT_EQ(
        Render("xml", Strings({"a", "b"})),
        prolog + "  <list type=\"string\">\n    <string>a</string>\n    <string>b</string>\n  </list>\n</output>\n");
    EXPECT_EQ(Render("xml", SwitchList({})), prolog + "  <list type=\"structure\"></list>\n</output>\n");
    EXPECT_EQ(Render("xml", MetaBool::New(true)), prolog + "  <boolean>true</boolean>\n</output>\n");
}

TEST(XmlFormatter, EscapesAndDropsWhatXmlCannotHold) {
    StructPtr record = MetaStruct::New("A&B");
    record->SetField("Say \"hi\"\t<x>", std::string("<a & 'b'>\x01\x1b\r\n\t\xFF ok \xEF\xBF\xBE."));
    EXPECT_EQ(Render("xml", record),
              "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
              "<output>\n"
              "  <structure typeName=\"A&amp;B\">\n"
              "    <field name=\"Say &quot;hi&quot;&#9;&lt;x&gt;\">"
              "<string>&lt;a &amp; &apos;b&apos;&gt;&#13;\n\t\xEF\xBF\xBD ok .</string></field>\n"
              "  </structure>\n"
              "</output>\n");
}

TEST(KeyValueFormatter, KeysSpellThePath) {
    StructPtr s = RichSwitch();
    s->SetField("Big", std::numeric_limits<unsigned long long>::max());
    s->SetField("Path", "C:\\dir\nnext\rend");
    EXPECT_EQ(Render("keyvalue", s, {{"fields:VirtualSwitch", "Beacon"}, {"units:VirtualSwitch.MTU", "bytes"}}),
              "VirtualSwitch.Beacon.Enabled=false\n"
              "VirtualSwitch.Beacon.Interval=1\n"
              "VirtualSwitch.Name=vSwitch0\n"
              "VirtualSwitch.Num Ports=128\n"
              "VirtualSwitch.Uplinks[0]=hwnic0\n"
              "VirtualSwitch.Uplinks[1]=hwnic1\n"
              "VirtualSwitch.MTU=1500\n"
              "VirtualSwitch.Comment=\n"
              // A set but empty list keeps its key.
              "VirtualSwitch.Portgroups=\n"
              "VirtualSwitch.Ports[0].ID=1\n"
              "VirtualSwitch.Ports[0].Client=vm1\n"
              "VirtualSwitch.Ports[1].ID=2\n"
              "VirtualSwitch.Big=18446744073709551615\n"
              "VirtualSwitch.Path=C:\\\\dir\\nnext\\rend\n");
    EXPECT_EQ(Render("keyvalue", SwitchList({Switch("a", 1, {}), Switch("b", 2, {"x"})})),
              "VirtualSwitch[0].Name=a\n"
              "VirtualSwitch[0].Num Ports=1\n"
              "VirtualSwitch[0].Uplinks=\n"
              "VirtualSwitch[1].Name=b\n"
              "VirtualSwitch[1].Num Ports=2\n"
              "VirtualSwitch[1].Uplinks[0]=x\n");
    EXPECT_EQ(Render("keyvalue", Strings({"a", "b"})), "[0]=a\n[1]=b\n");
    EXPECT_EQ(Render("keyvalue", MetaBool::New(true)), "value=true\n");
    EXPECT_EQ(Render("keyvalue", SwitchList({})), "");
}

// A name with an escape sequence, a bell, a tab, a C1 control character
// (U+009B), a stray byte before a real letter, and a backslash.
TEST(Formatters, HumanFormatsEscapeControlCharactersMachineFormatsKeepThem) {
    const std::string name =
        "red\x1b[31m\x07\tc\xc2\x9b"
        "2J\xc3\xc3\xa9\\";
    const std::string shown = "red\\x1b[31m\\x07\\x09c\\u009b2J\\xc3\xc3\xa9\\";
    StructPtr s = Switch(name, 8, {"up\x1b", "ok"});
    EXPECT_EQ(Render("simple", s, {{"header:VirtualSwitch", "Switch %Name%"}}),
              "Switch " + shown + "\n   Name: " + shown + "\n   Num Ports: 8\n   Uplinks: up\\x1b, ok\n");
    EXPECT_EQ(Render("simple", Strings({name})), shown + "\n");
    // Columns are as wide as what is shown.
    EXPECT_EQ(Render("table", SwitchList({s, Switch("b", 1, {})})),
              "Name                                Num Ports  Uplinks\n"
              "----------------------------------  ---------  ----------\n" +
                  shown + "  8          up\\x1b, ok\n" + "b                                   1\n");
    // Key-value lines keep their own escapes for line breaks and backslashes.
    s->SetField("Path", "C:\\dir\n\x1b");
    EXPECT_EQ(Render("keyvalue", s),
              "VirtualSwitch.Name=red\\x1b[31m\\x07\\x09c\\u009b2J\\xc3\xc3\xa9\\\\\n"
              "VirtualSwitch.Num Ports=8\n"
              "VirtualSwitch.Uplinks[0]=up\\x1b\n"
              "VirtualSwitch.Uplinks[1]=ok\n"
              "VirtualSwitch.Path=C:\\\\dir\\n\\x1b\n");
    EXPECT_EQ(Render("csv", Switch(name, 8, {})), "Name,Num Ports,Uplinks\n" + name + ",8,\n");
}

// Values handed over (moved) and values copied end up the same; a field set
// again keeps its place; the checks hold on either path.
TEST(MetaValues, MovedAndCopiedValuesAreTheSame) {
    std::string name = "vSwitch0";
    std::vector<std::string> uplinks = {"hwnic0", "hwnic1", "a name longer than any short string buffer"};
    StructPtr copied = MetaStruct::New("VirtualSwitch");
    copied->SetField("Name", name);
    copied->SetField("Uplinks", uplinks);
    copied->SetField("Beacon", MetaObjectPtr(Beacon(true)));
    StructPtr moved = MetaStruct::New("VirtualSwitch");
    moved->SetField("Name", std::string(name));
    moved->SetField("Uplinks", std::vector<std::string>(uplinks));
    moved->SetField("Beacon", Beacon(true));
    for (const auto& formatter : FormatterNames()) {
        EXPECT_EQ(Render(formatter, moved), Render(formatter, copied)) << formatter;
    }

    moved->SetField("Name", std::string("vSwitch1"));
    moved->SetField("Uplinks", std::vector<std::string>{});
    ASSERT_EQ(moved->GetFields().size(), 3u);
    EXPECT_EQ(moved->GetFields()[0].first, "Name");
    EXPECT_EQ(Render("simple", moved, {{"fields:VirtualSwitch", "Name,Uplinks"}}), "   Name: vSwitch1\n   Uplinks: \n");
    EXPECT_THROW(moved->SetField("Name", MetaObjectPtr()), std::invalid_argument);

    boost::shared_ptr<MetaList> names = MetaList::New(MetaObj::META_STRING);
    names->Reserve(4);
    EXPECT_EQ(names->Size(), 0u);
    EXPECT_THROW(names->Append(MetaStruct::New("VirtualSwitch")), std::invalid_argument);
    names->Append(std::string("a"));
    EXPECT_EQ(names->Size(), 1u);
}

TEST(Formatters, IntegersAtBothEndsOfTheirRange) {
    StructPtr s = MetaStruct::New("Counters");
    s->SetField("Lowest", std::numeric_limits<long long>::min());
    s->SetField("Highest", std::numeric_limits<long long>::max());
    s->SetField("Zero", 0);
    EXPECT_EQ(Render("table", s),
              "Lowest                Highest              Zero\n"
              "--------------------  -------------------  ----\n"
              "-9223372036854775808  9223372036854775807  0\n");
}

// Records of one list with their fields in other orders, or some missing:
// the table has a column for every field any record has, in the order first
// met, and blanks where a record has none.
TEST(TableFormatter, RecordsWithDifferentFields) {
    boost::shared_ptr<MetaList> list = MetaList::New(MetaObj::META_STRUCT, MetaStruct::New("Row"));
    StructPtr first = MetaStruct::New("Row");
    first->SetField("A", "a1");
    first->SetField("B", "b1");
    StructPtr second = MetaStruct::New("Row");
    second->SetField("C", "c2");
    second->SetField("A", "a2");
    StructPtr third = MetaStruct::New("Row");
    third->SetField("B", "b3");
    third->SetField("D", MetaString::New());
    for (const StructPtr& row : {first, second, third}) list->Append(row);
    EXPECT_EQ(Render("table", list),
              "A   B   C\n"
              "--  --  --\n"
              "a1  b1\n"
              "a2      c2\n"
              "    b3\n");
    EXPECT_EQ(Render("csv", list), "A,B,C\na1,b1,\na2,,c2\n,b3,\n");
}

}  // namespace

namespace {

TEST(MetaValues, StringsOfASizedRecordOutliveItAndOverflowItsBlock) {
    // Two strings fit the record's block; the third gets one of its own, and
    // a field set again keeps its place with the new value.
    StructPtr sized = MetaStruct::New("Route", 2);
    sized->SetField("Network", std::string("192.0.2.0"));
    sized->SetField("Gateway", "198.51.100.1");
    sized->SetField("Interface", std::string("a name longer than any short string buffer"));
    sized->SetField("Gateway", std::string("198.51.100.2"));
    StructPtr plain = MetaStruct::New("Route");
    plain->SetField("Network", "192.0.2.0");
    plain->SetField("Gateway", "198.51.100.2");
    plain->SetField("Interface", "a name longer than any short string buffer");
    for (const auto& formatter : FormatterNames()) {
        EXPECT_EQ(Render(formatter, sized), Render(formatter, plain)) << formatter;
    }

    // A field's value taken out of the record stays valid after the record
    // and every other reference to the block are gone.
    MetaObjectPtr network = sized->GetField("Network");
    MetaObjectPtr interfaceName = sized->GetField("Interface");
    sized.reset();
    ASSERT_EQ(network->GetType(), MetaObj::META_STRING);
    EXPECT_EQ(boost::static_pointer_cast<MetaObj::MetaString>(network)->GetValue(), "192.0.2.0");
    EXPECT_EQ(boost::static_pointer_cast<MetaObj::MetaString>(interfaceName)->GetValue(),
              "a name longer than any short string buffer");
}

}  // namespace
