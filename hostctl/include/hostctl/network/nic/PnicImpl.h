// The library's implementation of a physical NIC.
#pragma once

#include <string>

#include "hostctl/Export.h"
#include "hostctl/network/nic/Pnic.h"

namespace PldCtl {
namespace Network {

// A physical NIC, found by name.
class HOSTCTL_EXPORT PnicImpl : public virtual HostCtl::Network::Pnic {
public:
    explicit PnicImpl(const std::string& name);
    ~PnicImpl() override;

    // Whether the host has a physical NIC of that name.
    static bool IsValidPnic(const std::string& name);

    std::string GetName() const override;

private:
    std::string name_;
};

}  // namespace Network
}  // namespace PldCtl
