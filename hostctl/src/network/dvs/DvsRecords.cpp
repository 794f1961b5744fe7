#include "network/dvs/DvsRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

template <>
struct RecordFields<DvSwitchRecord> {
    static constexpr auto kAll =
        std::make_tuple(Field("name", &DvSwitchRecord::name), Field("uplinks", &DvSwitchRecord::uplinks));
};

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::DvSwitchRecord);
