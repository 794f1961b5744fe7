// What every library operation does first: find the host's store and give an
// injected fault for this operation the chance to fire.
#pragma once

#include <string>

#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Detail {

// `operation` is the name faults are injected under ("Class::Operation"),
// `key` the object the operation works on, if any.
inline Store::HostStore& EnterOperation(const char* operation, const std::string& key = std::string()) {
    Store::HostStore& store = Store::HostStore::Default();
    store.CheckFault(operation, key);
    return store;
}

}  // namespace Detail
}  // namespace PldCtl
