// The library's distributed switch objects, as far as the other rooms use
// them: a snapshot of the switch's name and UUID.
#pragma once

#include <memory>
#include <string>

#include "hostctl/network/dvs/DVSwitch.h"
#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Network {

class DVSwitchImpl : public HostCtl::Network::DVSwitch {
public:
    DVSwitchImpl(std::string name, std::string uuid) : name_(std::move(name)), uuid_(std::move(uuid)) {}
    ~DVSwitchImpl() override;

    std::string GetName() const override { return name_; }
    std::string GetUUID() const override { return uuid_; }

    // The switch of that name as the host stores it (one read), or null.
    static std::unique_ptr<HostCtl::Network::DVSwitch> Find(Store::HostStore& store, const std::string& name);

private:
    std::string name_;
    std::string uuid_;
};

}  // namespace Network
}  // namespace PldCtl
