#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface tag add
class IpInterfaceTagAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceTagAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
