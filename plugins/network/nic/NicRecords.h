// How the NIC commands turn the library's codes into words, fill the
// inventory row that `nic list` and `sriovnic list` share, and lay out the
// hexadecimal rows of the register and EEPROM dumps.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "framework/CallSpec.h"
#include "framework/MetaObj.h"
#include "hostctl/network/nic/Pnic.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The input of nic get, up, down and set: the required `nic-name`.
boost::shared_ptr<CallSpec::InputSpec> NicNameInput();

// The ports a user may select with `nic set --port`, in the order help lists
// them, each with its description.
std::vector<CallSpec::ParameterConstraint::StringEnumValue> PortChoices();
// The port code of a `--port` word, or nothing for a word no port has.
std::optional<int> PortCodeOfWord(const std::string& word);
// "TP", "FIBRE", ...: how "Supported Ports" names a port; "UNKNOWN" for a
// code no port has.
std::string SupportedPortWord(int code);
// "Twisted Pair", "FIBRE", ...: how "Cable Type" names a port; empty for a
// code no port has.
std::string CableTypeWord(int code);

// "internal" or "external"; empty for any other code.
std::string TransceiverWord(int code);
// The code of a `--transceiver-type` word, or nothing for another word.
std::optional<int> TransceiverCodeOfWord(const std::string& word);

// How "Wakeon" names a wake-on-LAN mode; "None" for a value no mode has.
std::string WakeOnWord(int mode);
// The mode a `--wake-on-lan` letter enables, or nothing for any other letter
// (`d` among them).
std::optional<HostCtl::Network::WakeOnMode> WakeOnModeOfLetter(char letter);

// "1000baseT/Full": an advertised link mode as "Advertised Link Modes" shows
// it; a duplex code that names no duplex leaves the part after the "/" empty.
std::string LinkModeText(const HostCtl::Network::LinkMode& mode);

// Which columns an inventory row has: `nic list` also shows the
// administrative state and the link status, `sriovnic list` does not.
enum class InventoryColumns { Nic, SriovNic };

// Fills the inventory row of `pnic` in the order of the output. A NIC
// without a PCI device shows "Pseudo" and the description "Unknown Unknown".
void FillInventoryRow(MetaObj::MetaStruct& record, const HostCtl::Network::Pnic& pnic, InventoryColumns columns);

// One row of a dump as the dump commands show it: the offset of its first
// entry and its entries, both in lowercase hexadecimal.
struct DumpRow {
    std::string offset;
    std::string value;
};

// Lowercase hexadecimal without prefix, at least `width` digits (padded with
// "0" on the left), a wider value in full.
std::string HexText(std::uint64_t value, int width);

// The register dump in rows of sixteen words; a row's offset counts words.
std::vector<DumpRow> RegisterRows(const std::vector<std::uint32_t>& words);

// The EEPROM bytes read from byte `offset` (not negative), in rows aligned to
// sixteen-byte boundaries of the EEPROM: the first row begins with one blank
// group for each position before `offset`. No bytes give no rows.
std::vector<DumpRow> EepromRows(std::uint64_t offset, const std::vector<std::uint8_t>& bytes);

// Appends one `type` record a row to `records`: the row's entries as
// `valueField`, then its offset as `offsetField`.
void AppendDumpRecords(MetaObj::MetaList& records, std::vector<DumpRow>&& rows, const std::string& type,
                       const std::string& offsetField, const std::string& valueField);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
