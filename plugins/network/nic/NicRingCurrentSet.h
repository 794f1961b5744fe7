#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic ring current set
class NicRingCurrentSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicRingCurrentSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
