// How the distributed switch and LACP commands find the switches they work
// on, and how the LACP readers hold the LACP data a switch lends them.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "framework/CallSpec.h"
#include "hostctl/Lib.h"
#include "hostctl/network/dvs/DVSwitch.h"

namespace OrvixCli {
namespace NetworkNamespace {

using DVSwitchList = std::vector<std::unique_ptr<HostCtl::Network::DVSwitch>>;

// The distributed switch of that name, or null after reporting "Unable to
// find a DVSwitch with the name NAME". Throws HostCtlException as the
// library does.
std::unique_ptr<HostCtl::Network::DVSwitch> FindDVSwitch(const std::string& name, CallSpec::Output& output);

// The switches the LACP readers cover: the one the dvs option names, else
// every distributed switch of the host. Nothing, after reporting it, when
// the named switch does not exist or the host has none at all. Throws
// HostCtlException as the library does.
std::optional<DVSwitchList> SelectLacpSwitches(const CallSpec::Input& input, CallSpec::Output& output);

// Runs build(data) and then always hands `data` back through release(data),
// so the switch gets its LACP data back even when building fails. A
// HostCtlException from `build` is kept until then and raised again as a
// PldCtlException with the same message, naming `source` and `line` as its
// origin; the command's handler reports the message.
template <typename Data, typename Release, typename Build>
void BuildThenRelease(std::unique_ptr<Data> data, Release&& release, Build&& build, const char* source, int line) {
    std::optional<std::string> failure;
    try {
        std::forward<Build>(build)(static_cast<const Data&>(*data));
    } catch (const HostCtl::Lib::HostCtlException& e) {
        failure = e.GetMessage(0);
    }
    std::forward<Release>(release)(std::move(data));
    if (failure) throw PldCtl::Lib::PldCtlException(*failure, source, line);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
