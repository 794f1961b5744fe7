// How the IPsec listings show what the library stores: codes through the
// library's display tables, SPIs in hexadecimal and lifetimes in hours,
// minutes and seconds.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace OrvixCli {
namespace NetworkNamespace {

// "1h 2m 5s ": each of hours, minutes and seconds that is not zero, with its
// letter and a blank after it; "infinite" for 0 seconds.
std::string ConvertToHrsMinsAndSecs(unsigned long long seconds);

// The entry of `table` for `code`; "" for a code outside the table, so that
// a code the host stores but no table names shows as nothing.
std::string DisplayWord(const std::vector<std::string>& table, int code);

// "0x" and the SPI in lower-case hexadecimal without leading zeros.
std::string SpiText(std::uint32_t spi);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
