#pragma once

#include "common/CommandClass.h"

namespace OrvixCli {
namespace NetworkNamespace {

// network sriovnic list
class SriovNicList : public virtual AutoCli::Command {
    ORVIX_COMMAND_CLASS(SriovNicList);
    virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace OrvixCli
