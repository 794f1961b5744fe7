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
            Field("uplinks", &DvSwitchRecord::uplinks));
    }
};
// clang-format on

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::DvSwitchRecord);
