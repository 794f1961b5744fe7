// The host's running worlds (processes and virtual machines).
#pragma once

#include <string>

#include "hostctl/Export.h"

namespace PldCtl {
namespace Resource {

class HOSTCTL_EXPORT ResourceInfoImpl {
public:
    ResourceInfoImpl();
    virtual ~ResourceInfoImpl();

    // The name of the world with that id; "" for a world the host does not
    // have (one that ended). Throws HostCtl::Lib::HostCtlException only when
    // the host cannot be read.
    virtual std::string GetWorldName(unsigned long long id);
};

}  // namespace Resource
}  // namespace PldCtl
