// Pieces every command of the plug-in is built from, kept in one place so the
// command files hold only what is their own: texts, parameters, steps.
#pragma once

#include <string>
#include <utility>

#include <boost/shared_ptr.hpp>

#include "framework/AutoCli.h"
#include "hostctl/Lib.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The framework's declaration vocabulary, so that a declaration reads
// `Required::No, IntRange(1, Portset::MAX_NUM_PORTS)`.
using CallSpec::IntEnum;
using CallSpec::IntRange;
using CallSpec::Required;
using CallSpec::StringEnum;
using CallSpec::StringRegex;

// Declares one parameter in one line, in the fixed order: ParameterSpec::New,
// SetShortName, SetDescription, SetRequired, SetConstraint (when there is
// one), AddParameter. The constraint comes from one of the factories above.
void DeclareParameter(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec, const std::string& name,
                      CallSpec::ParameterType type, const std::string& shortName, const std::string& description,
                      Required required,
                      const boost::shared_ptr<CallSpec::ParameterConstraint>& constraint =
                          boost::shared_ptr<CallSpec::ParameterConstraint>());

// The output declaration of a changing command: one boolean.
boost::shared_ptr<CallSpec::OutputSpec> OperationOutputSpec();
// The output declaration whose template is `templ`.
boost::shared_ptr<CallSpec::OutputSpec> OutputSpecOf(const MetaObj::MetaObjectPtr& templ);

// Sets `result` and completes the run.
void Finish(const boost::shared_ptr<CallSpec::Output>& output, const MetaObj::MetaObjectPtr& result);
// Sets the result true and completes the run.
void FinishTrue(const boost::shared_ptr<CallSpec::Output>& output);

// Runs `body`; a HostCtlException it throws is reported through SetError,
// its message behind `prefix`, and the run ends there without a result.
template <typename Body>
void ReportingHostErrors(const boost::shared_ptr<CallSpec::Output>& output, Body&& body,
                         const std::string& prefix = std::string()) {
    try {
        std::forward<Body>(body)();
    } catch (const HostCtl::Lib::HostCtlException& e) {
        output->SetError(prefix + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
