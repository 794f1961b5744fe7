// The CDP status words of a standard switch. A word's position in the table
// is the index the switch's CDP setter takes, so the option's choices and the
// value written can never drift apart.
#pragma once

#include <array>
#include <string>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The index of a CDP status word. Any text that is not one of the first
// three words means "both", the last entry.
int CdpStatusIndex(const std::string& word);

// The string enum of the cdp-status option: every word, in table order, each
// with its own description.
boost::shared_ptr<CallSpec::ParameterConstraint> CdpStatusConstraint();

}  // namespace NetworkNamespace
}  // namespace OrvixCli
