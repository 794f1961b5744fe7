// IPsec over the host store: security associations and policies, and the
// IKE daemons' configuration file. Numbers in the parameters index the
// display tables below; the store keeps the words.
#include "hostctl/network/ip/IpSecConfigImpl.h"

#include <algorithm>
#include <cctype>
#include <cerrno>
#include <cstdio>
#include <cstring>

#include "Refusals.h"
#include "hostctl/util/Exec.h"
#include "network/ip/IpLookup.h"
#include "network/ip/IpsecRecords.h"

namespace PldCtl {
namespace Network {

using Detail::SaRecord;
using Detail::SpRecord;
using HostCtl::Lib::HostCtlException;
using HostCtl::Network::IpSecSadParam;
using HostCtl::Network::IpSecSpdParam;
using HostCtl::Network::Ipv6Address;
using HostCtl::Network::Ipv6Network;

// The first word of each converted table is what "" stands for, so that a
// parameter left at 0 means the default too; the state table follows an
// SA's life.
const std::vector<std::string> IpSecConfigImpl::SA_STATE = {"larval", "mature", "dying", "dead"};
const std::vector<std::string> IpSecConfigImpl::SA_MODE = {"any", "transport", "tunnel"};
const std::vector<std::string> IpSecConfigImpl::SA_ENCPT_ALG = {"null", "3des-cbc", "aes128-cbc"};
const std::vector<std::string> IpSecConfigImpl::SA_AUTH_ALG = {"hmac-sha1", "hmac-sha2-256"};
const std::vector<std::string> IpSecConfigImpl::SP_UL_PROTO_TYPE = {"any", "tcp", "udp", "icmp6"};
const std::vector<std::string> IpSecConfigImpl::SP_DIRECTION = {"out", "in"};
const std::vector<std::string> IpSecConfigImpl::SP_ACTION = {"ipsec", "discard", "none"};

namespace {

constexpr const char* kUnknownSa = "UNKNOWN";
constexpr const char* kIkeRestart = "/etc/init.d/iked restart";
constexpr std::size_t kMaxIkeConfigBytes = 64 * 1024;

constexpr const char* kModeWhat = "IPsec mode";
constexpr const char* kEncryptionWhat = "encryption algorithm";
constexpr const char* kIntegrityWhat = "integrity algorithm";
constexpr const char* kProtocolWhat = "upper layer protocol";
constexpr const char* kDirectionWhat = "flow direction";
constexpr const char* kActionWhat = "action";

[[noreturn]] void Invalid(const char* what, const std::string& word) {
    throw HostCtlException("Invalid " + std::string(what) + " '" + word + "'");
}

// The number of a word; "" is the table's first word.
int NumberOf(const std::vector<std::string>& table, const std::string& word, const char* what) {
    if (word.empty()) return 0;
    for (std::size_t i = 0; i < table.size(); ++i) {
        if (table[i] == word) return static_cast<int>(i);
    }
    Invalid(what, word);
}

// The number of a stored word; -1 (no display word) for one the table lacks.
int StoredNumberOf(const std::vector<std::string>& table, const std::string& word) {
    for (std::size_t i = 0; i < table.size(); ++i) {
        if (table[i] == word) return static_cast<int>(i);
    }
    return -1;
}

// The word of a number a caller gives; throws for one outside the table.
const std::string& WordAt(const std::vector<std::string>& table, int number, const char* what) {
    if (number < 0 || number >= static_cast<int>(table.size())) Invalid(what, std::to_string(number));
    return table[static_cast<std::size_t>(number)];
}

std::string Hex(std::uint32_t spi) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%x", spi);
    return text;
}

void CheckName(const char* kind, const std::string& name) {
    if (!Detail::IsSingleWord(name)) {
        throw HostCtlException("Invalid " + std::string(kind) + " name '" + name +
                               "': use a name without blanks or control characters");
    }
}

// Key bytes each algorithm takes.
std::size_t KeyBytes(const std::string& algorithm) {
    if (algorithm == "3des-cbc") return 24;
    if (algorithm == "aes128-cbc") return 16;
    if (algorithm == "hmac-sha1") return 20;
    if (algorithm == "hmac-sha2-256") return 32;
    return 0;
}

// A key is the algorithm's number of bytes as printable characters, or "0x"
// and two hex digits a byte; the null algorithm takes none.
void CheckKey(const std::string& key, const std::string& algorithm, const char* what) {
    const std::size_t bytes = KeyBytes(algorithm);
    if (bytes == 0) {
        if (!key.empty()) throw HostCtlException("Encryption algorithm " + algorithm + " takes no key");
        return;
    }
    bool fits;
    if (key.size() > 2 && key[0] == '0' && (key[1] == 'x' || key[1] == 'X')) {
        fits = key.size() == 2 + 2 * bytes && std::all_of(key.begin() + 2, key.end(), [](char c) {
                   return std::isxdigit(static_cast<unsigned char>(c));
               });
    } else {
        fits = key.size() == bytes && std::all_of(key.begin(), key.end(), [](char c) { return c > ' ' && c < 0x7f; });
    }
    if (!fits) {
        throw HostCtlException("Invalid " + std::string(what) + " key for " + algorithm + ": use " +
                               std::to_string(bytes) + " characters or 0x and " + std::to_string(2 * bytes) +
                               " hex digits");
    }
}

// Policies that name a removed SA keep pointing at nothing the host can
// use: they are marked so users see it.
template <typename Removed>
void MarkSpsUnknown(Store::Transaction& t, Removed removed) {
    for (const SpRecord& sp : Detail::List<SpRecord>(t)) {
        if (sp.saName.empty() || sp.saName == kUnknownSa || !removed(sp.saName)) continue;
        std::optional<Detail::StoredObject<SpRecord>> stored = Detail::Find<SpRecord>(t, sp.name);
        if (!stored) continue;
        SpRecord edited = stored->record;
        edited.saName = kUnknownSa;
        Detail::Write(t, *stored, edited);
    }
}

// The text of an IKE configuration file, read without ever blocking: a
// regular file of at most 64 KiB holding text.
std::string ReadIkeConfig(const std::string& path) {
    const std::string name = "IKE configuration " + path;
    const std::string text =
        Detail::ReadRegularFile("IKE configuration", path, kMaxIkeConfigBytes, [&](std::uint64_t size) {
            return name + " has " + std::to_string(size) + " bytes, more than the " +
                   std::to_string(kMaxIkeConfigBytes) + " allowed";
        });
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        if ((byte < ' ' && byte != '\n' && byte != '\t' && byte != '\r') || byte == 0x7f) {
            throw HostCtlException(name + " cannot be read: it is not a text file");
        }
    }
    return text;
}

}  // namespace

int IpSecConfigImpl::StringToIpSecMode(const std::string& word) {
    return NumberOf(SA_MODE, word, kModeWhat);
}
int IpSecConfigImpl::StringToIpSecEncyptAlgo(const std::string& word) {
    return NumberOf(SA_ENCPT_ALG, word, kEncryptionWhat);
}
int IpSecConfigImpl::StringToIpSecAuthAlgo(const std::string& word) {
    return NumberOf(SA_AUTH_ALG, word, kIntegrityWhat);
}
int IpSecConfigImpl::StringToIpSecULProtoType(const std::string& word) {
    return NumberOf(SP_UL_PROTO_TYPE, word, kProtocolWhat);
}
int IpSecConfigImpl::StringToIpSecDirection(const std::string& word) {
    return NumberOf(SP_DIRECTION, word, kDirectionWhat);
}
int IpSecConfigImpl::StringToIpSecAction(const std::string& word) {
    return NumberOf(SP_ACTION, word, kActionWhat);
}

IpSecConfigImpl::IpSecConfigImpl() = default;
IpSecConfigImpl::~IpSecConfigImpl() = default;

void IpSecConfigImpl::AddSADConfig(const IpSecSadParam& sa) {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::AddSADConfig", sa.name);
    CheckName("SA", sa.name);
    SaRecord record;
    record.name = sa.name;
    record.source = sa.source.GetStringAddress();
    record.destination = sa.destination.GetStringAddress();
    record.spi = sa.spi;
    record.mode = WordAt(SA_MODE, sa.mode, kModeWhat);
    record.encryptionAlgorithm = WordAt(SA_ENCPT_ALG, sa.encryptionAlgorithm, kEncryptionWhat);
    record.encryptionKey = sa.encryptionKey;
    record.integrityAlgorithm = WordAt(SA_AUTH_ALG, sa.integrityAlgorithm, kIntegrityWhat);
    record.integrityKey = sa.integrityKey;
    record.lifetime = sa.lifetime;
    CheckKey(record.encryptionKey, record.encryptionAlgorithm, "encryption");
    CheckKey(record.integrityKey, record.integrityAlgorithm, "integrity");
    store.Change([&](Store::Transaction& t) {
        if (t.Exists(SaRecord::kSection, sa.name)) throw HostCtlException("SA " + sa.name + " already exists");
        for (const SaRecord& other : Detail::List<SaRecord>(t)) {
            if (other.spi == record.spi && other.source == record.source && other.destination == record.destination) {
                throw HostCtlException("SA SPI " + Hex(record.spi) + " between " + record.source + " and " +
                                       record.destination + " is in use");
            }
        }
        Detail::Create(t, record);
    });
}

void IpSecConfigImpl::RemoveSADConfig(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::RemoveSADConfig", name);
    store.Change([&](Store::Transaction& t) {
        if (!t.Remove(SaRecord::kSection, name)) throw HostCtlException("SA " + name + " does not exist");
        MarkSpsUnknown(t, [&](const std::string& saName) { return saName == name; });
    });
}

void IpSecConfigImpl::RemoveAutoSADConfig(const IpSecSadParam& sa) {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::RemoveAutoSADConfig");
    const std::string source = sa.source.GetStringAddress();
    const std::string destination = sa.destination.GetStringAddress();
    store.Change([&](Store::Transaction& t) {
        std::string name;
        for (const SaRecord& stored : Detail::List<SaRecord>(t)) {
            if (stored.automatic && stored.spi == sa.spi && stored.source == source &&
                stored.destination == destination) {
                name = stored.name;
                break;
            }
        }
        if (name.empty() || !t.Remove(SaRecord::kSection, name)) {
            throw HostCtlException("No automatic SA from " + source + " to " + destination + " with SPI " +
                                   Hex(sa.spi));
        }
        MarkSpsUnknown(t, [&](const std::string& saName) { return saName == name; });
    });
}

void IpSecConfigImpl::FlushSADConfig() {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::FlushSADConfig");
    store.Change([&](Store::Transaction& t) {
        for (const std::string& key : t.ListKeys(SaRecord::kSection)) t.Remove(SaRecord::kSection, key);
        MarkSpsUnknown(t, [](const std::string&) { return true; });
    });
}

void IpSecConfigImpl::GetSADConfigList(std::vector<IpSecSadParam>& sas) {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::GetSADConfigList");
    sas.clear();
    for (const SaRecord& record : Detail::List<SaRecord>(store)) {
        IpSecSadParam sa;
        sa.name = record.name;
        sa.source = Ipv6Address(record.source);
        sa.destination = Ipv6Address(record.destination);
        sa.spi = record.spi;
        sa.mode = StoredNumberOf(SA_MODE, record.mode);
        sa.encryptionAlgorithm = StoredNumberOf(SA_ENCPT_ALG, record.encryptionAlgorithm);
        sa.integrityAlgorithm = StoredNumberOf(SA_AUTH_ALG, record.integrityAlgorithm);
        sa.state = StoredNumberOf(SA_STATE, record.state);
        sa.lifetime = record.lifetime;
        sas.push_back(std::move(sa));
    }
}

void IpSecConfigImpl::AddSPDConfig(const IpSecSpdParam& sp) {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::AddSPDConfig", sp.name);
    CheckName("SP", sp.name);
    for (const auto& [port, which] :
         {std::make_pair(sp.sourcePort, "source"), std::make_pair(sp.destinationPort, "destination")}) {
        if (port < 0 || port > 65535) {
            throw HostCtlException("Invalid " + std::string(which) + " port " + std::to_string(port) +
                                   ": must be between 0 and 65535");
        }
    }
    SpRecord record;
    record.name = sp.name;
    record.saName = sp.saName;
    record.source = Ipv6Network(sp.sourceAddress, sp.sourcePrefixLength).Masked().GetStringAddress();
    record.destination = Ipv6Network(sp.destinationAddress, sp.destinationPrefixLength).Masked().GetStringAddress();
    record.sourcePort = sp.sourcePort;
    record.destinationPort = sp.destinationPort;
    record.protocol = WordAt(SP_UL_PROTO_TYPE, sp.upperLayerProtocol, kProtocolWhat);
    record.direction = WordAt(SP_DIRECTION, sp.direction, kDirectionWhat);
    record.action = WordAt(SP_ACTION, sp.action, kActionWhat);
    record.mode = WordAt(SA_MODE, sp.mode, kModeWhat);
    store.Change([&](Store::Transaction& t) {
        if (t.Exists(SpRecord::kSection, sp.name)) throw HostCtlException("SP " + sp.name + " already exists");
        if (!sp.saName.empty() && !t.Exists(SaRecord::kSection, sp.saName)) {
            throw HostCtlException("SA " + sp.saName + " for SP " + sp.name + " does not exist");
        }
        Detail::Create(t, record);
    });
}

void IpSecConfigImpl::RemoveSPDConfig(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::RemoveSPDConfig", name);
    store.Change([&](Store::Transaction& t) {
        if (!t.Remove(SpRecord::kSection, name)) throw HostCtlException("SP " + name + " does not exist");
    });
}

void IpSecConfigImpl::FlushSPDConfig() {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::FlushSPDConfig");
    store.Change([&](Store::Transaction& t) {
        for (const std::string& key : t.ListKeys(SpRecord::kSection)) t.Remove(SpRecord::kSection, key);
    });
}

void IpSecConfigImpl::GetSPDConfigList(std::vector<IpSecSpdParam>& sps) {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::GetSPDConfigList");
    sps.clear();
    for (const SpRecord& record : Detail::List<SpRecord>(store)) {
        IpSecSpdParam sp;
        sp.name = record.name;
        sp.saName = record.saName;
        const Ipv6Network source(record.source);
        const Ipv6Network destination(record.destination);
        sp.sourceAddress = source.GetAddress();
        sp.sourcePrefixLength = source.GetPrefixLength();
        sp.sourcePort = record.sourcePort;
        sp.destinationAddress = destination.GetAddress();
        sp.destinationPrefixLength = destination.GetPrefixLength();
        sp.destinationPort = record.destinationPort;
        sp.upperLayerProtocol = StoredNumberOf(SP_UL_PROTO_TYPE, record.protocol);
        sp.direction = StoredNumberOf(SP_DIRECTION, record.direction);
        sp.action = StoredNumberOf(SP_ACTION, record.action);
        sp.mode = StoredNumberOf(SA_MODE, record.mode);
        sps.push_back(std::move(sp));
    }
}

void IpSecConfigImpl::CheckIKEConfig(const std::string& path) {
    Detail::EnterOperation("IpSecConfigImpl::CheckIKEConfig");
    ReadIkeConfig(path);
}

void IpSecConfigImpl::CopyIKEConfig(const std::string& path) {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::CopyIKEConfig");
    const std::string text = ReadIkeConfig(path);
    store.Change([&](Store::Transaction& t) {
        Detail::StoredObject<Detail::IpsecRecord> stored = Detail::FindSingleton<Detail::IpsecRecord>(t);
        Detail::IpsecRecord edited = stored.record;
        edited.ikeConfig = text;
        edited.ikeConfigSource = path;
        Detail::WriteSingleton(t, stored, edited);
    });
}

void IpSecConfigImpl::RestartIKEDaemons() {
    Store::HostStore& store = Detail::EnterOperation("IpSecConfigImpl::RestartIKEDaemons");
    const bool running = Util::PldCtl_Exec(kIkeRestart, true, true, false) == 0;
    store.Change([&](Store::Transaction& t) {
        Detail::StoredObject<Detail::IpsecRecord> stored = Detail::FindSingleton<Detail::IpsecRecord>(t);
        Detail::IpsecRecord edited = stored.record;
        edited.ikeDaemonsRunning = running;
        Detail::WriteSingleton(t, stored, edited);
    });
    if (!running) throw HostCtlException("Unable to restart the IKE daemons");
}

}  // namespace Network
}  // namespace PldCtl
