// The stored records of IPsec: the IKE daemons' settings (the "ipsec"
// singleton), security associations and security policies. Algorithms,
// modes, protocols, directions and actions are stored as the words users
// give; docs/host-profile.md lists them with the numbers the library uses.
#pragma once

#include <cstdint>
#include <string>

#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

struct IpsecRecord {
    static constexpr const char* kSingleton = Store::Section::kIpsec;

    std::string ikeConfigPath = "/etc/orvix/ike/iked.conf";
    std::string ikeConfig;
    std::string ikeConfigSource;
    bool ikeDaemonsRunning = true;
};

// The keys are secrets: they stay in the store and no listing hands them out.
struct SaRecord {
    static constexpr const char* kSection = Store::Section::kIpsecSAs;

    std::string name;
    bool automatic = false;
    std::string source = "::";
    std::string destination = "::";
    std::uint32_t spi = 0;
    std::string mode = "any";
    std::string encryptionAlgorithm = "null";
    std::string encryptionKey;
    std::string integrityAlgorithm = "hmac-sha1";
    std::string integrityKey;
    std::string state = "mature";
    std::uint64_t lifetime = 0;
};

struct SpRecord {
    static constexpr const char* kSection = Store::Section::kIpsecSPs;

    std::string name;
    std::string saName;
    // IPv6 networks, address/prefix.
    std::string source = "::/0";
    std::string destination = "::/0";
    int sourcePort = 0;
    int destinationPort = 0;
    std::string protocol = "any";
    std::string direction = "out";
    std::string action = "ipsec";
    std::string mode = "any";
};

}  // namespace Detail
}  // namespace PldCtl
