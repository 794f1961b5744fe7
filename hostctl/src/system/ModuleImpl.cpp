#include "hostctl/system/ModuleImpl.h"

#include "Operation.h"
#include "system/SystemRecords.h"

namespace PldCtl {
namespace Detail {

struct ModuleCache {
    // The module as last read; unset until first read or after a change.
    std::optional<ModuleRecord> module;
    std::chrono::steady_clock::time_point readAt;
};

}  // namespace Detail

namespace System {

using Detail::ModuleCache;
using Detail::ModuleRecord;
using Detail::StoredObject;
using Detail::SystemModulesRecord;
using HostCtl::Lib::HostCtlException;

namespace {

// The cached module, read again from the store when it is stale. A module
// the host does not know reads as one that is not loaded.
const ModuleRecord& Fresh(Store::HostStore& store, const std::string& name, std::chrono::milliseconds maxAge,
                          ModuleCache& cache) {
    const auto now = std::chrono::steady_clock::now();
    if (cache.module && now - cache.readAt <= maxAge) return *cache.module;
    const SystemModulesRecord system = Detail::GetSingleton<SystemModulesRecord>(store);
    const ModuleRecord* module = system.Find(name);
    cache.module = module ? *module : ModuleRecord{name, false, ""};
    cache.readAt = now;
    return *cache.module;
}

}  // namespace

ModuleImpl::ModuleImpl(const std::string& name, std::chrono::milliseconds maxAge)
    : name_(name), maxAge_(maxAge), cache_(std::make_shared<ModuleCache>()) {}
ModuleImpl::~ModuleImpl() = default;

bool ModuleImpl::IsLoaded() {
    Store::HostStore& store = Detail::EnterOperation("ModuleImpl::IsLoaded", name_);
    return Fresh(store, name_, maxAge_, *cache_).loaded;
}

std::string ModuleImpl::GetOptions() {
    Store::HostStore& store = Detail::EnterOperation("ModuleImpl::GetOptions", name_);
    const ModuleRecord& module = Fresh(store, name_, maxAge_, *cache_);
    return module.loaded ? module.options : std::string();
}

void ModuleImpl::Load(const std::string& options, bool reload) {
    Store::HostStore& store = Detail::EnterOperation("ModuleImpl::Load", name_);
    cache_->module.reset();
    store.Change([&](Store::Transaction& t) {
        StoredObject<SystemModulesRecord> stored = Detail::FindSingleton<SystemModulesRecord>(t);
        SystemModulesRecord edited = stored.record;
        ModuleRecord* module = edited.Find(name_);
        if (module && module->loaded && !reload) throw HostCtlException("Module " + name_ + " is already loaded");
        if (!module) {
            edited.modules.push_back(ModuleRecord{name_, false, ""});
            module = &edited.modules.back();
        }
        module->loaded = true;
        module->options = options;
        Detail::WriteSingleton(t, stored, edited);
    });
}

void ModuleImpl::Unload() {
    Store::HostStore& store = Detail::EnterOperation("ModuleImpl::Unload", name_);
    cache_->module.reset();
    store.Change([&](Store::Transaction& t) {
        StoredObject<SystemModulesRecord> stored = Detail::FindSingleton<SystemModulesRecord>(t);
        SystemModulesRecord edited = stored.record;
        ModuleRecord* module = edited.Find(name_);
        if (!module || !module->loaded) throw HostCtlException("Module " + name_ + " is not loaded");
        module->loaded = false;
        module->options.clear();
        Detail::WriteSingleton(t, stored, edited);
    });
}

}  // namespace System
}  // namespace PldCtl
