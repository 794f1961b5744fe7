// One running world (a host process or a virtual machine) by its id.
#pragma once

#include <cstdint>
#include <string>

#include "hostctl/Export.h"

namespace PldCtl {
namespace Resource {

// Made from an id it never throws; the host is read by GetWorldName.
class HOSTCTL_EXPORT WorldImpl {
public:
    explicit WorldImpl(std::uint64_t id);
    virtual ~WorldImpl();

    std::uint64_t GetWorldId() const { return id_; }
    // The world's name; "" for a world the host does not have (one that
    // ended, or a port naming a world that never ran), as a world that has
    // no name. Throws HostCtl::Lib::HostCtlException only when the host
    // cannot be read (fault name "WorldImpl::GetWorldName", keyed by the
    // decimal id).
    virtual std::string GetWorldName() const;

private:
    std::uint64_t id_;
};

}  // namespace Resource
}  // namespace PldCtl
