// What the classes of the IP interface and netstack room share inside the
// library: finding a stored interface or netstack with the message for a
// missing one, changing an interface in place, the MTU rule, and the mapping
// between an interface's stored addressing and IpConfig.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <string>

#include "Operation.h"
#include "hostctl/Lib.h"
#include "hostctl/network/ip/IpConfig.h"
#include "network/ip/IpRecords.h"

namespace PldCtl {
namespace Detail {

// Interfaces are pld0 to pld255.
inline constexpr int kMaxInterfaceNumber = 255;
// The number of an interface name pld0 to pld255 (no leading zeros), or -1.
int InterfaceNumber(const std::string& name);

// The key the store gives an object of a collection keyed by several fields:
// the fields joined by '|'.
std::string JoinedKey(std::initializer_list<std::string> parts);

// Whether a name a user gives (a search domain, an SA or SP name) can be
// stored and shown as one word on one line: not empty, no blank, no control
// character.
bool IsSingleWord(const std::string& text);

std::string MissingInterfaceMessage(const std::string& name);
std::string MissingNetstackMessage(const std::string& key);

// The stored interface or netstack, read to be changed, or HostCtlException
// with the message for a missing one.
StoredObject<InterfaceRecord> RequireInterface(Store::Transaction& t, const std::string& name);
StoredObject<NetstackRecord> RequireNetstack(Store::Transaction& t, const std::string& key);

// Throws HostCtlException for an MTU outside PldNic::MIN_MTU to MAX_MTU; the
// message names the interface unless `name` is empty.
void CheckMtu(std::int64_t mtu, const std::string& name);

// Between the stored addressing of an interface and its IpConfig.
struct IpConfigAccess {
    // The DNS-from-DHCP flag is filled only when `withDhcpDns`.
    static HostCtl::Network::IpConfig FromRecord(const InterfaceRecord& record, bool withDhcpDns);
    // Writes every field of `config`; addresses the interface keeps keep
    // their stored type and state, new ones are static and preferred.
    static void ToRecord(const HostCtl::Network::IpConfig& config, InterfaceRecord& record);
};

// Applies `edit(t, record)` to the stored interface inside one change
// (`operation` is the name faults are injected under, keyed by the
// interface) and returns the record as written.
template <typename Edit>
std::shared_ptr<const InterfaceRecord> ChangeInterface(const char* operation, const std::string& name, Edit edit) {
    Store::HostStore& store = EnterOperation(operation, name);
    std::shared_ptr<const InterfaceRecord> written;
    store.Change([&](Store::Transaction& t) {
        StoredObject<InterfaceRecord> stored = RequireInterface(t, name);
        InterfaceRecord edited = stored.record;
        edit(t, edited);
        Write(t, stored, edited);
        written = std::make_shared<const InterfaceRecord>(std::move(edited));
    });
    return written;
}

}  // namespace Detail
}  // namespace PldCtl
