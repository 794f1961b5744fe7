// Operations whose implementation is still to come.
#pragma once

#include "hostctl/Lib.h"

namespace PldCtl {
namespace Detail {

[[noreturn]] inline void NotAvailableYet(const char* operation) {
    throw HostCtl::Lib::HostCtlException(std::string(operation) + " is not available yet");
}

}  // namespace Detail
}  // namespace PldCtl
