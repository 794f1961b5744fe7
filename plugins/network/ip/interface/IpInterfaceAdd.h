#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface add
class IpInterfaceAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
