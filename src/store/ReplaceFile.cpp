#include "store/ReplaceFile.h"

#include <atomic>
#include <cerrno>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <random>
#include <sys/stat.h>
#include <unistd.h>

#include "store/Paths.h"

namespace store {

namespace {
std::string Describe(const std::string& what, const std::string& path, int err) {
    return what + " " + path + ": " + std::strerror(err);
}
} // namespace

bool InspectTarget(const std::string& target, ReplacedFile& old, std::string& error) {
    old = ReplacedFile{};
    old.path = target;
    struct stat st {};
    if (::lstat(target.c_str(), &st) != 0) {
        if (errno == ENOENT) return true;
        error = Describe("Unable to look at", target, errno);
        return false;
    }
    if (S_ISLNK(st.st_mode)) {
        // Replace the file the link points at, not the link.
        char resolved[PATH_MAX];
        if (::realpath(target.c_str(), resolved) == nullptr) {
            if (errno != ENOENT) {
                error = Describe("Unable to follow", target, errno);
                return false;
            }
            return true;  // a dangling link is written through like a new name
        }
        old.path = resolved;
        if (::stat(old.path.c_str(), &st) != 0) {
            error = Describe("Unable to look at", old.path, errno);
            return false;
        }
    }
    if (!S_ISREG(st.st_mode)) {
        error = old.path + " is not a picture file that can be replaced.";
        return false;
    }
    // The write bits stand for the read-only attribute: even a user who
    // could rename over the file leaves a read-only one alone.
    if ((st.st_mode & (S_IWUSR | S_IWGRP | S_IWOTH)) == 0 || ::access(old.path.c_str(), W_OK) != 0) {
        error = old.path + " is read-only.";
        return false;
    }
    old.existed = true;
    old.mode = st.st_mode & 07777;
    old.times[0] = st.st_atim;
    old.times[1] = st.st_mtim;
    return true;
}

std::string TempNameBeside(const std::string& target) {
    static std::atomic<unsigned> counter{0};
    static std::mt19937 generator{std::random_device{}()};
    std::string folder = FolderOf(target);
    if (folder.empty()) folder = "./";
    char tag[40];
    std::snprintf(tag, sizeof tag, ".%d.%u.%08x", static_cast<int>(::getpid()), counter++,
                  static_cast<unsigned>(generator()));
    return folder + ".~" + FileNameOf(target) + tag;
}

bool WriteNewFile(const std::string& path, const Bytes& bytes, std::string& error) {
    // 0666 under the umask: the permissions any new file gets.
    const int fd = ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
    if (fd < 0) {
        error = Describe("Unable to write", path, errno);
        return false;
    }
    size_t done = 0;
    while (done < bytes.size()) {
        const ssize_t n = ::write(fd, bytes.data() + done, bytes.size() - done);
        if (n < 0 && errno == EINTR) continue;
        if (n <= 0) {
            error = Describe("Unable to write", path, n < 0 ? errno : ENOSPC);
            ::close(fd);
            ::unlink(path.c_str());
            return false;
        }
        done += static_cast<size_t>(n);
    }
    if (::fsync(fd) != 0) {
        error = Describe("Unable to write", path, errno);
        ::close(fd);
        ::unlink(path.c_str());
        return false;
    }
    if (::close(fd) != 0) {
        error = Describe("Unable to write", path, errno);
        ::unlink(path.c_str());
        return false;
    }
    return true;
}

bool MoveIntoPlace(const std::string& temp, const ReplacedFile& old, bool keepTimes, std::string& error) {
    if (old.existed) {
        // Carried over as far as the system lets us; a failure here loses nothing.
        (void)::chmod(temp.c_str(), old.mode);
        if (keepTimes) (void)::utimensat(AT_FDCWD, temp.c_str(), old.times, 0);
    }
    if (::rename(temp.c_str(), old.path.c_str()) != 0) {
        error = Describe("Unable to replace", old.path, errno);
        ::unlink(temp.c_str());
        return false;
    }
    return true;
}

bool ReplaceFileWith(const std::string& target, const Bytes& bytes, bool keepTimes, std::string& error) {
    ReplacedFile old;
    if (!InspectTarget(target, old, error)) return false;
    const std::string temp = TempNameBeside(old.path);
    return WriteNewFile(temp, bytes, error) && MoveIntoPlace(temp, old, keepTimes, error);
}

} // namespace store
