// What every library operation does first: find the host's store and give an
// injected fault for this operation the chance to fire.
#pragma once

#include <string>

#include "hostctl/Lib.h"
#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Detail {

// `operation` is the name faults are injected under ("Class::Operation"),
// `key` the object the operation works on, if any. A fault that fires is the
// operation's own failure: a HostCtlException with the fault's message.
inline Store::HostStore& EnterOperation(const char* operation, const std::string& key = std::string()) {
    Store::HostStore& store = Store::HostStore::Default();
    try {
        store.CheckFault(operation, key);
    } catch (const Store::InjectedFault& fault) {
        throw HostCtl::Lib::HostCtlException(fault.what());
    }
    return store;
}

}  // namespace Detail
}  // namespace PldCtl
