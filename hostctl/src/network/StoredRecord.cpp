#include "network/RecordCodec.h"

#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Detail {

namespace Codec {

simdjson::ondemand::document& Iterate(std::string_view text) {
    // One parser and one buffer a thread, reused: a listing decodes
    // thousands of objects without allocating for each.
    thread_local simdjson::ondemand::parser parser;
    thread_local std::string padded;
    thread_local simdjson::ondemand::document document;
    padded.assign(text);
    padded.append(simdjson::SIMDJSON_PADDING, ' ');
    if (parser.iterate(padded.data(), text.size(), padded.size()).get(document)) ThrowDamaged();
    return document;
}

void ThrowDamaged() {
    throw Store::HostStore::Default().DamagedObjectError();
}

}  // namespace Codec

Store::Json ParseStored(const std::string& text) {
    try {
        return Store::Json::parse(text);
    } catch (const Store::Json::parse_error&) {
        Codec::ThrowDamaged();
    }
}

}  // namespace Detail
}  // namespace PldCtl
