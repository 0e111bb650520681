#include "store/SafeFile.h"

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "store/Paths.h"

namespace store {

namespace {
std::string Describe(const std::string& what, const std::string& path, int err) {
    return what + " " + path + ": " + std::strerror(err);
}
} // namespace

bool StageFile(const std::string& target, const Bytes& bytes, StagedFile& staged, std::string& error) {
    std::string folder = FolderOf(target);
    if (folder.empty()) folder = "./";
    std::string pattern = folder + ".~" + FileNameOf(target) + ".XXXXXX";
    std::vector<char> name(pattern.begin(), pattern.end());
    name.push_back('\0');
    const int fd = ::mkstemp(name.data());
    if (fd < 0) {
        error = Describe("Unable to write", target, errno);
        return false;
    }
    const std::string temp(name.data());
    ::fchmod(fd, 0644);
    size_t done = 0;
    while (done < bytes.size()) {
        const ssize_t n = ::write(fd, bytes.data() + done, bytes.size() - done);
        if (n < 0 && errno == EINTR) continue;
        if (n <= 0) {
            // A short write (disk full, size limit) leaves the target alone.
            error = Describe("Unable to write", target, n < 0 ? errno : ENOSPC);
            ::close(fd);
            ::unlink(temp.c_str());
            return false;
        }
        done += static_cast<size_t>(n);
    }
    if (::fsync(fd) != 0 || ::close(fd) != 0) {
        error = Describe("Unable to write", target, errno);
        ::unlink(temp.c_str());
        return false;
    }
    staged.temp = temp;
    staged.target = target;
    return true;
}

bool CommitStaged(StagedFile& staged, std::string& error) {
    if (::rename(staged.temp.c_str(), staged.target.c_str()) != 0) {
        error = Describe("Unable to replace", staged.target, errno);
        DiscardStaged(staged);
        return false;
    }
    staged.temp.clear();
    return true;
}

void DiscardStaged(StagedFile& staged) {
    if (!staged.temp.empty()) ::unlink(staged.temp.c_str());
    staged.temp.clear();
}

bool WriteFileSafely(const std::string& path, const Bytes& bytes, std::string& error) {
    StagedFile staged;
    return StageFile(path, bytes, staged, error) && CommitStaged(staged, error);
}

bool ReadFileHead(const std::string& path, size_t limit, Bytes& bytes) {
    bytes.clear();
    const int fd = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
    if (fd < 0) return false;
    struct stat st {};
    if (::fstat(fd, &st) != 0 || !S_ISREG(st.st_mode)) {
        ::close(fd);
        return false;
    }
    bytes.resize(limit);
    size_t done = 0;
    while (done < limit) {
        const ssize_t n = ::read(fd, bytes.data() + done, limit - done);
        if (n < 0 && errno == EINTR) continue;
        if (n < 0) {
            ::close(fd);
            bytes.clear();
            return false;
        }
        if (n == 0) break;
        done += static_cast<size_t>(n);
    }
    ::close(fd);
    bytes.resize(done);
    return true;
}

} // namespace store
