#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>

#include "profile/ProfileError.h"
#include "profile/ProfileReader.h"

namespace hostsim {

namespace {

// Far beyond any real profile; keeps /dev/zero-like mistakes from eating memory.
constexpr off_t largestProfile = 16 * 1024 * 1024;

class FileDescriptor {
public:
    explicit FileDescriptor(int fd) : fd_(fd) {}
    FileDescriptor(const FileDescriptor &) = delete;
    FileDescriptor &operator=(const FileDescriptor &) = delete;
    ~FileDescriptor() {
        if (fd_ >= 0) ::close(fd_);
    }
    int get() const { return fd_; }

private:
    int fd_;
};

[[noreturn]] void failWithErrno(int error) {
    throw ProfileError(std::generic_category().message(error));
}

std::string readText(const std::string &path) {
    const FileDescriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC));
    if (file.get() < 0) failWithErrno(errno);
    struct stat status {};
    if (::fstat(file.get(), &status) != 0) failWithErrno(errno);
    if (!S_ISREG(status.st_mode)) throw ProfileError("not a regular file");
    if (status.st_size > largestProfile) throw ProfileError("larger than 16 MiB");
    std::string text(static_cast<std::size_t>(status.st_size), '\0');
    std::size_t done = 0;
    while (done < text.size()) {
        const ssize_t got = ::read(file.get(), &text[done], text.size() - done);
        if (got < 0 && errno == EINTR) continue;
        if (got < 0) failWithErrno(errno);
        if (got == 0) break;
        done += static_cast<std::size_t>(got);
    }
    text.resize(done);
    return text;
}

}  // namespace

HostProfile readProfileFile(const std::string &path) {
    try {
        return parseProfile(readText(path));
    } catch (const ProfileError &error) {
        throw ProfileError(path + ": " + error.what());
    }
}

}  // namespace hostsim
