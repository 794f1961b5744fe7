// The members every command class has, declared and defined by two macros so
// that a command's header says only what is particular to it.
//
// A command class derives only from AutoCli::Command (public, virtual) and
// has no data members:
//
//   class IpGet : public virtual AutoCli::Command {
//       ORVIX_COMMAND_CLASS(IpGet);
//       virtual boost::shared_ptr<MetaObj::MetaStruct> GetOutputStructure();
//   };
//
// and its source file says ORVIX_COMMAND_NEW(IpGet) beside the constructor.
#pragma once

#include <boost/shared_ptr.hpp>

#include "framework/AutoCli.h"

#define ORVIX_COMMAND_CLASS(Class)                                            \
public:                                                                       \
    Class();                                                                  \
    ~Class() override;                                                        \
    static boost::shared_ptr<Class> New();                                    \
    boost::shared_ptr<CallSpec::InputSpec> GetInputSpecInternal() override;   \
    boost::shared_ptr<CallSpec::OutputSpec> GetOutputSpecInternal() override; \
    void ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) override

#define ORVIX_COMMAND_NEW(Class)                      \
    Class::~Class() = default;                        \
    boost::shared_ptr<Class> Class::New() {           \
        return boost::shared_ptr<Class>(new Class()); \
    }
