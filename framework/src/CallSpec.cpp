#include "framework/CallSpec.h"

#include <stdexcept>

#include <regex>

namespace CallSpec {

const char* ParameterTypeName(ParameterType type) {
    switch (type) {
        case PARAM_STRING:
            return "string";
        case PARAM_INT:
            return "long";
        case PARAM_BOOL:
            return "bool";
        case PARAM_FLAG:
            return "flag";
    }
    return "unknown";
}

boost::shared_ptr<ParameterConstraint> ParameterConstraint::New(ParameterConstraintType type) {
    if (type < CONSTRAINT_INT_RANGE || type > CONSTRAINT_STRING_REGEX) {
        throw std::invalid_argument("ParameterConstraint::New: unknown constraint type " + std::to_string(type));
    }
    return boost::shared_ptr<ParameterConstraint>(new ParameterConstraint(type));
}

void ParameterConstraint::SetIntRange(std::int64_t min, std::int64_t max) {
    if (min > max) {
        throw std::invalid_argument("ParameterConstraint::SetIntRange: minimum " + std::to_string(min) +
                                    " is above maximum " + std::to_string(max));
    }
    min_ = min;
    max_ = max;
}

void ParameterConstraint::AddIntEnum(std::int64_t value) {
    intEnum_.push_back(value);
}

void ParameterConstraint::AddStringEnum(const std::string& value, const std::string& description) {
    stringEnum_.push_back({value, description});
}

void ParameterConstraint::SetStringRegex(const std::string& pattern) {
    try {
        std::regex check(pattern);
    } catch (const std::regex_error& e) {
        throw std::invalid_argument("ParameterConstraint::SetStringRegex: bad pattern '" + pattern + "': " + e.what());
    }
    regex_ = pattern;
}

boost::shared_ptr<ParameterConstraint> IntRange(std::int64_t min, std::int64_t max) {
    boost::shared_ptr<ParameterConstraint> constraint = ParameterConstraint::New(CONSTRAINT_INT_RANGE);
    constraint->SetIntRange(min, max);
    return constraint;
}

boost::shared_ptr<ParameterConstraint> IntEnum(const std::vector<std::int64_t>& values) {
    if (values.empty()) throw std::invalid_argument("IntEnum: no values");
    boost::shared_ptr<ParameterConstraint> constraint = ParameterConstraint::New(CONSTRAINT_INT_ENUM);
    for (std::int64_t value : values) constraint->AddIntEnum(value);
    return constraint;
}

boost::shared_ptr<ParameterConstraint> StringEnum(const std::vector<ParameterConstraint::StringEnumValue>& values) {
    if (values.empty()) throw std::invalid_argument("StringEnum: no values");
    boost::shared_ptr<ParameterConstraint> constraint = ParameterConstraint::New(CONSTRAINT_STRING_ENUM);
    for (const ParameterConstraint::StringEnumValue& value : values) {
        constraint->AddStringEnum(value.value, value.description);
    }
    return constraint;
}

boost::shared_ptr<ParameterConstraint> StringRegex(const std::string& pattern) {
    boost::shared_ptr<ParameterConstraint> constraint = ParameterConstraint::New(CONSTRAINT_STRING_REGEX);
    constraint->SetStringRegex(pattern);
    return constraint;
}

boost::shared_ptr<ParameterSpec> ParameterSpec::New(const std::string& name, ParameterType type) {
    if (name.empty()) throw std::invalid_argument("ParameterSpec::New: empty parameter name");
    if (type < PARAM_STRING || type > PARAM_FLAG) {
        throw std::invalid_argument("ParameterSpec::New: unknown parameter type for '" + name + "'");
    }
    return boost::shared_ptr<ParameterSpec>(new ParameterSpec(name, type));
}

void ParameterSpec::SetShortName(const std::string& letter) {
    if (letter.size() != 1 || letter[0] == '-') {
        throw std::invalid_argument("ParameterSpec::SetShortName: '" + letter + "' is not one letter (parameter '" +
                                    name_ + "')");
    }
    shortName_ = letter;
}

void ParameterSpec::SetShortName(char letter) {
    SetShortName(std::string(1, letter));
}

boost::shared_ptr<InputSpec> InputSpec::New() {
    return boost::shared_ptr<InputSpec>(new InputSpec());
}

void InputSpec::AddParameter(const boost::shared_ptr<ParameterSpec>& parameter) {
    if (!parameter) throw std::invalid_argument("InputSpec::AddParameter: null parameter");
    if (FindByName(parameter->GetName())) {
        throw std::invalid_argument("InputSpec::AddParameter: parameter '" + parameter->GetName() + "' declared twice");
    }
    if (!parameter->GetShortName().empty() && FindByShortName(parameter->GetShortName())) {
        throw std::invalid_argument("InputSpec::AddParameter: short name '" + parameter->GetShortName() + "' of '" +
                                    parameter->GetName() + "' is taken");
    }
    parameters_.push_back(parameter);
}

boost::shared_ptr<ParameterSpec> InputSpec::FindByName(const std::string& name) const {
    for (const auto& p : parameters_) {
        if (p->GetName() == name) return p;
    }
    return boost::shared_ptr<ParameterSpec>();
}

boost::shared_ptr<ParameterSpec> InputSpec::FindByShortName(const std::string& letter) const {
    for (const auto& p : parameters_) {
        if (p->GetShortName() == letter) return p;
    }
    return boost::shared_ptr<ParameterSpec>();
}

boost::shared_ptr<OutputSpec> OutputSpec::New() {
    return boost::shared_ptr<OutputSpec>(new OutputSpec());
}

boost::shared_ptr<Input> Input::New() {
    return boost::shared_ptr<Input>(new Input());
}

bool Input::IsSet(const std::string& name) const {
    return values_.count(name) != 0;
}

std::string Input::GetString(const std::string& name) const {
    auto it = values_.find(name);
    return it == values_.end() ? std::string() : it->second.text;
}

std::int64_t Input::GetInt(const std::string& name) const {
    auto it = values_.find(name);
    return it == values_.end() ? 0 : it->second.intValue;
}

bool Input::GetBool(const std::string& name) const {
    auto it = values_.find(name);
    return it != values_.end() && it->second.boolValue;
}

bool Input::GetFlag(const std::string& name) const {
    return GetBool(name);
}

void Input::SetString(const std::string& name, const std::string& text) {
    values_[name] = Value{text, 0, false};
}

void Input::SetInt(const std::string& name, const std::string& text, std::int64_t value) {
    values_[name] = Value{text, value, false};
}

void Input::SetBool(const std::string& name, const std::string& text, bool value) {
    values_[name] = Value{text, 0, value};
}

void Input::SetFlag(const std::string& name) {
    values_[name] = Value{"", 0, true};
}

boost::shared_ptr<Output> Output::New() {
    return boost::shared_ptr<Output>(new Output());
}

void Output::SetError(const std::string& message) {
    errors_.push_back(message);
}

CallTarget::~CallTarget() = default;

}  // namespace CallSpec
