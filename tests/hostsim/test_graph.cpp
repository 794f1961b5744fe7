// orvix-hostsim graph as Graphviz draws it: every object of a host appears
// under its own name, joined to what it belongs to, and any name the store
// allows is drawn exactly as a terminal would show it, without a warning.
#include <expat.h>
#include <gtest/gtest.h>

#include <map>
#include <set>
#include <string>
#include <vector>

#include "hoststore/HostStore.h"
#include "orvixtext/Utf8.h"
#include "support/process.h"
#include "support/test_util.h"

namespace {

using Json = PldCtl::Store::Json;
using OrvixTest::RunProcess;

// What an SVG drawing shows: each node's lines of text by node id, and the
// edges between node ids.
struct Drawing {
    std::string dot;
    std::map<std::string, std::vector<std::string>> nodes;
    std::set<std::pair<std::string, std::string>> edges;

    // The ids of the nodes whose first line is `name` as shown.
    std::vector<std::string> Named(const std::string& name) const {
        std::vector<std::string> ids;
        for (const auto& [id, lines] : nodes) {
            if (!lines.empty() && lines.front() == Orvix::Text::EscapeControls(name)) ids.push_back(id);
        }
        return ids;
    }
    bool Linked(const std::string& a, const std::string& b) const {
        for (const std::string& from : Named(a)) {
            for (const std::string& to : Named(b)) {
                if (edges.count({from, to}) || edges.count({to, from})) return true;
            }
        }
        return false;
    }
    // True when the node named `name` has a line starting with `prefix`.
    bool Shows(const std::string& name, const std::string& prefix) const {
        for (const std::string& id : Named(name)) {
            for (const std::string& line : nodes.at(id)) {
                if (line.rfind(prefix, 0) == 0) return true;
            }
        }
        return false;
    }
};

// Collects the <title> and <text> of each node and edge group of an SVG
// drawing made by dot.
class SvgReader {
public:
    explicit SvgReader(Drawing& drawing) : drawing_(drawing) {}

    void Parse(const std::string& svg) {
        XML_Parser parser = XML_ParserCreate("UTF-8");
        XML_SetUserData(parser, this);
        XML_SetElementHandler(parser, &SvgReader::Start, &SvgReader::End);
        XML_SetCharacterDataHandler(parser, &SvgReader::Characters);
        const bool parsed = XML_Parse(parser, svg.data(), static_cast<int>(svg.size()), XML_TRUE) == XML_STATUS_OK;
        const std::string error = parsed ? "" : XML_ErrorString(XML_GetErrorCode(parser));
        XML_ParserFree(parser);
        ASSERT_TRUE(parsed) << "dot wrote SVG that is no XML: " << error;
    }

private:
    static void Start(void* data, const char* name, const char** attributes) {
        auto& self = *static_cast<SvgReader*>(data);
        const std::string element = name;
        if (element == "g") {
            for (int i = 0; attributes[i]; i += 2) {
                if (std::string(attributes[i]) == "class") self.group_ = attributes[i + 1];
            }
            self.title_.clear();
            self.lines_.clear();
        } else if (element == "title" || element == "text") {
            self.collecting_ = element;
            self.chars_.clear();
        }
    }
    static void End(void* data, const char* name) {
        auto& self = *static_cast<SvgReader*>(data);
        const std::string element = name;
        if (element == "title" && self.collecting_ == "title") self.title_ = self.chars_;
        if (element == "text" && self.collecting_ == "text") self.lines_.push_back(Blanks(self.chars_));
        if (element == "title" || element == "text") self.collecting_.clear();
        if (element != "g") return;
        if (self.group_ == "node") {
            self.drawing_.nodes[self.title_] = self.lines_;
        } else if (self.group_ == "edge") {
            const auto dashes = self.title_.find("--");
            if (dashes != std::string::npos) {
                self.drawing_.edges.insert({self.title_.substr(0, dashes), self.title_.substr(dashes + 2)});
            }
        }
        self.group_.clear();
    }
    // dot keeps runs of blanks in SVG, where they would collapse, by writing
    // all but the first as no-break spaces; read them as the blanks they are.
    static std::string Blanks(std::string text) {
        const std::string noBreak = "\u00a0";
        for (auto at = text.find(noBreak); at != std::string::npos; at = text.find(noBreak, at + 1)) {
            text.replace(at, noBreak.size(), " ");
        }
        return text;
    }
    static void Characters(void* data, const char* text, int length) {
        auto& self = *static_cast<SvgReader*>(data);
        if (!self.collecting_.empty()) self.chars_.append(text, static_cast<std::size_t>(length));
    }

    Drawing& drawing_;
    std::string group_, title_, collecting_, chars_;
    std::vector<std::string> lines_;
};

std::vector<std::string> Environment() {
    std::vector<std::string> env = {"PATH=/usr/bin:/bin"};
    for (const auto& setting : OrvixTest::SanitizerEnvironment()) env.push_back(setting);
    return env;
}

// Makes a host from `profile`, writes its graph and has dot draw it; dot
// must take the graph without a word on stderr.
Drawing Draw(const Json& profile) {
    const OrvixTest::TempDir dir;
    OrvixTest::WriteFile(dir / "profile.json", profile.dump());
    const std::vector<std::string> hostsim = {OrvixTest::Bin("orvix-hostsim"), "--db", dir / "host.db"};
    auto run = [&](std::vector<std::string> argv, const std::vector<std::string>& args) {
        argv.insert(argv.end(), args.begin(), args.end());
        return RunProcess(argv, dir.Path(), Environment());
    };
    const auto init = run(hostsim, {"init", "--profile", dir / "profile.json"});
    EXPECT_EQ(init.status, 0) << init.err;
    const auto graph = run(hostsim, {"graph"});
    EXPECT_EQ(graph.status, 0);
    EXPECT_EQ(graph.err, "");
    Drawing drawing;
    drawing.dot = graph.out;
    OrvixTest::WriteFile(dir / "host.dot", graph.out);
    const auto svg = run({"dot", "-Tsvg", dir / "host.dot"}, {});
    EXPECT_EQ(svg.status, 0);
    EXPECT_EQ(svg.err, "") << "dot warned about:\n" << graph.out;
    SvgReader(drawing).Parse(svg.out);
    return drawing;
}

std::string Text(const Json& object, const char* field) {
    return object.value(field, std::string());
}

// Every object the graph draws, joined to its switch, port group, DV port
// or netstack, for any profile.
void ExpectWholeHost(const Json& profile, const Drawing& drawing) {
    auto all = [&](const char* section) { return profile.value(section, Json::array()); };
    for (const Json& nic : all("nics")) EXPECT_EQ(drawing.Named(Text(nic, "name")).size(), 1u) << nic;
    for (const char* section : {"vswitches", "dvswitches"}) {
        for (const Json& vswitch : all(section)) {
            EXPECT_EQ(drawing.Named(Text(vswitch, "name")).size(), 1u) << vswitch;
            for (const Json& nic : vswitch.value("uplinks", Json::array())) {
                EXPECT_TRUE(drawing.Linked(nic.get<std::string>(), Text(vswitch, "name"))) << nic;
            }
        }
    }
    for (const Json& portgroup : all("portgroups")) {
        EXPECT_TRUE(drawing.Linked(Text(portgroup, "name"), Text(portgroup, "vswitch"))) << portgroup;
        EXPECT_TRUE(drawing.Shows(Text(portgroup, "name"), "VLAN " + std::to_string(portgroup.value("vlanId", 0))))
            << portgroup;
    }
    for (const Json& dvport : all("dvports")) {
        EXPECT_TRUE(drawing.Linked("DV port " + Text(dvport, "id"), Text(dvport, "dvswitch"))) << dvport;
    }
    for (const Json& netstack : all("netstacks")) EXPECT_EQ(drawing.Named(Text(netstack, "key")).size(), 1u);
    for (const Json& interface : all("interfaces")) {
        const std::string name = Text(interface, "name");
        EXPECT_TRUE(drawing.Linked(name, Text(interface, "netstack"))) << interface;
        if (!Text(interface, "portgroup").empty()) {
            EXPECT_TRUE(drawing.Linked(name, Text(interface, "portgroup"))) << interface;
        }
        if (!Text(interface, "dvPortId").empty()) {
            EXPECT_TRUE(drawing.Linked(name, "DV port " + Text(interface, "dvPortId"))) << interface;
        }
        if (Text(interface, "ipv4Mode") == "static") {
            EXPECT_TRUE(drawing.Shows(name, Text(interface, "ipv4Address") + "/")) << interface;
        }
        for (const Json& address : interface.value("ipv6Addresses", Json::array())) {
            EXPECT_TRUE(drawing.Shows(name, Text(address, "address"))) << address;
        }
    }
    std::map<std::int64_t, std::string> worlds;
    for (const Json& world : all("worlds")) worlds[world.at("id").get<std::int64_t>()] = Text(world, "name");
    int vmPorts = 0;
    for (const Json& port : all("ports")) {
        if (port.value("type", "vm") != "vm" || Text(port, "client").empty()) continue;
        ++vmPorts;
        const std::string client = Text(port, "client");
        if (!Text(port, "portgroup").empty()) {
            EXPECT_TRUE(drawing.Linked(client, Text(port, "portgroup"))) << port;
        }
        if (!Text(port, "dvPortId").empty()) {
            EXPECT_TRUE(drawing.Linked(client, "DV port " + Text(port, "dvPortId"))) << port;
        }
        const std::string world = worlds[port.value("worldId", 0)];
        if (world.rfind("orvm:", 0) == 0) {
            EXPECT_TRUE(drawing.Shows(client, "VM " + world.substr(5))) << port;
        }
    }
    EXPECT_GT(vmPorts, 0) << "the host has no VM port to look for";
}

TEST(HostsimGraph, DrawsEveryObjectOfTheDefaultHost) {
    const Json profile = PldCtl::Store::ParseProfile(
        OrvixTest::ReadFile(std::string(ORVIX_SOURCE_DIR) + "/profiles/default.json"), "default.json");
    const Drawing drawing = Draw(profile);
    ExpectWholeHost(profile, drawing);
    // A NIC that is no uplink is drawn too, alone.
    EXPECT_EQ(drawing.Named("hwnic4").size(), 1u);
    EXPECT_TRUE(drawing.Shows("hwnic0", "uplink") || drawing.Linked("hwnic0", "vSwitch0"));
}

// Names with every character DOT, Graphviz's labels, SVG or a terminal
// could take for something else.
TEST(HostsimGraph, DrawsHostileNamesExactly) {
    const std::vector<std::string> hostile = {
        "quote\"inside",
        "trailing backslash\\",
        "line\nbreak\ttab",
        std::string("nul\0byte", 8),
        "esc\x1b[31mred\x7f",
        "amp &amp; &lt;b&gt; <b>bold</b> &#45;",
        "{curly};[square] -- edge -> x",
        "\\N \\G \\L \\n label escapes",
        "unicode \u00e9 \u2713 \u0085 c1",
        "  blanks  ",
    };
    const std::string ghost = "ghost \"switch\\";
    Json profile = {{"format", "orvix-host-profile"}, {"version", 1}, {"system", {{"hostname", hostile[7]}}}};
    profile["nics"] = {{{"name", hostile[0]}, {"adminUp", true}, {"linkUp", true}, {"speed", 1000}},
                       {{"name", hostile[1]}}};
    profile["vswitches"] = {
        {{"name", hostile[2]}, {"uplinks", {hostile[0]}}, {"teaming", {{"uplinkOrder", {hostile[0]}}}}}};
    profile["portgroups"] = {{{"name", hostile[3]}, {"vswitch", hostile[2]}, {"vlanId", 42}}};
    profile["dvswitches"] = {{{"name", hostile[4]}, {"uuid", "u-1"}, {"uplinks", {hostile[1]}}}};
    profile["dvports"] = {{{"dvswitch", hostile[4]}, {"id", "7"}, {"portgroupId", "dvpg-1"}}};
    profile["netstacks"] = {{{"key", hostile[5]}}};
    profile["interfaces"] = {{{"name", hostile[6]},
                              {"netstack", hostile[5]},
                              {"dvswitch", hostile[4]},
                              {"dvPortId", "7"},
                              {"ipv4Mode", "static"},
                              {"ipv4Address", "192.0.2.9"},
                              {"ipv4Netmask", "255.255.255.128"}}};
    profile["worlds"] = {{{"id", 1}, {"name", "orvm:" + hostile[9]}, {"kind", "vm"}}};
    profile["ports"] = {{{"id", 10}, {"portset", hostile[2]}, {"client", hostile[8]}, {"portgroup", hostile[3]}},
                        {{"id", 11}, {"portset", ghost}, {"client", hostile[9]}, {"worldId", 1}}};

    const Drawing drawing = Draw(profile);
    ExpectWholeHost(profile, drawing);
    // The graph itself is clean UTF-8 whose only control characters are
    // the line ends of its statements.
    for (std::size_t at = 0; at < drawing.dot.size();) {
        char32_t c = 0;
        const std::size_t length = Orvix::Text::DecodeUtf8(drawing.dot, at, c);
        ASSERT_FALSE(Orvix::Text::IsBadByte(c, length)) << "at " << at << " of\n" << drawing.dot;
        ASSERT_TRUE(c == '\n' || !Orvix::Text::IsControl(c)) << "at " << at << " of\n" << drawing.dot;
        at += length;
    }
    EXPECT_TRUE(drawing.Shows(hostile[6], "192.0.2.9/25 (static)"));
    EXPECT_TRUE(drawing.Shows(hostile[9], "VM " + hostile[9]));
    // The port on a switch that does not exist hangs on a node saying so.
    ASSERT_EQ(drawing.Named(ghost).size(), 1u);
    EXPECT_EQ(drawing.nodes.at(drawing.Named(ghost).front()).back(), "switch (missing)");
    EXPECT_TRUE(drawing.Linked(hostile[9], ghost));
    // The title is a label too.
    EXPECT_NE(drawing.dot.find("label=\"host \\\\N \\\\G"), std::string::npos) << drawing.dot;
}

}  // namespace
