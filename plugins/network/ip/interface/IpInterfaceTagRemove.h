#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface tag remove
class IpInterfaceTagRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceTagRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
