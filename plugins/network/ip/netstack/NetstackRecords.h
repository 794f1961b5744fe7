// How the netstack commands show an instance.
#pragma once

#include "framework/MetaObj.h"
#include "hostctl/network/ip/NetstackInstance.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The record type of both netstack fetchers.
extern const char kNetstackRecord[];  // "NetstackInstance"

// The row of `netstack list`: "Key", "Name", "State".
void FillNetstackSummary(MetaObj::MetaStruct& record, const HostCtl::Network::NetstackInstance& instance);
// The row of `netstack get`: every setting, configured and in force.
// "Enabled" means the instance exists in the kernel.
void FillNetstackDetail(MetaObj::MetaStruct& record, const HostCtl::Network::NetstackInstance& instance);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
