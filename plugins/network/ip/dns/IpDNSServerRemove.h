#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip dns server remove
class IpDNSServerRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpDNSServerRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
