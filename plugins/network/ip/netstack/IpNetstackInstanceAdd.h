#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip netstack add
class IpNetstackInstanceAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpNetstackInstanceAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
