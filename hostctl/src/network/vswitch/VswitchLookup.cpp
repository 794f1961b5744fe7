#include "network/vswitch/VswitchLookup.h"

#include <algorithm>
#include <string>
#include <vector>

#include "hostctl/Lib.h"
#include "hostctl/network/vswitch/VswitchTables.h"
#include "network/nic/NicRecords.h"
#include "orvixtext/Utf8.h"

namespace PldCtl {
namespace Detail {

using HostCtl::Lib::HostCtlException;

namespace {

constexpr std::size_t kMaxSwitchNameLength = 32;
constexpr std::size_t kMaxPortGroupNameLength = 64;

std::string MissingMessage(const VswitchRecord&, const std::string& name) {
    return HostCtl::Network::UnknownVirtualSwitchMessage(name);
}

std::string MissingMessage(const PortGroupRecord&, const std::string& name) {
    return HostCtl::Network::UnknownPortGroupMessage(name);
}

}  // namespace

template <typename Record>
StoredObject<Record> Require(Store::Transaction& t, const std::string& name) {
    std::optional<StoredObject<Record>> stored = Find<Record>(t, name);
    if (!stored) throw HostCtlException(MissingMessage(Record(), name));
    return std::move(*stored);
}

template StoredObject<VswitchRecord> Require<VswitchRecord>(Store::Transaction&, const std::string&);
template StoredObject<PortGroupRecord> Require<PortGroupRecord>(Store::Transaction&, const std::string&);

// Switch names are short words; they name tables' rows and appear in other
// objects, so no blanks or separators.
void CheckSwitchName(const std::string& name) {
    // ASCII only, whatever the locale.
    auto allowed = [](char c) {
        return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-' || c == '_' ||
               c == '.';
    };
    const bool fits =
        !name.empty() && name.size() <= kMaxSwitchNameLength && std::all_of(name.begin(), name.end(), allowed);
    if (!fits) {
        throw HostCtlException("Invalid virtual switch name '" + name + "': use 1 to " +
                               std::to_string(kMaxSwitchNameLength) + " letters, digits, '.', '-' or '_'");
    }
}

// Port group names may hold blanks ("VM Network") and any printable
// character, counted as characters, not bytes.
void CheckPortGroupName(const std::string& name) {
    const std::optional<std::size_t> length = Orvix::Text::PrintableLength(name);
    const bool fits =
        length && *length >= 1 && *length <= kMaxPortGroupNameLength && name.front() != ' ' && name.back() != ' ';
    if (!fits) {
        throw HostCtlException("Invalid port group name '" + name + "': use 1 to " +
                               std::to_string(kMaxPortGroupNameLength) +
                               " printable characters, not beginning or ending with a blank");
    }
}

PortGroupsBySwitch ListPortGroupsBySwitch(Store::Transaction& t) {
    PortGroupsBySwitch bySwitch;
    for (auto& portGroup : DecodeShared<PortGroupRecord>(t.ListText(PortGroupRecord::kSection))) {
        bySwitch[portGroup->vswitch].push_back(std::move(portGroup));
    }
    return bySwitch;
}

void ReleaseNic(Store::Transaction& t, const std::string& nic) {
    if (std::optional<StoredObject<NicRecord>> stored = Find<NicRecord>(t, nic)) {
        NicRecord released = stored->record;
        released.uplinkPortId = 0;
        Write(t, *stored, released);
    }
}

std::int64_t NextPortId(Store::Transaction& t, const std::vector<PortRecord>& ports) {
    // Each switch has a block of 2^24 ids; port ids are unsigned 32-bit.
    constexpr std::int64_t kPortBlock = std::int64_t(1) << 24;
    constexpr std::int64_t kLargestId = 0xFFFFFFFF;
    const auto taken = [&](std::int64_t id) { return t.GetText(PortRecord::kSection, std::to_string(id)).has_value(); };
    // The next id of the switch's own block, while it is free.
    std::int64_t id = 0;
    for (const PortRecord& port : ports) id = std::max(id, port.id);
    if (id > 0 && id < kLargestId && !taken(id + 1)) return id + 1;
    // Else a block after every id the host has.
    const std::int64_t fresh = (t.MaxIntegerKey(PortRecord::kSection) / kPortBlock + 1) * kPortBlock + 1;
    if (fresh <= kLargestId) return fresh;
    // Else the first block none of whose ids is in use: a host with ids near
    // the top may still have room lower down.
    std::vector<bool> used(static_cast<std::size_t>((kLargestId + 1) / kPortBlock), false);
    for (const std::string& key : t.ListKeys(PortRecord::kSection)) {
        const std::int64_t block = std::stoll(key) / kPortBlock;
        if (block >= 0 && block < static_cast<std::int64_t>(used.size())) used[static_cast<std::size_t>(block)] = true;
    }
    for (std::size_t block = 1; block < used.size(); ++block) {
        if (!used[block]) return static_cast<std::int64_t>(block) * kPortBlock + 1;
    }
    throw HostCtlException("The host has no free port ids left");
}

}  // namespace Detail
}  // namespace PldCtl
