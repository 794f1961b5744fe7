// The host-control library's view of a distributed switch, as far as the
// other rooms use it.
#pragma once

#include <string>

#include "hostctl/Export.h"

namespace HostCtl {
namespace Network {

class HOSTCTL_EXPORT DVSwitch {
public:
    virtual ~DVSwitch();
    virtual std::string GetName() const = 0;
    // The identifier its DV ports are addressed by.
    virtual std::string GetUUID() const = 0;
};

}  // namespace Network
}  // namespace HostCtl
