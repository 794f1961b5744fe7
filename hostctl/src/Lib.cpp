#include "hostctl/Lib.h"

namespace HostCtl {
namespace Lib {

HostCtlException::HostCtlException(const std::string& message, const VobMessage& vob) : message_(message), vob_(vob) {}

HostCtlException::~HostCtlException() = default;

std::string HostCtlException::GetMessage(int index) const {
    return index == 0 ? message_ : std::string();
}

const char* HostCtlException::what() const noexcept {
    return message_.c_str();
}

}  // namespace Lib
}  // namespace HostCtl

namespace PldCtl {
namespace Lib {

PldCtlException::PldCtlException(const std::string& message, const std::string& sourcePath, int line,
                                 const HostCtl::Lib::VobMessage& vob)
    : HostCtl::Lib::HostCtlException(message, vob), sourcePath_(sourcePath), line_(line) {}

PldCtlException::~PldCtlException() = default;

}  // namespace Lib
}  // namespace PldCtl
