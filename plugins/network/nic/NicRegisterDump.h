#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network nic register dump
class NicRegisterDump : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(NicRegisterDump);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
