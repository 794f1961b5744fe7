#include "ip/netstack/NetstackRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::NetstackInstance;

const char kNetstackRecord[] = "NetstackInstance";

void FillNetstackSummary(MetaObj::MetaStruct& record, const NetstackInstance& instance) {
    record.SetField("Key", instance.GetKey());
    record.SetField("Name", instance.GetName());
    record.SetField("State", instance.GetState());
}

void FillNetstackDetail(MetaObj::MetaStruct& record, const NetstackInstance& instance) {
    const int state = instance.GetState();
    record.SetField("Key", instance.GetKey());
    record.SetField("Name", instance.GetName());
    record.SetField("Enabled", state == NetstackInstance::STATE_IN_KERNEL);
    record.SetField("Max Connections", instance.GetMaxConnections());
    record.SetField("Current Max Connections", instance.GetCurrentMaxConnections());
    record.SetField("Congestion Control Algorithm", instance.GetCongestionControlAlgorithm());
    record.SetField("IPv6 Enabled", instance.GetIpv6Enabled());
    record.SetField("Current IPv6 Enabled", instance.GetCurrentIpv6Enabled());
    record.SetField("State", state);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
