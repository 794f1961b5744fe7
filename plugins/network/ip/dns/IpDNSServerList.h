#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip dns server list
class IpDNSServerList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpDNSServerList);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
