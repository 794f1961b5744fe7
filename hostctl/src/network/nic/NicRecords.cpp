#include "network/nic/NicRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<NicRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &NicRecord::name),
            Field("uplinkPortId", &NicRecord::uplinkPortId));
    }
};
// clang-format on

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::NicRecord);
