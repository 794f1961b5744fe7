#include "Refusals.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

namespace PldCtl {
namespace Detail {

namespace {

// Closes a file descriptor on every path.
class FileHandle {
public:
    explicit FileHandle(int fd) : fd_(fd) {}
    ~FileHandle() {
        if (fd_ >= 0) ::close(fd_);
    }
    FileHandle(const FileHandle&) = delete;
    FileHandle& operator=(const FileHandle&) = delete;
    int Get() const { return fd_; }

private:
    int fd_;
};

}  // namespace

std::string ReadRegularFile(const std::string& what, const std::string& path, std::size_t limit,
                            const std::function<std::string(std::uint64_t size)>& tooLarge) {
    const std::string name = what + " " + path;
    auto unreadable = [&](int error) {
        return HostCtl::Lib::HostCtlException(name + " cannot be read: " + std::strerror(error));
    };
    auto notRegular = [&] { return HostCtl::Lib::HostCtlException(name + " is not a regular file"); };
    struct stat info {};
    if (::stat(path.c_str(), &info) != 0) throw unreadable(errno);
    if (!S_ISREG(info.st_mode)) throw notRegular();
    FileHandle file(::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC | O_NOCTTY));
    if (file.Get() < 0) throw unreadable(errno);
    if (::fstat(file.Get(), &info) != 0) throw unreadable(errno);
    if (!S_ISREG(info.st_mode)) throw notRegular();
    if (static_cast<std::uint64_t>(info.st_size) > limit) {
        throw HostCtl::Lib::HostCtlException(tooLarge(static_cast<std::uint64_t>(info.st_size)));
    }
    // One byte more than allowed shows a file that grew since fstat.
    std::string content(limit + 1, '\0');
    std::size_t done = 0;
    while (done < content.size()) {
        const ssize_t got = ::read(file.Get(), &content[done], content.size() - done);
        if (got < 0 && errno == EINTR) continue;
        if (got < 0) throw unreadable(errno);
        if (got == 0) break;
        done += static_cast<std::size_t>(got);
    }
    if (done > limit) throw HostCtl::Lib::HostCtlException(tooLarge(done));
    content.resize(done);
    return content;
}

}  // namespace Detail
}  // namespace PldCtl
