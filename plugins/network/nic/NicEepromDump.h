#pragma once

#include <cstdint>
#include <vector>

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic eeprom dump
class NicEepromDump : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicEepromDump);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();

private:
    // The rows of the EEPROM bytes read from `offset`, as records.
    boost::shared_ptr<MetaObj::MetaList> DumpBinary(std::int64_t offset, const std::vector<std::uint8_t>& bytes);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
