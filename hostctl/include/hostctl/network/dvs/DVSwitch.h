// The host-control library's view of distributed switches, their DV ports
// and their LACP state. Every object the library hands out is new and
// belongs to the caller; LACP data is handed back to its switch for release.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/vswitch/VirtualSwitch.h"

namespace HostCtl {
namespace Network {

// LACP modes of a LAG or of a DV port.
constexpr int LACP_MODE_NONE = 0;
constexpr int LACP_MODE_ACTIVE = 1;
constexpr int LACP_MODE_PASSIVE = 2;

// The bits of an LACP actor or partner state byte.
constexpr std::uint8_t LACP_STATE_ACTIVITY = 0x01;
constexpr std::uint8_t LACP_STATE_SHORT_TIMEOUT = 0x02;

// The message for a distributed switch the host does not have: "Unable to
// find a DVSwitch with the name NAME".
HOSTCTL_EXPORT std::string DVSwitchNotFoundMessage(const std::string& name);

// One configured link aggregation group.
struct LacpLagConfig {
    std::int64_t id = 0;
    std::string name;
    int mode = LACP_MODE_NONE;  // LACP_MODE_*
    int loadBalance = 0;        // index into the load-balancing table, 0 to 20
    // The NICs of the LAG, in the order of its members.
    std::vector<std::string> nics;
};

// A switch's LAG configuration; no LAG means LACP is set per uplink DV port
// (DVPort::IsLacpEnabled).
struct LacpConfig {
    std::vector<LacpLagConfig> lags;
};

// The host's side of one NIC's LACP session.
struct LacpLocalInfo {
    // "S" or "F" (slow or fast LACPDUs, the short-timeout bit of `state`),
    // then "A" or "P" (active or passive, its activity bit).
    std::string flags;
    std::uint16_t adminKey = 0;
    std::uint16_t operKey = 0;
    std::uint16_t portPriority = 0;
    std::uint16_t portNumber = 0;
    std::uint8_t state = 0;  // actor state byte
};

// The link partner's side of one NIC's LACP session.
struct LacpPartnerInfo {
    std::string deviceId;
    std::string flags;
    std::uint64_t age = 0;  // seconds since its last LACPDU
    std::uint16_t operKey = 0;
    std::uint16_t portPriority = 0;
    std::uint16_t portNumber = 0;
    std::uint8_t state = 0;  // partner state byte
};

// One NIC running LACP in a LAG.
struct LacpNicInfo {
    std::string name;
    std::string state;  // protocol state text, e.g. "Bundled"
    LacpLocalInfo local;
    LacpPartnerInfo partner;
    std::uint64_t txLacpdus = 0;
    std::uint64_t rxLacpdus = 0;
    std::uint64_t txErrors = 0;
    std::uint64_t rxErrors = 0;
};

// One LAG at run time, with the NICs in it.
struct LacpLagInfo {
    std::int64_t id = 0;
    std::string name;
    int mode = LACP_MODE_NONE;
    int loadBalance = 0;
    std::vector<LacpNicInfo> nics;
};

struct LacpInfo {
    std::vector<LacpLagInfo> lags;
};

// A port of a distributed switch.
class HOSTCTL_EXPORT DVPort {
public:
    virtual ~DVPort();

    virtual std::string GetPortId() const = 0;
    // Its distributed port group, e.g. "dvpg-31"; "" for none.
    virtual std::string GetDVPortgroupId() const = 0;
    // Whether a client uses the port; `clients` is set to the clients of
    // the host's ports on it (empty when not in use), from one query.
    virtual bool IsInUse(std::vector<std::string>& clients) const = 0;
    // Whether LACP runs on this (uplink) port, and in which mode
    // (LACP_MODE_*); used when the switch has no LAGs.
    virtual bool IsLacpEnabled() const = 0;
    virtual int GetLacpMode() const = 0;
};

// A distributed switch as the host sees it; through Portset its class,
// port counts and uplinks.
class HOSTCTL_EXPORT DVSwitch : public virtual Portset {
public:
    ~DVSwitch() override;

    // The identifier its DV ports are addressed by (shown as the VDS ID).
    virtual std::string GetUUID() const = 0;
    virtual int GetMTU() const = 0;
    // "down", "listen", "advertise" or "both", as a standard switch reports it.
    virtual std::string GetCDPStatus() const = 0;
    // Seconds; -1 while beaconing is off.
    virtual int GetBeaconTimeout() const = 0;
    virtual bool IsOrvixBranded() const = 0;
    // Its DV ports, in the host's order.
    virtual std::vector<std::unique_ptr<DVPort>> GetDVPorts() const = 0;

    // The switch's LAGs as configured, and at run time with their NICs.
    // Hand each back with the matching release call when done.
    virtual std::unique_ptr<LacpConfig> GetLacpConfig() const = 0;
    virtual void ReleaseLacpConfig(std::unique_ptr<LacpConfig> config) const = 0;
    virtual std::unique_ptr<LacpInfo> GetLacpInfo() const = 0;
    virtual void ReleaseLacpInfo(std::unique_ptr<LacpInfo> info) const = 0;

    // Sets the LACP timeout of every NIC of LAG `lagId` (`nic` empty), or of
    // that NIC only, in one transaction: short (fast LACPDUs) or long.
    // Throws for a LAG the switch does not have ("LAG 7 does not exist on
    // DVSwitch dvSwitch0") or a NIC that is not in it ("NIC hwnic9 is not
    // in LAG 1 of DVSwitch dvSwitch0").
    virtual void SetLacpTimeout(std::int64_t lagId, bool shortTimeout, const std::string& nic) = 0;
};

}  // namespace Network
}  // namespace HostCtl
