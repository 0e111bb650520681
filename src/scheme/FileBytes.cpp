#include "scheme/FileBytes.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>

namespace FileBytes {

namespace {

std::string Reason(int err) {
    if (err == ENOENT) return "The file does not exist.";
    if (err == EACCES || err == EPERM) return "Access to the file was refused.";
    return std::string(std::strerror(err)) + ".";
}

// Closes a descriptor when it goes out of scope (unless fd is set back to -1).
struct Fd {
    int fd = -1;
    ~Fd() {
        if (fd >= 0) ::close(fd);
    }
};

bool WriteAll(int fd, const uint8_t* data, size_t size) {
    while (size > 0) {
        const ssize_t n = ::write(fd, data, size);
        if (n < 0 && errno == EINTR) continue;
        if (n <= 0) return false;
        data += n;
        size -= static_cast<size_t>(n);
    }
    return true;
}

} // namespace

bool ReadFile(const std::string& path, std::vector<uint8_t>& bytes, size_t maxBytes, std::string& problem) {
    Fd file;
    file.fd = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
    if (file.fd < 0) {
        problem = Reason(errno);
        return false;
    }
    struct stat info {};
    if (::fstat(file.fd, &info) != 0 || !S_ISREG(info.st_mode)) {
        problem = "This is not a file.";
        return false;
    }
    std::vector<uint8_t> data(maxBytes);
    size_t got = 0;
    while (got < maxBytes) {
        const ssize_t n = ::read(file.fd, data.data() + got, maxBytes - got);
        if (n < 0 && errno == EINTR) continue;
        if (n < 0) {
            problem = Reason(errno);
            return false;
        }
        if (n == 0) break;
        got += static_cast<size_t>(n);
    }
    data.resize(got);
    bytes = std::move(data);
    return true;
}

bool CommitFile(const std::string& path, const std::vector<uint8_t>& bytes, std::string& problem) {
    std::string temp = path + ".XXXXXX";
    Fd file;
    file.fd = ::mkstemp(temp.data());
    if (file.fd < 0) {
        const int err = errno;
        problem = err == ENOENT ? "The folder does not exist." : Reason(err);
        return false;
    }
    // The new file keeps the old one's permissions, or gets the usual ones.
    struct stat old {};
    mode_t mode;
    if (::stat(path.c_str(), &old) == 0) {
        mode = old.st_mode & 07777;
    } else {
        const mode_t mask = ::umask(0);
        ::umask(mask);
        mode = 0666 & ~mask;
    }
    bool ok = ::fchmod(file.fd, mode) == 0 && WriteAll(file.fd, bytes.data(), bytes.size()) && ::fsync(file.fd) == 0;
    int err = ok ? 0 : errno;
    const int fd = file.fd;
    file.fd = -1;
    if (::close(fd) != 0 && ok) {
        ok = false;
        err = errno;
    }
    if (ok && ::rename(temp.c_str(), path.c_str()) != 0) {
        ok = false;
        err = errno;
    }
    if (!ok) {
        ::unlink(temp.c_str());
        problem = err == ENOSPC ? "The disk is full." : err == 0 ? "The file could not be written completely." : Reason(err);
    }
    return ok;
}

} // namespace FileBytes
