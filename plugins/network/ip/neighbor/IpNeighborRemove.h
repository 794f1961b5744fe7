#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip neighbor remove
class IpNeighborRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpNeighborRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
