// The host's kernel IP interfaces: lookups, creation and removal.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/Values.h"
#include "hostctl/network/ConnectionPoint.h"
#include "hostctl/network/ip/IpConfig.h"
#include "hostctl/network/ip/PldNic.h"

namespace PldCtl {
namespace Network {

// The name a tag number has (PldNicTagType 1 to 8), "" for any other.
HOSTCTL_EXPORT std::string PldNicTagIdToName(int tag);
// The tag of that name (exact, case-sensitive), PLDNIC_TAG_INVALID for a
// name no tag has.
HOSTCTL_EXPORT HostCtl::Network::PldNicTagType PldNicTagNameToId(const std::string& name);

class HOSTCTL_EXPORT PalladNicInfoImpl {
public:
    // Never throws: the host is reached by the operations.
    PalladNicInfoImpl();
    virtual ~PalladNicInfoImpl();

    // Creates an interface connected at `point` on the netstack `netstack`,
    // with `config`, `mac` (unset: the host picks a unique one), `flags`
    // (unused, pass 0), `mtu` (0: 1500; else MIN_MTU to MAX_MTU, never
    // narrowed) and `name` ("": the lowest free pldN). Throws for a point the
    // host does not have or that is in use, a netstack the host does not
    // have, a name in use, a MAC address in use or not unicast, an MTU out of
    // range, or no free port. A DV port records the connection id of `point`.
    virtual std::unique_ptr<HostCtl::Network::PldNic> AddPalladNic(
        HostCtl::Network::ConnectionPoint* point, const std::string& netstack, const HostCtl::Network::IpConfig& config,
        const HostCtl::Network::MacAddress& mac, unsigned flags, std::int64_t mtu, const std::string& name);
    // Removes the interface connected at `point` on `netstack`; throws when
    // there is none.
    virtual void RemovePalladNic(HostCtl::Network::ConnectionPoint* point, const std::string& netstack);

    // In the host's order (by interface number).
    virtual std::vector<std::unique_ptr<HostCtl::Network::PldNic>> GetPalladNics();
    virtual std::vector<std::unique_ptr<HostCtl::Network::PldNic>> GetPalladNicsByInstanceKey(
        const std::string& netstack);
    virtual std::vector<std::unique_ptr<HostCtl::Network::PldNic>> GetPalladNicsByTag(
        HostCtl::Network::PldNicTagType tag);
    // Null when there is no interface of that name. `persistedOnly` is
    // accepted for callers that pass it and has no effect here.
    virtual std::unique_ptr<HostCtl::Network::PldNic> GetPalladNicByInterface(const std::string& name,
                                                                              bool persistedOnly);
    // Fills `names` with the names of the interfaces on that netstack.
    virtual void GetPalladNicNamesByInstanceKey(std::vector<std::string>& names, const std::string& netstack);
};

}  // namespace Network
}  // namespace PldCtl
