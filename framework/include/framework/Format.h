// Rendering of command results. Every formatter takes the same value and the
// command's formatter hints; no command prints anything itself.
#pragma once

#include <map>
#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include "framework/Export.h"
#include "framework/MetaObj.h"

namespace AutoCli {

// The formatter hints a command sets with SetDefaultOutputParameter:
//   "fields:<Type>"            field names joined by "," - the fields shown, in order
//   "header:<Type>"            heading above each record; "%Field%" stands for a
//                              field's value; "<NONE>" means no heading
//   "table-columns:<Type>"     column names joined by "," (or "table-columns"
//                              for every type); empty means "no restriction"
//   "units:<Type>.<Field>"     a unit word printed after that field's value
// Hints that name a type or field the result does not have are ignored.
class AUTOCLI_EXPORT FormatHints {
public:
    FormatHints() = default;
    explicit FormatHints(const std::map<std::string, std::string>& parameters);

    // The "fields:" list of a record type, or nullopt when none was given.
    // Parsed once per type: a list of a thousand records asks a thousand times.
    const std::optional<std::vector<std::string>>& Fields(const std::string& type) const;
    // The "header:" template, or nullopt when none was given. "<NONE>" is
    // returned as is; HasNoHeader tells it apart.
    const std::optional<std::string>& Header(const std::string& type) const;
    bool HasNoHeader(const std::string& type) const;
    // Column names for a table of records of this type, or nullopt.
    std::optional<std::vector<std::string>> TableColumns(const std::string& type) const;
    // "" when the field has no unit.
    std::string Unit(const std::string& type, const std::string& field) const;

    const std::map<std::string, std::string>& Raw() const { return parameters_; }

private:
    std::map<std::string, std::string> parameters_;
    mutable std::map<std::string, std::optional<std::vector<std::string>>> fields_;
    // "type.field" -> unit, and type -> header, looked up once each.
    mutable std::map<std::string, std::string> units_;
    mutable std::map<std::string, std::optional<std::string>> headers_;
};

// Splits "a,b,c" into its names; an empty text gives no names.
AUTOCLI_EXPORT std::vector<std::string> SplitNames(const std::string& text);
// The names joined by `separator`: "a, b, c" by default.
AUTOCLI_EXPORT std::string JoinNames(const std::vector<std::string>& names, const std::string& separator = ", ");

class AUTOCLI_EXPORT Formatter {
public:
    virtual ~Formatter();
    virtual const char* Name() const = 0;
    // Renders a result. A null result, or a boolean made without a value,
    // renders as nothing.
    virtual void Render(const MetaObj::MetaObjectPtr& result, const FormatHints& hints, std::ostream& out) const = 0;
};

// The formatters by name: simple, table, json, xml, csv, keyvalue.
// FindFormatter returns null for an unknown name.
AUTOCLI_EXPORT const Formatter* FindFormatter(const std::string& name);
AUTOCLI_EXPORT std::vector<std::string> FormatterNames();

}  // namespace AutoCli
