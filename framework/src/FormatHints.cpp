// Reading a command's formatter hints. Every lookup is by exact key: names in
// hints are not trimmed, so a name with a stray blank simply matches nothing
// and the formatters fall back to their defaults instead of failing.
#include "framework/Format.h"

namespace AutoCli {

namespace {

const char kNoHeader[] = "<NONE>";

std::optional<std::string> Lookup(const std::map<std::string, std::string>& parameters, const std::string& key) {
    auto it = parameters.find(key);
    if (it == parameters.end()) return std::nullopt;
    return it->second;
}

}  // namespace

FormatHints::FormatHints(const std::map<std::string, std::string>& parameters) : parameters_(parameters) {}

const std::optional<std::vector<std::string>>& FormatHints::Fields(const std::string& type) const {
    auto cached = fields_.find(type);
    if (cached == fields_.end()) {
        std::optional<std::string> value = Lookup(parameters_, "fields:" + type);
        cached = fields_.emplace(type, value ? std::make_optional(SplitNames(*value)) : std::nullopt).first;
    }
    return cached->second;
}

const std::optional<std::string>& FormatHints::Header(const std::string& type) const {
    auto cached = headers_.find(type);
    if (cached == headers_.end()) cached = headers_.emplace(type, Lookup(parameters_, "header:" + type)).first;
    return cached->second;
}

bool FormatHints::HasNoHeader(const std::string& type) const {
    return Header(type) == std::string(kNoHeader);
}

std::optional<std::vector<std::string>> FormatHints::TableColumns(const std::string& type) const {
    // The hint for the type wins over the one for every type, even when it is
    // empty: a command can lift a general column list for one record type.
    std::optional<std::string> value = Lookup(parameters_, "table-columns:" + type);
    if (!value) value = Lookup(parameters_, "table-columns");
    if (!value || value->empty()) return std::nullopt;
    return SplitNames(*value);
}

std::string FormatHints::Unit(const std::string& type, const std::string& field) const {
    const std::string key = type + "." + field;
    auto cached = units_.find(key);
    if (cached == units_.end()) cached = units_.emplace(key, Lookup(parameters_, "units:" + key).value_or("")).first;
    return cached->second;
}

std::string JoinNames(const std::vector<std::string>& names, const std::string& separator) {
    std::string joined;
    for (const auto& name : names) joined += (joined.empty() ? "" : separator) + name;
    return joined;
}

std::vector<std::string> SplitNames(const std::string& text) {
    // Empty pieces ("a,,b", a trailing comma) name no field and are dropped.
    std::vector<std::string> names;
    std::string::size_type start = 0;
    while (start <= text.size()) {
        std::string::size_type comma = text.find(',', start);
        if (comma == std::string::npos) comma = text.size();
        if (comma > start) names.push_back(text.substr(start, comma - start));
        start = comma + 1;
    }
    return names;
}

}  // namespace AutoCli
