#include "network/NetworkRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

template <>
struct RecordFields<SystemRecord> {
    static constexpr auto kAll =
        std::make_tuple(Field("ipv6Enabled", &SystemRecord::ipv6Enabled), Field("maxPorts", &SystemRecord::maxPorts));
};

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::SystemRecord);
