#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic eeprom change
class NicEepromChange : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicEepromChange);
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
