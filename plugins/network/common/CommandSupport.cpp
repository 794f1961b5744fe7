#include "common/CommandSupport.h"

namespace OrvixCli {
namespace NetworkNamespace {

void DeclareParameter(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec, const std::string& name,
                      CallSpec::ParameterType type, const std::string& shortName, const std::string& description,
                      Required required, const boost::shared_ptr<CallSpec::ParameterConstraint>& constraint) {
    boost::shared_ptr<CallSpec::ParameterSpec> parameter = CallSpec::ParameterSpec::New(name, type);
    parameter->SetShortName(shortName);
    parameter->SetDescription(description);
    parameter->SetRequired(required);
    if (constraint) parameter->SetConstraint(constraint);
    inputSpec->AddParameter(parameter);
}

boost::shared_ptr<CallSpec::OutputSpec> OperationOutputSpec() {
    return OutputSpecOf(MetaObj::MetaBool::New());
}

boost::shared_ptr<CallSpec::OutputSpec> OutputSpecOf(const MetaObj::MetaObjectPtr& templ) {
    boost::shared_ptr<CallSpec::OutputSpec> outputSpec = CallSpec::OutputSpec::New();
    outputSpec->SetTemplate(templ);
    return outputSpec;
}

void Finish(const boost::shared_ptr<CallSpec::Output>& output, const MetaObj::MetaObjectPtr& result) {
    output->SetResult(result);
    output->Complete();
}

void FinishTrue(const boost::shared_ptr<CallSpec::Output>& output) {
    Finish(output, MetaObj::MetaBool::New(true));
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
