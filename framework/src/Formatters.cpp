// The formatters by name. Each one's work lives in format/; here they get
// the names users pass to --formatter, and the one rule they all share: a
// result that is absent, or a scalar made without a value, prints nothing.
#include "format/Common.h"

namespace AutoCli {

namespace {

class NamedFormatter final : public Formatter {
public:
    using WriteFunction = void (*)(const MetaObj::MetaObject&, const FormatHints&, std::ostream&);

    NamedFormatter(const char* name, WriteFunction write) : name_(name), write_(write) {}

    const char* Name() const override { return name_; }

    void Render(const MetaObj::MetaObjectPtr& result, const FormatHints& hints, std::ostream& out) const override {
        if (Formatting::IsPresent(result)) write_(*result, hints, out);
    }

private:
    const char* name_;
    WriteFunction write_;
};

const std::vector<NamedFormatter>& AllFormatters() {
    static const std::vector<NamedFormatter> formatters{
        {"simple", Formatting::WriteSimple}, {"table", Formatting::WriteTable}, {"json", Formatting::WriteJson},
        {"xml", Formatting::WriteXml},       {"csv", Formatting::WriteCsv},     {"keyvalue", Formatting::WriteKeyValue},
    };
    return formatters;
}

}  // namespace

Formatter::~Formatter() = default;

const Formatter* FindFormatter(const std::string& name) {
    for (const auto& formatter : AllFormatters()) {
        if (name == formatter.Name()) return &formatter;
    }
    return nullptr;
}

std::vector<std::string> FormatterNames() {
    std::vector<std::string> names;
    for (const auto& formatter : AllFormatters()) names.push_back(formatter.Name());
    return names;
}

}  // namespace AutoCli
