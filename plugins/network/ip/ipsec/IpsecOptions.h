// How the IPsec commands read the options they share: the SPI, the address
// of an SA's end and the ports of an SP.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "framework/CallSpec.h"
#include "hostctl/Values.h"

namespace OrvixCli {
namespace NetworkNamespace {

// An SPI as a user types it: hexadecimal digits, optionally behind "0x" (or
// "0X") and leading blanks; reading stops at the first character that is not
// a hexadecimal digit. Nothing when the text does not start with a digit,
// starts with a minus sign, or names a number above 32 bits.
std::optional<std::uint32_t> ParseSpi(const std::string& text);

// The SPI given as `sa-spi`, or nothing after reporting "Check the input
// value for '--sa-spi'. Should be hex integer. Got TEXT".
std::optional<std::uint32_t> ReadSpi(const CallSpec::Input& input, CallSpec::Output& output);

// The address of an SA's source or destination: "any" is the unspecified
// address, any other text is parsed (throws HostCtlException on bad text).
HostCtl::Network::Ipv6Address SaEndAddress(const std::string& text);

// The port given as the int option `name`, or nothing after reporting
// "Check the input value for '--NAME'. Should be in range 0-65535. Got
// VALUE" when it is outside 0 to 65535.
std::optional<int> ReadPort(const CallSpec::Input& input, const std::string& name, CallSpec::Output& output);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
