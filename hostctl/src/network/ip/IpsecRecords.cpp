#include "network/ip/IpsecRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<IpsecRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("ikeConfigPath", &IpsecRecord::ikeConfigPath),
            Field("ikeConfig", &IpsecRecord::ikeConfig),
            Field("ikeConfigSource", &IpsecRecord::ikeConfigSource),
            Field("ikeDaemonsRunning", &IpsecRecord::ikeDaemonsRunning));
    }
};

template <>
struct RecordFields<SaRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &SaRecord::name),
            Field("auto", &SaRecord::automatic),
            Field("source", &SaRecord::source),
            Field("destination", &SaRecord::destination),
            Field("spi", &SaRecord::spi),
            Field("mode", &SaRecord::mode),
            Field("encryptionAlgorithm", &SaRecord::encryptionAlgorithm),
            Field("encryptionKey", &SaRecord::encryptionKey),
            Field("integrityAlgorithm", &SaRecord::integrityAlgorithm),
            Field("integrityKey", &SaRecord::integrityKey),
            Field("state", &SaRecord::state),
            Field("lifetime", &SaRecord::lifetime));
    }
};

template <>
struct RecordFields<SpRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &SpRecord::name),
            Field("saName", &SpRecord::saName),
            Field("source", &SpRecord::source),
            Field("destination", &SpRecord::destination),
            Field("sourcePort", &SpRecord::sourcePort),
            Field("destinationPort", &SpRecord::destinationPort),
            Field("protocol", &SpRecord::protocol),
            Field("direction", &SpRecord::direction),
            Field("action", &SpRecord::action),
            Field("mode", &SpRecord::mode));
    }
};
// clang-format on

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::IpsecRecord);
STORED_RECORD(PldCtl::Detail::SaRecord);
STORED_RECORD(PldCtl::Detail::SpRecord);
