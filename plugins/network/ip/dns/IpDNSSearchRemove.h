#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip dns search remove
class IpDNSSearchRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpDNSSearchRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
