#include "Graph.h"

#include <arpa/inet.h>

#include <cstdint>
#include <functional>
#include <map>
#include <sstream>
#include <utility>

#include "orvixtext/Utf8.h"

namespace OrvixHostsim {

namespace {

using PldCtl::Store::Json;

// Fields are read the way the library reads them: a value of another type
// reads as absent.
std::string Text(const Json& object, const char* field, const std::string& fallback = "") {
    const auto found = object.find(field);
    return found != object.end() && found->is_string() ? found->get<std::string>() : fallback;
}

// A key or reference field, which may be a string or an integer.
std::string KeyText(const Json& object, const char* field) {
    const auto found = object.find(field);
    if (found == object.end()) return "";
    if (found->is_string()) return found->get<std::string>();
    if (found->is_number_integer()) return found->dump();
    return "";
}

std::int64_t Integer(const Json& object, const char* field, std::int64_t fallback) {
    const auto found = object.find(field);
    return found != object.end() && found->is_number_integer() ? found->get<std::int64_t>() : fallback;
}

bool Bool(const Json& object, const char* field, bool fallback) {
    const auto found = object.find(field);
    return found != object.end() && found->is_boolean() ? found->get<bool>() : fallback;
}

std::vector<std::string> Texts(const Json& object, const char* field) {
    std::vector<std::string> texts;
    const auto found = object.find(field);
    if (found == object.end() || !found->is_array()) return texts;
    for (const auto& item : *found) {
        if (item.is_string()) texts.push_back(item.get<std::string>());
    }
    return texts;
}

const Json& Member(const Json& object, const char* field) {
    static const Json empty = Json::object();
    const auto found = object.find(field);
    return found != object.end() && found->is_object() ? *found : empty;
}

std::vector<Json> Objects(const Json& object, const char* field) {
    std::vector<Json> objects;
    const auto found = object.find(field);
    if (found == object.end() || !found->is_array()) return objects;
    for (const auto& item : *found) {
        if (item.is_object()) objects.push_back(item);
    }
    return objects;
}

// "192.0.2.21/24" from an address and a dotted netmask; a netmask that is
// not a prefix is shown as it is.
std::string Ipv4WithPrefix(const std::string& address, const std::string& netmask) {
    in_addr mask{};
    if (inet_pton(AF_INET, netmask.c_str(), &mask) != 1) return address + "/" + netmask;
    const std::uint32_t bits = ntohl(mask.s_addr);
    int prefix = 0;
    while (prefix < 32 && (bits & (0x80000000u >> prefix)) != 0) ++prefix;
    const std::uint32_t contiguous = prefix == 0 ? 0 : ~std::uint32_t{0} << (32 - prefix);
    if (bits != contiguous) return address + "/" + netmask;
    return address + "/" + std::to_string(prefix);
}

std::string VlanText(std::int64_t vlan) {
    if (vlan == 0) return "VLAN 0 (untagged)";
    if (vlan == 4095) return "VLAN 4095 (all)";
    return "VLAN " + std::to_string(vlan);
}

// Nodes are written as they are declared; edges are kept and written after
// every node, so that a node is never made implicitly by an edge and left
// without its label.
class DotWriter {
public:
    explicit DotWriter(std::ostream& out) : out_(out) {}

    // Declares the node of an object of `kind` (a word: "nic", "vsw", ...)
    // and returns its id. Ids are made here, never from names.
    std::string Node(const std::string& kind, const std::string& key, const std::vector<std::string>& lines,
                     const std::string& attributes) {
        return Declare(kind, kind, key, lines, attributes);
    }

    // The node of an object declared before; a reference to one that does
    // not exist gets a dashed node of its own, one per missing object.
    std::string Ref(const std::string& kind, const std::string& key, const std::string& what) {
        const auto found = ids_.find({kind, key});
        if (found != ids_.end()) return found->second;
        const auto missing = ids_.find({"missing " + kind, key});
        if (missing != ids_.end()) return missing->second;
        return Declare("missing", "missing " + kind, key, {key, what + " (missing)"},
                       "shape=box, style=dashed, color=red");
    }

    bool Has(const std::string& kind, const std::string& key) const { return ids_.count({kind, key}) != 0; }

    void Edge(const std::string& from, const std::string& to, const std::string& attributes = "") {
        edges_ << "    " << from << " -- " << to;
        if (!attributes.empty()) edges_ << " [" << attributes << "]";
        edges_ << ";\n";
    }

    void WriteEdges() { out_ << edges_.str(); }

private:
    std::string Declare(const std::string& prefix, const std::string& kind, const std::string& key,
                        const std::vector<std::string>& lines, const std::string& attributes) {
        const std::string id = prefix + std::to_string(++counts_[prefix]);
        ids_[{kind, key}] = id;
        out_ << "    " << id << " [label=" << DotLabel(lines) << ", " << attributes << "];\n";
        return id;
    }

    std::ostream& out_;
    std::map<std::string, int> counts_;
    std::map<std::pair<std::string, std::string>, std::string> ids_;
    std::ostringstream edges_;
};

std::vector<std::string> NicLines(const Json& nic) {
    const std::string name = Text(nic, "name");
    if (!Bool(nic, "adminUp", true)) return {name, "administratively down"};
    if (!Bool(nic, "linkUp", false)) return {name, "link down"};
    return {name, "link up, " + std::to_string(Integer(nic, "speed", 0)) + " Mbps"};
}

// The role of each uplink of a standard switch in its failover order.
std::string UplinkRole(const Json& vswitch, const std::string& nic) {
    const Json& teaming = Member(vswitch, "teaming");
    const std::vector<std::string> order = Texts(teaming, "uplinkOrder");
    const std::int64_t maxActive = Integer(teaming, "maxActive", 1);
    for (std::size_t i = 0; i < order.size(); ++i) {
        if (order[i] == nic) return static_cast<std::int64_t>(i) < maxActive ? "active" : "standby";
    }
    return "unused";
}

std::string LagOf(const Json& dvswitch, const std::string& nic) {
    for (const Json& lag : Objects(dvswitch, "lags")) {
        for (const Json& member : Objects(lag, "members")) {
            if (Text(member, "nic") == nic) return Text(lag, "name");
        }
    }
    return "";
}

// Switches of one kind with their uplinks, each uplink edge labelled by
// `uplinkLabel`.
void DrawSwitches(DotWriter& dot, const std::vector<Json>& switches, const std::string& kind, const std::string& word,
                  const std::string& fill,
                  const std::function<std::string(const Json&, const std::string&)>& uplinkLabel) {
    for (const Json& vswitch : switches) {
        const std::string name = Text(vswitch, "name");
        const std::string id =
            dot.Node(kind, name, {name, word, "MTU " + std::to_string(Integer(vswitch, "mtu", 1500))},
                     "shape=box3d, style=filled, fillcolor=\"" + fill + "\"");
        for (const std::string& nic : Texts(vswitch, "uplinks")) {
            dot.Edge(dot.Ref("nic", nic, "NIC"), id, "label=" + DotLabel({uplinkLabel(vswitch, nic)}));
        }
    }
}

std::vector<std::string> InterfaceLines(const Json& interface) {
    std::vector<std::string> lines = {Text(interface, "name")};
    const std::string mode = Text(interface, "ipv4Mode", "none");
    const std::string address = Text(interface, "ipv4Address", "0.0.0.0");
    if (mode != "none" || address != "0.0.0.0") {
        lines.push_back(Ipv4WithPrefix(address, Text(interface, "ipv4Netmask", "0.0.0.0")) + " (" + mode + ")");
    }
    for (const Json& v6 : Objects(interface, "ipv6Addresses")) {
        std::string line = Text(v6, "address");
        const std::string type = Text(v6, "type", "static");
        const std::string status = Text(v6, "status", "preferred");
        if (type != "static" || status != "preferred") line += " (" + type + ", " + status + ")";
        lines.push_back(line);
    }
    const std::string opaque = Text(interface, "opaqueNetworkId");
    if (!opaque.empty()) lines.push_back("opaque network " + opaque);
    return lines;
}

std::vector<std::string> VmPortLines(const Json& port, const std::map<std::string, std::string>& worlds) {
    std::vector<std::string> lines = {Text(port, "client"), "port " + KeyText(port, "id")};
    const std::string worldId = KeyText(port, "worldId");
    const auto world = worlds.find(worldId);
    if (world != worlds.end()) {
        const std::string& name = world->second;
        lines.push_back(name.rfind("orvm:", 0) == 0 ? "VM " + name.substr(5) : "world " + name);
    } else if (!worldId.empty() && worldId != "0") {
        lines.push_back("world " + worldId + " (missing)");
    }
    const std::string mac = Text(port, "mac");
    if (!mac.empty() && mac != "00:00:00:00:00:00") lines.push_back(mac);
    return lines;
}

}  // namespace

std::string DotLabel(const std::vector<std::string>& lines) {
    std::string label = "\"";
    for (std::size_t i = 0; i < lines.size(); ++i) {
        if (i > 0) label += "\\n";
        for (const char c : Orvix::Text::EscapeControls(lines[i])) {
            if (c == '"' || c == '\\') {
                label += '\\';
                label += c;
            } else if (c == '&') {
                // Graphviz reads character entities in plain labels too.
                label += "&amp;";
            } else {
                label += c;
            }
        }
    }
    return label + "\"";
}

Topology ReadTopology(PldCtl::Store::HostStore& store) {
    Topology topology;
    store.Read([&](PldCtl::Store::Transaction& t) {
        topology.hostname = Text(t.GetSingleton("system"), "hostname", "localhost");
        topology.nics = t.List("nics");
        topology.vswitches = t.List("vswitches");
        topology.portgroups = t.List("portgroups");
        topology.dvswitches = t.List("dvswitches");
        topology.dvports = t.List("dvports");
        topology.netstacks = t.List("netstacks");
        topology.interfaces = t.List("interfaces");
        topology.ports = t.List("ports");
        topology.worlds = t.List("worlds");
    });
    return topology;
}

void WriteDot(const Topology& topology, std::ostream& out) {
    out << "graph host {\n"
        << "    graph [label=" << DotLabel({"host " + topology.hostname})
        << ", labelloc=t, rankdir=LR, fontname=\"sans-serif\"];\n"
        << "    node [fontname=\"sans-serif\", fontsize=10];\n"
        << "    edge [fontname=\"sans-serif\", fontsize=9];\n";
    DotWriter dot(out);

    for (const Json& nic : topology.nics) {
        dot.Node("nic", Text(nic, "name"), NicLines(nic), "shape=box, style=filled, fillcolor=\"#e8e8e8\"");
    }
    for (const Json& netstack : topology.netstacks) {
        const std::string key = Text(netstack, "key");
        std::vector<std::string> lines = {key};
        const std::string name = Text(netstack, "name", key);
        if (name != key) lines.push_back(name);
        lines.push_back(Integer(netstack, "state", 4660) == 4660 ? "netstack" : "netstack, configured only");
        dot.Node("ns", key, lines, "shape=ellipse, style=filled, fillcolor=\"#fff2cc\"");
    }
    DrawSwitches(dot, topology.vswitches, "vsw", "standard switch", "#dae8fc",
                 [](const Json& vswitch, const std::string& nic) { return "uplink, " + UplinkRole(vswitch, nic); });
    DrawSwitches(dot, topology.dvswitches, "dvs", "distributed switch", "#d5e8d4",
                 [](const Json& dvswitch, const std::string& nic) {
                     const std::string lag = LagOf(dvswitch, nic);
                     return lag.empty() ? std::string("uplink") : "uplink, " + lag;
                 });
    for (const Json& portgroup : topology.portgroups) {
        const std::string name = Text(portgroup, "name");
        const std::string id = dot.Node("pg", name, {name, VlanText(Integer(portgroup, "vlanId", 0))}, "shape=tab");
        dot.Edge(dot.Ref("vsw", Text(portgroup, "vswitch"), "standard switch"), id);
    }
    for (const Json& dvport : topology.dvports) {
        const std::string dvswitch = Text(dvport, "dvswitch");
        const std::string number = KeyText(dvport, "id");
        std::vector<std::string> lines = {"DV port " + number};
        const std::string portgroupId = Text(dvport, "portgroupId");
        if (!portgroupId.empty()) lines.push_back(portgroupId);
        const std::string id = dot.Node("dvp", dvswitch + "|" + number, lines, "shape=cds");
        dot.Edge(dot.Ref("dvs", dvswitch, "distributed switch"), id);
    }
    for (const Json& interface : topology.interfaces) {
        const std::string id = dot.Node("if", Text(interface, "name"), InterfaceLines(interface),
                                        "shape=note, style=filled, fillcolor=\"#ffe6cc\"");
        const std::string portgroup = Text(interface, "portgroup");
        const std::string dvswitch = Text(interface, "dvswitch");
        if (!portgroup.empty()) {
            dot.Edge(dot.Ref("pg", portgroup, "port group"), id);
        } else if (!dvswitch.empty()) {
            dot.Edge(dot.Ref("dvp", dvswitch + "|" + KeyText(interface, "dvPortId"), "DV port"), id);
        }
        dot.Edge(id, dot.Ref("ns", Text(interface, "netstack"), "netstack"), "style=dashed");
    }
    std::map<std::string, std::string> worlds;
    for (const Json& world : topology.worlds) worlds[KeyText(world, "id")] = Text(world, "name");
    for (const Json& port : topology.ports) {
        // Ports of kernel interfaces and uplinks are drawn as those; free
        // ports and the switches' own are left out.
        if (Text(port, "type", "vm") != "vm" || Text(port, "client").empty()) continue;
        const std::string id = dot.Node("vm", KeyText(port, "id"), VmPortLines(port, worlds), "shape=component");
        const std::string portset = Text(port, "portset");
        const std::string portgroup = Text(port, "portgroup");
        const std::string dvPortId = KeyText(port, "dvPortId");
        std::string to;
        if (!portgroup.empty()) {
            to = dot.Ref("pg", portgroup, "port group");
        } else if (!dvPortId.empty()) {
            to = dot.Ref("dvp", portset + "|" + dvPortId, "DV port");
        } else if (dot.Has("dvs", portset)) {
            to = dot.Ref("dvs", portset, "distributed switch");
        } else {
            to = dot.Ref("vsw", portset, "switch");
        }
        dot.Edge(to, id);
    }
    dot.WriteEdges();
    out << "}\n";
}

}  // namespace OrvixHostsim
