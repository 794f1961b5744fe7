#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic software set
class NicSoftwareSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicSoftwareSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
