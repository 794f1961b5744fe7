// What the classes of standard switching share inside the library: finding
// a stored switch or port group with the message for a missing one, changing
// one in place, the rules for new names, and the host's view of the NICs and
// ports a switch uses.
#pragma once

#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

#include "Operation.h"
#include "hostctl/Lib.h"
#include "network/vswitch/VswitchRecords.h"

namespace PldCtl {
namespace Detail {

// The stored switch or port group of that name, read to be changed, or
// HostCtlException with the message for a missing one. Defined for
// VswitchRecord and PortGroupRecord.
template <typename Record>
StoredObject<Record> Require(Store::Transaction& t, const std::string& name);

// Throw HostCtlException for a name not fit for a new switch or port group.
void CheckSwitchName(const std::string& name);
void CheckPortGroupName(const std::string& name);

// The clients of a switch's ports that pass `keep`, joined for a message.
template <typename Keep>
std::string ClientsOf(Store::Transaction& t, const std::string& vswitch, Keep keep) {
    std::string clients;
    for (const PortRecord& port : ListChildren<PortRecord>(t, vswitch)) {
        if (!port.client.empty() && keep(port)) clients += (clients.empty() ? "" : ", ") + port.client;
    }
    return clients;
}

// Every port group of the host by the name of its switch, each switch's in
// their order: one pass over the collection for a listing of all switches.
using PortGroupsBySwitch = std::unordered_map<std::string, std::vector<std::shared_ptr<const PortGroupRecord>>>;
PortGroupsBySwitch ListPortGroupsBySwitch(Store::Transaction& t);

// Marks a NIC as no longer the uplink of any switch (a NIC the host does not
// have is left alone).
void ReleaseNic(Store::Transaction& t, const std::string& nic);

// The id of a new port of a switch whose ports are `ports`: the next id of
// the switch's own block, or the first of a new block.
std::int64_t NextPortId(Store::Transaction& t, const std::vector<PortRecord>& ports);

// Applies `edit(t, record)` to the stored switch or port group inside one
// change (`operation` is the name faults are injected under) and returns the
// record as written: objects refresh their snapshot from it.
template <typename Record, typename Edit>
std::shared_ptr<const Record> ChangeStored(const char* operation, const std::string& name, Edit edit) {
    Store::HostStore& store = EnterOperation(operation, name);
    std::shared_ptr<const Record> written;
    store.Change([&](Store::Transaction& t) {
        StoredObject<Record> stored = Require<Record>(t, name);
        Record edited = stored.record;
        edit(t, edited);
        Write(t, stored, edited);
        written = std::make_shared<const Record>(std::move(edited));
    });
    return written;
}

}  // namespace Detail

namespace Network {

// The names the room's classes use throughout.
using Detail::PortGroupRecord;
using Detail::PortRecord;
using Detail::VswitchRecord;
using HostCtl::Lib::HostCtlException;
using HostCtl::Network::NicTeamingPolicy;
using HostCtl::Network::PortSecurityPolicy;
using HostCtl::Network::ShapingPolicy;
using Store::FieldTest;
using Store::Transaction;

}  // namespace Network
}  // namespace PldCtl
