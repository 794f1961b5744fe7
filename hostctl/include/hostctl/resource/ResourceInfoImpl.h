// The host's running worlds (processes and virtual machines).
#pragma once

#include <string>
#include <unordered_map>

#include "hostctl/Export.h"

namespace PldCtl {
namespace Resource {

class HOSTCTL_EXPORT ResourceInfoImpl {
public:
    ResourceInfoImpl();
    virtual ~ResourceInfoImpl();

    // The name of the world with that id; "" for a world the host does not
    // have (one that ended). Throws HostCtl::Lib::HostCtlException only when
    // the host cannot be read. A name read once is kept by this object, so
    // naming the owners of thousands of connections reads each world once.
    virtual std::string GetWorldName(unsigned long long id);

private:
    std::unordered_map<unsigned long long, std::string> names_;
};

}  // namespace Resource
}  // namespace PldCtl
