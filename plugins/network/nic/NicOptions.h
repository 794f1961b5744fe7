// What the NIC offload and driver-parameter commands share: the words their
// values are shown with, the tables that tie each option and field to its
// member of a driver record, and the steps that read a record into a row or
// edit it from the options given.
//
// The row builders take the NIC and never throw: a NIC that cannot answer
// gets its fallback values, so that a listing goes on with the next NIC.
// The option appliers only edit the record they are given; the calling
// command reads it, lets them edit it and hands it back.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "common/CommandSupport.h"
#include "framework/AutoCli.h"
#include "framework/CallSpec.h"
#include "framework/MetaObj.h"
#include "hostctl/network/nic/Pnic.h"
#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

// The words of the offload and driver-parameter rows.
extern const char kNicField[];      // "NIC", the first field of every row
extern const char kNotAvailable[];  // "N/A", a value a NIC could not report
// "on" / "off", as the offload commands show a bool.
const char* OnOff(bool value);
// "On" / "Off", as the coalescing commands show a bool.
const char* OnOffCapitalised(bool value);

// The parameters of a command whose first option names the NIC: `parameter`
// (short n), a string.
boost::shared_ptr<CallSpec::InputSpec> NicNameInput(const std::string& parameter, const std::string& description,
                                                    Required required);
// The output declaration of a listing of `templ` records.
boost::shared_ptr<CallSpec::OutputSpec> RowListOutputSpec(const boost::shared_ptr<MetaObj::MetaStruct>& templ);

// Makes `command` a fetcher whose default formatter is `formatter` and which
// shows the `fields` of its `record` type in that order.
void DescribeFetcher(AutoCli::Command& command, const std::string& formatter, const std::string& record,
                     const std::vector<std::string>& fields);

// The rows of a listing: one per NIC, made by `row`, for the NIC named by
// `parameter` when it is given (reported `how` when the host has none) or
// for every NIC of `nics` in the host's order. An empty `parameter` means the
// command has none. The list's element template is `templ`. The library's
// errors outside `row` end the run with their message.
void ListNicRows(HostCtl::Network::NetworkInfo& nics, const boost::shared_ptr<CallSpec::Input>& input,
                 const boost::shared_ptr<CallSpec::Output>& output, const std::string& parameter, MissingNic how,
                 const boost::shared_ptr<MetaObj::MetaStruct>& templ,
                 const std::function<boost::shared_ptr<MetaObj::MetaStruct>(HostCtl::Network::Pnic&)>& row);

// Runs a changing command's `change` on the NIC named by `parameter` and
// finishes with a boolean made without a value.
void ChangeNic(HostCtl::Network::NetworkInfo& nics, const boost::shared_ptr<CallSpec::Input>& input,
               const boost::shared_ptr<CallSpec::Output>& output, const std::string& parameter, MissingNic how,
               const std::function<void(HostCtl::Network::Pnic&)>& change);

// ---- Hardware offloads: the cso, tso and sg families.

enum class OffloadFamily { Checksum, Segmentation, ScatterGather };

// The record type of the family's rows, e.g. "CSOSettings".
std::string OffloadRecordType(OffloadFamily family);
// The family's fields, "NIC" first.
std::vector<std::string> OffloadFields(OffloadFamily family);
// The family's row for one NIC: each value "on" or "off", all "N/A" when the
// NIC cannot report its offloads.
boost::shared_ptr<MetaObj::MetaStruct> OffloadRow(OffloadFamily family, HostCtl::Network::Pnic& pnic);
// Reads the NIC's offloads, sets every member of the family to `enable`,
// marks only the family's mask bits and hands the record back.
void SetOffload(OffloadFamily family, HostCtl::Network::Pnic& pnic, bool enable);
// The hwnic (required) and enable (0 or 1, required) options of a set command.
boost::shared_ptr<CallSpec::InputSpec> OffloadSetInput(const std::string& hwnicDescription,
                                                       const std::string& enableDescription);
// The run of a get command: the family's rows for the NIC named by hwnic,
// or for every NIC.
void ListOffloads(OffloadFamily family, const boost::shared_ptr<CallSpec::Input>& input,
                  const boost::shared_ptr<CallSpec::Output>& output);
// The run of a set command on the NIC named by hwnic.
void ChangeOffload(OffloadFamily family, const boost::shared_ptr<CallSpec::Input>& input,
                   const boost::shared_ptr<CallSpec::Output>& output);

// ---- Software simulation of offloads.

extern const char kSoftwareSimulationRecord[];  // "Settings"
// "NIC", then the fourteen feature fields in the order of the options.
std::vector<std::string> SoftwareSimulationFields();
// The fourteen bool options, in their order, none with a short name.
void AddSoftwareSimulationParameters(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec);
// The NIC's row: each feature "on" or "off", all "N/A" when it cannot answer.
boost::shared_ptr<MetaObj::MetaStruct> SoftwareSimulationRow(HostCtl::Network::Pnic& pnic);
// A record holding only the features whose option was given, each with its
// mask bit; mask 0 when none was.
HostCtl::Network::SoftwareSimulation SoftwareSimulationFromOptions(const CallSpec::Input& input);

// ---- Interrupt coalescing.

extern const char kCoalesceRecord[];  // "CoalesceParams"
std::vector<std::string> CoalesceFields();
// rx-usecs, rx-max-frames, tx-usecs, tx-max-frames, adaptive-rx,
// adaptive-tx, sample-interval (1 to 3600).
void AddCoalesceParameters(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec);
// The NIC's row: the counts and the interval in decimal, the adaptive
// switches "On" or "Off"; all seven "N/A" when the NIC cannot answer.
boost::shared_ptr<MetaObj::MetaStruct> CoalesceRow(HostCtl::Network::Pnic& pnic);
// Reads the NIC's coalescing record, overwrites the members whose option was
// given and hands it back, unchanged when none was. Numbers are passed as
// typed; the library refuses those that do not fit.
void RewriteCoalesce(const CallSpec::Input& input, HostCtl::Network::Pnic& pnic);

// ---- Pause parameters.

extern const char kPauseRecord[];  // "PauseParamsSettings"
// The fields in the order the table shows them.
std::vector<std::string> PauseFields();
// The NIC's row. The resolution fields are true only when both directions
// have a resolution; a NIC that does not support pause parameters, or cannot
// answer, shows every bool false.
boost::shared_ptr<MetaObj::MetaStruct> PauseRow(HostCtl::Network::Pnic& pnic);
// Reads the NIC's pause record, overwrites autonegotiation, RX and TX pause
// where auto, rx, tx were given and hands it back, unchanged when none was.
void RewritePause(const CallSpec::Input& input, HostCtl::Network::Pnic& pnic);

// ---- Ring sizes.

extern const char kRingRecord[];  // "RingInfo"
std::vector<std::string> RingFields();
enum class RingChoice { Preset, Current };
// The chosen one of the NIC's two ring records, read in one call.
boost::shared_ptr<MetaObj::MetaStruct> RingRecord(HostCtl::Network::Pnic& pnic, RingChoice choice);
// The run of a ring get command: the chosen record of the NIC named by
// nic-name.
void ShowRing(RingChoice choice, const boost::shared_ptr<CallSpec::Input>& input,
              const boost::shared_ptr<CallSpec::Output>& output);
// rx, rx-mini, rx-jumbo, tx.
void AddRingSizeParameters(const boost::shared_ptr<CallSpec::InputSpec>& inputSpec);
// A record holding the sizes that were given, each with its mask bit; mask 0
// when none was. Sizes are passed as typed; the library refuses those above
// the NIC's preset or below 0.
HostCtl::Network::RingParams RingSizesFromOptions(const CallSpec::Input& input);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
