#include "store/Volumes.h"

#include <algorithm>
#include <iterator>
#include <span>

namespace store {

namespace {

// File systems of the kernel and the desktop's helpers, never a disk.
constexpr std::string_view kPseudoTypes[] = {
    "proc", "sysfs", "devtmpfs", "devpts", "tmpfs", "ramfs", "rootfs", "cgroup", "cgroup2",
    "securityfs", "debugfs", "tracefs", "configfs", "fusectl", "pstore", "bpf", "mqueue",
    "hugetlbfs", "autofs", "binfmt_misc", "efivarfs", "rpc_pipefs", "nsfs", "selinuxfs",
    "overlay", "squashfs", "nfsd", "devfs", "fuse.gvfsd-fuse", "fuse.portal", "fuse.lxcfs",
    "fuse.snapfuse"};

// Folders that hold the system's own mounts (boot partitions, snaps,
// container layers, the run-time folders).
constexpr std::string_view kSystemFolders[] = {
    "/proc", "/sys", "/dev", "/run", "/boot", "/efi", "/snap", "/var", "/usr", "/tmp", "/etc"};

// Where removable media and a person's own mounts appear.
constexpr std::string_view kMediaFolders[] = {"/media", "/run/media", "/mnt"};

// `path` is `folder` or lies inside it.
bool Within(std::string_view path, std::string_view folder) {
    if (folder.size() > 1 && folder.back() == '/') folder.remove_suffix(1);
    if (path.substr(0, folder.size()) != folder) return false;
    return path.size() == folder.size() || folder == "/" || path[folder.size()] == '/';
}

bool WithinAny(std::string_view path, std::span<const std::string_view> folders) {
    return std::any_of(folders.begin(), folders.end(), [path](std::string_view f) { return Within(path, f); });
}

std::string Unescape(std::string_view field) {
    std::string out;
    for (size_t i = 0; i < field.size(); ++i) {
        const auto octal = [&](size_t k) { return k < field.size() && field[k] >= '0' && field[k] <= '7'; };
        if (field[i] == '\\' && octal(i + 1) && octal(i + 2) && octal(i + 3)) {
            out += static_cast<char>((field[i + 1] - '0') * 64 + (field[i + 2] - '0') * 8 + (field[i + 3] - '0'));
            i += 3;
        } else {
            out += field[i];
        }
    }
    return out;
}

} // namespace

std::optional<MountEntry> ParseMountLine(std::string_view line) {
    std::vector<std::string_view> fields;
    size_t i = 0;
    while (fields.size() < 3) {
        while (i < line.size() && (line[i] == ' ' || line[i] == '\t')) ++i;
        if (i >= line.size() || line[i] == '\n' || line[i] == '\r') break;
        const size_t start = i;
        while (i < line.size() && line[i] != ' ' && line[i] != '\t' && line[i] != '\n' && line[i] != '\r') ++i;
        fields.push_back(line.substr(start, i - start));
    }
    if (fields.size() < 3) return std::nullopt;
    return MountEntry{Unescape(fields[0]), Unescape(fields[1]), Unescape(fields[2])};
}

bool IsUserVolume(const MountEntry& entry, std::string_view home) {
    const std::string_view path = entry.mountPoint;
    if (path.empty() || path.front() != '/') return false;
    if (path == "/") return true;  // whatever it is made of, the root is where everything starts
    const bool pseudo = std::find(std::begin(kPseudoTypes), std::end(kPseudoTypes), entry.fsType) != std::end(kPseudoTypes);
    const bool media = WithinAny(path, kMediaFolders);
    // A memory disk is a person's own only where people mount things.
    if (pseudo) return media && (entry.fsType == "tmpfs" || entry.fsType == "ramfs");
    if (media) return true;
    // The volume that holds home (also below a system folder), and mounts inside home.
    if (!home.empty() && home != "/" && (Within(home, path) || Within(path, home))) return true;
    return !WithinAny(path, kSystemFolders);
}

std::vector<std::string> UserVolumes(std::string_view table, std::string_view home) {
    std::vector<std::string> out;
    while (!table.empty()) {
        const size_t end = table.find('\n');
        const std::string_view line = table.substr(0, end);
        table = end == std::string_view::npos ? std::string_view() : table.substr(end + 1);
        const std::optional<MountEntry> entry = ParseMountLine(line);
        if (entry && IsUserVolume(*entry, home)) out.push_back(entry->mountPoint);
    }
    std::sort(out.begin(), out.end());
    out.erase(std::unique(out.begin(), out.end()), out.end());
    return out;
}

} // namespace store
