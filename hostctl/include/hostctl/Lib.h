// Exceptions of the host-control library. Their message is text for the
// user: commands report it as it stands.
#pragma once

#include <exception>
#include <string>
#include <vector>
#include "hostctl/Export.h"

namespace HostCtl {
namespace Lib {

// A machine-readable companion of a message: an identifier and its
// arguments, for callers that log or translate messages.
class HOSTCTL_EXPORT VobMessage {
public:
    VobMessage() = default;
    explicit VobMessage(const std::string& id, const std::vector<std::string>& arguments = {})
        : id_(id), arguments_(arguments) {}

    const std::string& GetId() const { return id_; }
    const std::vector<std::string>& GetArguments() const { return arguments_; }

private:
    std::string id_;
    std::vector<std::string> arguments_;
};

class HOSTCTL_EXPORT HostCtlException : public std::exception {
public:
    explicit HostCtlException(const std::string& message, const VobMessage& vob = VobMessage());
    ~HostCtlException() override;

    // The exception carries one message, at index 0; any other index gives "".
    std::string GetMessage(int index) const;
    const VobMessage& GetVobMessage() const { return vob_; }
    const char* what() const noexcept override;

private:
    std::string message_;
    VobMessage vob_;
};

}  // namespace Lib
}  // namespace HostCtl

namespace PldCtl {
namespace Lib {

// A library error that also records where in the library it was raised.
class HOSTCTL_EXPORT PldCtlException : public HostCtl::Lib::HostCtlException {
public:
    PldCtlException(const std::string& message, const std::string& sourcePath, int line,
                    const HostCtl::Lib::VobMessage& vob = HostCtl::Lib::VobMessage());
    ~PldCtlException() override;

    const std::string& GetSourcePath() const { return sourcePath_; }
    int GetLine() const { return line_; }

private:
    std::string sourcePath_;
    int line_;
};

}  // namespace Lib
}  // namespace PldCtl
