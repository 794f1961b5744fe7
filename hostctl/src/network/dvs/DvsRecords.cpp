#include "network/dvs/DvsRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<DvSwitchRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &DvSwitchRecord::name),
            Field("uuid", &DvSwitchRecord::uuid),
            Field("numPorts", &DvSwitchRecord::numPorts),
            Field("uplinks", &DvSwitchRecord::uplinks));
    }
};

template <>
struct RecordFields<DvPortRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("dvswitch", &DvPortRecord::dvswitch),
            Field("id", &DvPortRecord::id),
            Field("connectionId", &DvPortRecord::connectionId));
    }
};
// clang-format on

bool FitsJoinedKey(const std::string& part) {
    return part.find('|') == std::string::npos;
}

std::string DvPortKey(const std::string& dvswitch, const std::string& id) {
    return dvswitch + "|" + id;
}

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::DvSwitchRecord);
STORED_RECORD(PldCtl::Detail::DvPortRecord);
