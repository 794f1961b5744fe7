#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network ip dns search list
class IpDNSSearchList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(IpDNSSearchList);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
