#include "hostctl/HostSession.h"

#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Lib {

void ReopenHost() {
    Store::HostStore::ResetDefault();
}

}  // namespace Lib
}  // namespace PldCtl
