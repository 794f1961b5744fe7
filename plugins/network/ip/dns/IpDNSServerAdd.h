#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip dns server add
class IpDNSServerAdd : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpDNSServerAdd);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
