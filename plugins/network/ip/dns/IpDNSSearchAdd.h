#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip dns search add
class IpDNSSearchAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpDNSSearchAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
