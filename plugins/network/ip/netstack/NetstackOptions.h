// The parameters the netstack commands share.
#pragma once

#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The parameters of a command whose first option names the instance: the
// required string `netstack` (short N).
boost::shared_ptr<CallSpec::InputSpec> NetstackKeyInput(const std::string& description);

// The congestion-control algorithms `--ccalgo` accepts: those the host
// offers, in its order, each described "Set NAME as the algorithm".
std::vector<CallSpec::ParameterConstraint::StringEnumValue> CongestionControlChoices();

}  // namespace NetworkNamespace
}  // namespace OrvixCli
