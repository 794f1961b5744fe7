#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip netstack set
class IpNetstackInstanceSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpNetstackInstanceSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
