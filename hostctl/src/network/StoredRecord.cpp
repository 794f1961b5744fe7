#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

Store::Json ParseStored(const std::string& text) {
    try {
        return Store::Json::parse(text);
    } catch (const Store::Json::parse_error&) {
        throw Store::HostStore::Default().DamagedObjectError();
    }
}

}  // namespace Detail
}  // namespace PldCtl
