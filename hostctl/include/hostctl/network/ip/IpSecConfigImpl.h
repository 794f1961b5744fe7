// The kernel's IPv6 IPsec databases (security associations and policies)
// and the IKE daemons' configuration.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/Values.h"

namespace HostCtl {
namespace Network {

// One security association. The numbers are indexes into the display tables
// of IpSecConfigImpl, made by its converters.
struct IpSecSadParam {
    std::string name;
    Ipv6Address source;
    Ipv6Address destination;
    std::uint32_t spi = 0;
    int mode = 0;
    int encryptionAlgorithm = 0;
    std::string encryptionKey;
    int integrityAlgorithm = 0;
    std::string integrityKey;
    int state = 0;
    // Seconds; 0 for no limit.
    std::uint64_t lifetime = 0;
};

// One security policy.
struct IpSecSpdParam {
    std::string name;
    // "" lets the host choose an SA; "UNKNOWN" names a unique SA that no
    // longer exists.
    std::string saName;
    Ipv6Address sourceAddress;
    int sourcePrefixLength = 0;
    // 0 to 65535; 0 stands for any port.
    int sourcePort = 0;
    Ipv6Address destinationAddress;
    int destinationPrefixLength = 0;
    int destinationPort = 0;
    int upperLayerProtocol = 0;
    int direction = 0;
    int action = 0;
    int mode = 0;
};

}  // namespace Network
}  // namespace HostCtl

namespace PldCtl {
namespace Network {

// Every operation is one store read or one transaction and throws
// HostCtl::Lib::HostCtlException, changing nothing, when the host refuses.
class HOSTCTL_EXPORT IpSecConfigImpl {
public:
    // Display tables, indexed by the numbers in the parameters. A number
    // outside a table has no display word.
    static const std::vector<std::string> SA_STATE;
    static const std::vector<std::string> SA_MODE;
    static const std::vector<std::string> SA_ENCPT_ALG;
    static const std::vector<std::string> SA_AUTH_ALG;
    static const std::vector<std::string> SP_UL_PROTO_TYPE;
    static const std::vector<std::string> SP_DIRECTION;
    static const std::vector<std::string> SP_ACTION;

    // Converters from the option words to the numbers. "" gives the
    // default of each (documented in docs/host-profile.md); a word the table
    // does not have throws.
    static int StringToIpSecMode(const std::string& word);
    static int StringToIpSecEncyptAlgo(const std::string& word);
    static int StringToIpSecAuthAlgo(const std::string& word);
    static int StringToIpSecULProtoType(const std::string& word);
    static int StringToIpSecDirection(const std::string& word);
    static int StringToIpSecAction(const std::string& word);

    IpSecConfigImpl();
    virtual ~IpSecConfigImpl();

    // Security associations. Throws for a name in use, an SPI in use between
    // the same addresses, a key that does not suit its algorithm, and (for
    // removal) an SA the host does not have.
    virtual void AddSADConfig(const HostCtl::Network::IpSecSadParam& sa);
    virtual void RemoveSADConfig(const std::string& name);
    // Removes the automatically negotiated SA with those addresses and SPI.
    virtual void RemoveAutoSADConfig(const HostCtl::Network::IpSecSadParam& sa);
    virtual void FlushSADConfig();
    // In the host's order. The keys are secrets and are left empty.
    virtual void GetSADConfigList(std::vector<HostCtl::Network::IpSecSadParam>& sas);

    // Security policies. Throws for a name in use, an SA name the host does
    // not have, a port outside 0 to 65535, and (for removal) a policy the
    // host does not have.
    virtual void AddSPDConfig(const HostCtl::Network::IpSecSpdParam& sp);
    virtual void RemoveSPDConfig(const std::string& name);
    virtual void FlushSPDConfig();
    virtual void GetSPDConfigList(std::vector<HostCtl::Network::IpSecSpdParam>& sps);

    // The IKE daemons' configuration: CheckIKEConfig reads the named file
    // carefully (a regular file of bounded size, in the daemons' syntax) and
    // throws with a clear message otherwise; CopyIKEConfig stores it as the
    // host's IKE configuration; RestartIKEDaemons restarts the daemons
    // (recorded in the host's exec log) and throws when the restart fails.
    virtual void CheckIKEConfig(const std::string& path);
    virtual void CopyIKEConfig(const std::string& path);
    virtual void RestartIKEDaemons();
};

}  // namespace Network
}  // namespace PldCtl
