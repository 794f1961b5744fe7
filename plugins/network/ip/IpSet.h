#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip set
class IpSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
