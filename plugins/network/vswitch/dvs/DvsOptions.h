// What the distributed switch and LACP commands share besides lookups: the
// dvs option of the three LACP readers, the load-balance words, the LAG mode
// words, the names of the LACP state bits and the partner age format.
#pragma once

#include <cstdint>
#include <string>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The parameters of the three LACP readers: the optional dvs (short s).
boost::shared_ptr<CallSpec::InputSpec> LacpReaderInput();

// The word of a LAG's load-balance value ("None" for 0, "Src portID" for
// 20). A value the table has no word for is shown as its decimal number.
std::string LoadBalanceText(std::int64_t value);

// A LAG's mode as the configuration shows it: "Active" for 1, "Passive" for
// 2, "None" for any other mode.
std::string LagConfigModeText(int mode);
// A LAG's mode as the status shows it: "Passive" for 2, "Active" for any
// other mode (a LAG whose mode is none still runs the protocol actively).
std::string LagStatusModeText(int mode);

// An LACP actor or partner state byte as the names of its set bits, from
// bit 0 to bit 7, each followed by a comma: 0x3D gives "ACT,AGG,SYN,COL,DIST,".
// A zero byte gives an empty text.
std::string PortStateNames(std::uint8_t state);

// The partner age, seconds since its last LACPDU, as hours, minutes and
// seconds separated by colons, each at least two digits: 3725 gives
// "01:02:05". Hours are not folded into days, so they may take more digits.
std::string LacpAgeText(std::uint64_t seconds);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
