#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic up
class NicUp : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicUp);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
