#include "resource/WorldRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<WorldRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("id", &WorldRecord::id),
            Field("name", &WorldRecord::name),
            Field("kind", &WorldRecord::kind));
    }
};
// clang-format on

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::WorldRecord);
