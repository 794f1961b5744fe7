// The host-control library's interface of one physical NIC. Objects are
// snapshots and belong to the caller.
#pragma once

#include <string>
#include "hostctl/Export.h"

namespace HostCtl {
namespace Network {

// A physical NIC.
class HOSTCTL_EXPORT Pnic {
public:
    virtual ~Pnic();
    virtual std::string GetName() const = 0;
};

}  // namespace Network
}  // namespace HostCtl
