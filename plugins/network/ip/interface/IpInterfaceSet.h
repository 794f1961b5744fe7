#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface set
class IpInterfaceSet : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceSet);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
