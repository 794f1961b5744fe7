// A kernel module of the host, by name.
#pragma once

#include <chrono>
#include <memory>
#include <string>

#include "hostctl/Export.h"

namespace PldCtl {
namespace Detail {
struct ModuleCache;
}  // namespace Detail

namespace System {

// The module's data (whether it is loaded, with which options) is read from
// the host on first use and cached in this object. The cache goes stale
// when this object loads or unloads the module and when it is older than
// `maxAge`, so that a long-lived object sees another program's change
// within that time; IsLoaded and GetOptions read the host again before
// answering from stale data. Load and Unload always decide on the module's
// state as stored at that moment, in one transaction. Operations throw
// HostCtl::Lib::HostCtlException.
class HOSTCTL_EXPORT ModuleImpl {
public:
    static constexpr std::chrono::milliseconds kDefaultMaxAge{1000};

    explicit ModuleImpl(const std::string& name, std::chrono::milliseconds maxAge = kDefaultMaxAge);
    virtual ~ModuleImpl();

    const std::string& GetName() const { return name_; }
    virtual bool IsLoaded();
    // The options the module was loaded with; "" when it is not loaded.
    virtual std::string GetOptions();
    // Loads the module with these options. A module loaded already is
    // refused ("Module NAME is already loaded") unless `reload` is true: then
    // it is loaded again with the new options.
    virtual void Load(const std::string& options, bool reload);
    // Refuses a module that is not loaded ("Module NAME is not loaded").
    virtual void Unload();

private:
    std::string name_;
    std::chrono::milliseconds maxAge_;
    std::shared_ptr<Detail::ModuleCache> cache_;
};

}  // namespace System
}  // namespace PldCtl
