#include "network/nic/NicRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

template <>
struct RecordFields<NicRecord> {
    static constexpr auto kAll =
        std::make_tuple(Field("name", &NicRecord::name), Field("uplinkPortId", &NicRecord::uplinkPortId));
};

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::NicRecord);
