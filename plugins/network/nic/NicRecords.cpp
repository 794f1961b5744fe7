#include "nic/NicRecords.h"

#include <array>
#include <memory>

#include "common/CommandSupport.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using HostCtl::Network::WakeOnMode;

// One port: its code, the word `--port` takes with its help text, and the
// words of "Supported Ports" and "Cable Type".
struct PortEntry {
    int code;
    const char* word;
    const char* description;
    const char* supportedWord;
    const char* cableWord;
};

constexpr std::array<PortEntry, 6> kPorts = {{
    {HostCtl::Network::PORT_TP, "tp", "Select TP (Twisted Pair) as the device port", "TP", "Twisted Pair"},
    {HostCtl::Network::PORT_AUI, "aui", "Select AUI (Attachment Unit Interface) as the device port", "AUI", "AUI"},
    {HostCtl::Network::PORT_BNC, "bnc", "Select BNC (Bayonet Neill-Concelman) as the device port", "BNC", "BNC"},
    {HostCtl::Network::PORT_MII, "mii", "Select MII (Media Independent Interface) as the device port", "MII", "MII"},
    {HostCtl::Network::PORT_FIBRE, "fibre", "Select fibre as the device port", "FIBRE", "FIBRE"},
    {HostCtl::Network::PORT_DA, "da", "Select DA (Direct Attach copper) as the device port", "DA", "DA"},
}};

const PortEntry* FindPort(int code) {
    for (const PortEntry& port : kPorts) {
        if (port.code == code) return &port;
    }
    return nullptr;
}

// One wake-on-LAN mode: its `--wake-on-lan` letter ('\0' for a mode no
// letter enables) and its "Wakeon" word.
struct WakeOnEntry {
    WakeOnMode mode;
    char letter;
    const char* word;
};

constexpr std::array<WakeOnEntry, 9> kWakeOnModes = {{
    {HostCtl::Network::WAKE_ON_PHY, 'p', "PHY Activity"},
    {HostCtl::Network::WAKE_ON_UNICAST, 'u', "Unicast Messagess"},
    {HostCtl::Network::WAKE_ON_MULTICAST, 'm', "Multicast Messages"},
    {HostCtl::Network::WAKE_ON_BROADCAST, 'b', "Broadcast Messages"},
    {HostCtl::Network::WAKE_ON_ARP, 'a', "ARP"},
    {HostCtl::Network::WAKE_ON_MAGIC, 'g', "MagicPacket(tm)"},
    {HostCtl::Network::WAKE_ON_SECURE_ON, 's',
     "Enable SecureOn(tm) Password for                            MagicPacket(tm)"},
    {HostCtl::Network::WAKE_ON_UNSUPPORTED, '\0', "Unsupported"},
    {HostCtl::Network::WAKE_ON_DISABLED, '\0', "Disabled"},
}};

const char* UpDown(bool up) {
    return up ? "Up" : "Down";
}

// Appends `value` as HexText does, followed by one blank.
void AppendHexEntry(std::string& out, std::uint64_t value, int width) {
    out += HexText(value, width);
    out += ' ';
}

}  // namespace

boost::shared_ptr<CallSpec::InputSpec> NicNameInput() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "nic-name", CallSpec::PARAM_STRING, "n",
                     "The name of the NIC to configured. This must be one of the cards listed in the nic list command.",
                     Required::Yes);
    return declared;
}

std::vector<CallSpec::ParameterConstraint::StringEnumValue> PortChoices() {
    std::vector<CallSpec::ParameterConstraint::StringEnumValue> choices;
    for (const PortEntry& port : kPorts) choices.push_back({port.word, port.description});
    return choices;
}

std::optional<int> PortCodeOfWord(const std::string& word) {
    for (const PortEntry& port : kPorts) {
        if (word == port.word) return port.code;
    }
    return std::nullopt;
}

std::string SupportedPortWord(int code) {
    const PortEntry* port = FindPort(code);
    return port ? port->supportedWord : "UNKNOWN";
}

std::string CableTypeWord(int code) {
    const PortEntry* port = FindPort(code);
    return port ? port->cableWord : "";
}

std::string TransceiverWord(int code) {
    switch (code) {
        case HostCtl::Network::TRANSCEIVER_INTERNAL:
            return "internal";
        case HostCtl::Network::TRANSCEIVER_EXTERNAL:
            return "external";
        default:
            return "";
    }
}

std::optional<int> TransceiverCodeOfWord(const std::string& word) {
    if (word == "internal") return HostCtl::Network::TRANSCEIVER_INTERNAL;
    if (word == "external") return HostCtl::Network::TRANSCEIVER_EXTERNAL;
    return std::nullopt;
}

std::string WakeOnWord(int mode) {
    for (const WakeOnEntry& entry : kWakeOnModes) {
        if (entry.mode == mode) return entry.word;
    }
    return "None";
}

std::optional<WakeOnMode> WakeOnModeOfLetter(char letter) {
    if (letter == '\0') return std::nullopt;
    for (const WakeOnEntry& entry : kWakeOnModes) {
        if (entry.letter == letter) return entry.mode;
    }
    return std::nullopt;
}

std::string LinkModeText(const HostCtl::Network::LinkMode& mode) {
    std::string text = std::to_string(mode.speed) + "baseT/";
    switch (mode.duplex) {
        case HostCtl::Network::DUPLEX_FULL:
            return text + "Full";
        case HostCtl::Network::DUPLEX_HALF:
            return text + "Half";
        case HostCtl::Network::DUPLEX_AUTO:
            return text + "Auto";
        default:
            return text;
    }
}

void FillInventoryRow(MetaObj::MetaStruct& record, const HostCtl::Network::Pnic& pnic, InventoryColumns columns) {
    record.SetField("Name", pnic.GetName());
    std::string description = "Unknown Unknown";
    if (std::unique_ptr<HostCtl::Network::PciDevice> device = pnic.GetPciDevice()) {
        record.SetField("PCI Device", device->GetName());
        description = device->GetVendorName() + " " + device->GetDeviceName();
    } else {
        record.SetField("PCI Device", "Pseudo");
    }
    record.SetField("Driver", pnic.GetDriverName());
    record.SetField("Link", UpDown(pnic.IsLinkUp()));
    if (columns == InventoryColumns::Nic) {
        record.SetField("Admin Status", UpDown(pnic.IsAdminUp()));
        record.SetField("Link Status", UpDown(pnic.IsLinkStatusUp()));
    }
    record.SetField("Speed", pnic.GetLinkSpeed());
    record.SetField("Duplex", pnic.GetDuplex() == HostCtl::Network::DUPLEX_FULL ? "Full" : "Half");
    record.SetField("MAC Address", pnic.GetMacAddress().GetStringAddress());
    record.SetField("MTU", pnic.GetMtu());
    record.SetField("Description", std::move(description));
}

std::string HexText(std::uint64_t value, int width) {
    static const char kDigits[] = "0123456789abcdef";
    std::string digits;
    do {
        digits.insert(digits.begin(), kDigits[value & 0xf]);
        value >>= 4;
    } while (value != 0);
    const std::size_t minimum = width > 0 ? static_cast<std::size_t>(width) : 0;
    if (digits.size() < minimum) digits.insert(0, minimum - digits.size(), '0');
    return digits;
}

std::vector<DumpRow> RegisterRows(const std::vector<std::uint32_t>& words) {
    constexpr std::size_t kPerRow = 16;
    std::vector<DumpRow> rows;
    rows.reserve((words.size() + kPerRow - 1) / kPerRow);
    for (std::size_t first = 0; first < words.size(); first += kPerRow) {
        DumpRow row;
        row.offset = HexText(first, 4);
        for (std::size_t i = first; i < words.size() && i < first + kPerRow; ++i)
            AppendHexEntry(row.value, words[i], 2);
        rows.push_back(std::move(row));
    }
    return rows;
}

std::vector<DumpRow> EepromRows(std::uint64_t offset, const std::vector<std::uint8_t>& bytes) {
    constexpr std::uint64_t kPerRow = 16;
    std::vector<DumpRow> rows;
    std::uint64_t rowStart = offset & ~(kPerRow - 1);
    std::uint64_t position = offset % kPerRow;
    DumpRow row;
    row.offset = HexText(rowStart, 4);
    row.value.assign(3 * position, ' ');
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        AppendHexEntry(row.value, bytes[i], 2);
        if (++position == kPerRow || i + 1 == bytes.size()) {
            rows.push_back(std::move(row));
            rowStart += kPerRow;
            position = 0;
            row = DumpRow{HexText(rowStart, 4), std::string()};
        }
    }
    return rows;
}

void AppendDumpRecords(MetaObj::MetaList& records, std::vector<DumpRow>&& rows, const std::string& type,
                       const std::string& offsetField, const std::string& valueField) {
    records.Reserve(records.Size() + rows.size());
    for (DumpRow& row : rows) {
        boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New(type);
        record->SetField(valueField, std::move(row.value));
        record->SetField(offsetField, std::move(row.offset));
        records.Append(std::move(record));
    }
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
