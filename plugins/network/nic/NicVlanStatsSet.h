#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic vlan stats set
class NicVlanStatsSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicVlanStatsSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
