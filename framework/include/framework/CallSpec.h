// What a command declares about itself (its parameters and the shape of its
// output) and what it exchanges with the framework when it runs (its parsed
// arguments and its outcome).
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include <boost/enable_shared_from_this.hpp>
#include <boost/shared_ptr.hpp>

#include "framework/Export.h"
#include "framework/MetaObj.h"

namespace CallSpec {

enum ParameterType {
    PARAM_STRING = 0,
    PARAM_INT = 1,
    PARAM_BOOL = 2,  // takes true or false
    PARAM_FLAG = 3,  // takes no value
};

AUTOCLI_EXPORT const char* ParameterTypeName(ParameterType type);

enum ParameterConstraintType {
    CONSTRAINT_INT_RANGE = 1,
    CONSTRAINT_INT_ENUM = 2,
    CONSTRAINT_STRING_ENUM = 3,
    CONSTRAINT_STRING_REGEX = 4,
};

// A check attached to a parameter. The framework applies it before the
// command runs and describes it in help, so the text and the check agree.
class AUTOCLI_EXPORT ParameterConstraint {
public:
    struct StringEnumValue {
        std::string value;
        std::string description;
    };

    static boost::shared_ptr<ParameterConstraint> New(ParameterConstraintType type);

    ParameterConstraintType GetType() const { return type_; }

    void SetIntRange(std::int64_t min, std::int64_t max);
    void AddIntEnum(std::int64_t value);
    void AddStringEnum(const std::string& value, const std::string& description);
    // A pattern the whole value must match (ECMAScript syntax). Throws
    // std::invalid_argument when the pattern does not compile.
    void SetStringRegex(const std::string& pattern);

    std::int64_t GetMin() const { return min_; }
    std::int64_t GetMax() const { return max_; }
    const std::vector<std::int64_t>& GetIntEnum() const { return intEnum_; }
    const std::vector<StringEnumValue>& GetStringEnum() const { return stringEnum_; }
    const std::string& GetStringRegex() const { return regex_; }

private:
    explicit ParameterConstraint(ParameterConstraintType type) : type_(type) {}
    ParameterConstraintType type_;
    std::int64_t min_ = 0;
    std::int64_t max_ = 0;
    std::vector<std::int64_t> intEnum_;
    std::vector<StringEnumValue> stringEnum_;
    std::string regex_;
};

// Whether a command line must give a parameter. A declaration names it, so
// that it reads as what it means rather than as a bare true or false.
enum class Required : bool { No = false, Yes = true };

// The constraint vocabulary every declaration builds its checks from, one
// factory a kind. Each returns a new constraint that the caller attaches
// with ParameterSpec::SetConstraint. They throw std::invalid_argument for a
// constraint no value could meet or no check could apply: an IntRange whose
// min is above its max, an enum without values, a pattern that does not
// compile.
AUTOCLI_EXPORT boost::shared_ptr<ParameterConstraint> IntRange(std::int64_t min, std::int64_t max);
AUTOCLI_EXPORT boost::shared_ptr<ParameterConstraint> IntEnum(const std::vector<std::int64_t>& values);
// The values in the order help lists them, each with its own description
// (which %FULLENUM% shows after the value; it may be empty).
AUTOCLI_EXPORT boost::shared_ptr<ParameterConstraint> StringEnum(
    const std::vector<ParameterConstraint::StringEnumValue>& values);
// A pattern the whole value must match (ECMAScript syntax).
AUTOCLI_EXPORT boost::shared_ptr<ParameterConstraint> StringRegex(const std::string& pattern);

class AUTOCLI_EXPORT ParameterSpec {
public:
    static boost::shared_ptr<ParameterSpec> New(const std::string& name, ParameterType type);

    // One letter; throws std::invalid_argument otherwise.
    void SetShortName(const std::string& letter);
    void SetShortName(char letter);
    void SetDescription(const std::string& description) { description_ = description; }
    void SetRequired(bool required) { required_ = required; }
    void SetRequired(Required required) { required_ = required == Required::Yes; }
    void SetConstraint(const boost::shared_ptr<ParameterConstraint>& constraint) { constraint_ = constraint; }

    const std::string& GetName() const { return name_; }
    ParameterType GetType() const { return type_; }
    const std::string& GetShortName() const { return shortName_; }
    const std::string& GetDescription() const { return description_; }
    bool IsRequired() const { return required_; }
    const boost::shared_ptr<ParameterConstraint>& GetConstraint() const { return constraint_; }

private:
    ParameterSpec(const std::string& name, ParameterType type) : name_(name), type_(type) {}
    std::string name_;
    ParameterType type_;
    std::string shortName_;
    std::string description_;
    bool required_ = false;
    boost::shared_ptr<ParameterConstraint> constraint_;
};

class AUTOCLI_EXPORT InputSpec {
public:
    static boost::shared_ptr<InputSpec> New();

    // Throws std::invalid_argument when the long or short name is taken.
    void AddParameter(const boost::shared_ptr<ParameterSpec>& parameter);

    const std::vector<boost::shared_ptr<ParameterSpec>>& GetParameters() const { return parameters_; }
    boost::shared_ptr<ParameterSpec> FindByName(const std::string& name) const;
    boost::shared_ptr<ParameterSpec> FindByShortName(const std::string& letter) const;

private:
    InputSpec() = default;
    std::vector<boost::shared_ptr<ParameterSpec>> parameters_;
};

class AUTOCLI_EXPORT OutputSpec {
public:
    static boost::shared_ptr<OutputSpec> New();

    void SetTemplate(const MetaObj::MetaObjectPtr& templ) { template_ = templ; }
    const MetaObj::MetaObjectPtr& GetTemplate() const { return template_; }

private:
    OutputSpec() = default;
    MetaObj::MetaObjectPtr template_;
};

// The arguments of one run, already parsed and checked. A parameter that was
// not given reads as "", 0 or false. GetString of an int parameter returns
// the text as the user typed it.
class AUTOCLI_EXPORT Input {
public:
    static boost::shared_ptr<Input> New();

    bool IsSet(const std::string& name) const;
    std::string GetString(const std::string& name) const;
    std::int64_t GetInt(const std::string& name) const;
    bool GetBool(const std::string& name) const;
    bool GetFlag(const std::string& name) const;

    // Filled by the parser: the text as typed, and the checked value.
    void SetString(const std::string& name, const std::string& text);
    void SetInt(const std::string& name, const std::string& text, std::int64_t value);
    void SetBool(const std::string& name, const std::string& text, bool value);
    void SetFlag(const std::string& name);

private:
    Input() = default;
    struct Value {
        std::string text;
        std::int64_t intValue = 0;
        bool boolValue = false;
    };
    std::map<std::string, Value> values_;
};

// The outcome of one run: any number of error messages, in the order they
// were reported, and at most one result.
class AUTOCLI_EXPORT Output {
public:
    static boost::shared_ptr<Output> New();

    void SetError(const std::string& message);
    bool HasError() const { return !errors_.empty(); }
    void SetResult(const MetaObj::MetaObjectPtr& result) { result_ = result; }
    void Complete() { ++completeCalls_; }

    const std::vector<std::string>& GetErrors() const { return errors_; }
    const MetaObj::MetaObjectPtr& GetResult() const { return result_; }
    bool IsComplete() const { return completeCalls_ > 0; }
    int CompleteCalls() const { return completeCalls_; }

private:
    Output() = default;
    std::vector<std::string> errors_;
    MetaObj::MetaObjectPtr result_;
    int completeCalls_ = 0;
};

// Something the framework can call: it declares its input and output and
// runs once per invocation. The public members are the framework's entry
// points; the *Internal hooks are what a command implements.
class AUTOCLI_EXPORT CallTarget {
public:
    virtual ~CallTarget();

    boost::shared_ptr<InputSpec> GetInputSpec() { return GetInputSpecInternal(); }
    boost::shared_ptr<OutputSpec> GetOutputSpec() { return GetOutputSpecInternal(); }
    void Execute(const boost::shared_ptr<Input>& input, const boost::shared_ptr<Output>& output) {
        ExecuteInternal(input, output);
    }

protected:
    virtual boost::shared_ptr<InputSpec> GetInputSpecInternal() = 0;
    virtual boost::shared_ptr<OutputSpec> GetOutputSpecInternal() = 0;
    virtual void ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) = 0;
};

}  // namespace CallSpec
