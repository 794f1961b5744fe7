#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip netstack remove
class IpNetstackInstanceRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpNetstackInstanceRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
