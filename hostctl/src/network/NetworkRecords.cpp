#include "network/NetworkRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<SystemRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("ipv6Enabled", &SystemRecord::ipv6Enabled),
            Field("maxPorts", &SystemRecord::maxPorts),
            Field("congestionControlAlgorithms", &SystemRecord::congestionControlAlgorithms));
    }
};
// clang-format on

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::SystemRecord);
