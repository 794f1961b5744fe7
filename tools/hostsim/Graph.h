// `orvix-hostsim graph`: the host's network topology as a Graphviz graph.
#pragma once

#include <ostream>
#include <string>
#include <string_view>
#include <vector>

#include "hoststore/HostStore.h"

namespace OrvixHostsim {

// The objects a picture of the host is drawn from, as the store holds them.
struct Topology {
    std::string hostname;
    std::vector<PldCtl::Store::Json> nics, vswitches, portgroups, dvswitches, dvports, netstacks, interfaces, ports,
        worlds;
};

// Reads the collections of one consistent state of the host.
Topology ReadTopology(PldCtl::Store::HostStore& store);

// Writes the topology as an undirected DOT graph: physical NICs, standard
// and distributed switches with their uplinks, port groups with their VLAN
// IDs, DV ports, kernel interfaces with their addresses and netstacks, and
// the ports of virtual machines. A reference to an object that does not
// exist is drawn as a dashed node marked "missing", never dropped.
void WriteDot(const Topology& topology, std::ostream& out);

// `text` as a quoted DOT string whose label shows it literally: control
// characters and bad UTF-8 bytes escaped as a terminal shows them, quotes
// and backslashes escaped for DOT. Lines are joined with DOT's line breaks.
std::string DotLabel(const std::vector<std::string>& lines);

}  // namespace OrvixHostsim
