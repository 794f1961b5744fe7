#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip interface remove
class IpInterfaceRemove : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpInterfaceRemove);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
