// The host-control library's interface of one kernel IP interface.
#pragma once

#include "hostctl/Export.h"

namespace HostCtl {
namespace Network {

// A kernel IP interface.
class HOSTCTL_EXPORT PldNic {
public:
    static constexpr int MIN_MTU = 1280;
    static constexpr int MAX_MTU = 9000;

    virtual ~PldNic();
};

}  // namespace Network
}  // namespace HostCtl
