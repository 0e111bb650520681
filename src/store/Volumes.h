#pragma once
#include <optional>
#include <string>
#include <string_view>
#include <vector>

// Which mounted file systems the drive list offers: the ones a person would
// pick (the root, home, removable media, network shares and other real
// disks), not the kernel's and the system's own mounts.
namespace store {

// One mount as the mount table lists it.
struct MountEntry {
    std::string device;
    std::string mountPoint;
    std::string fsType;
};

// One line of a mount table in the /proc/self/mounts form ("device mount-point
// type options dump pass"), with the table's octal escapes (\040 for a blank)
// decoded. nullopt for a line with fewer than three fields.
std::optional<MountEntry> ParseMountLine(std::string_view line);

// Whether the drive list offers this mount. `home` is the user's home folder.
bool IsUserVolume(const MountEntry& entry, std::string_view home);

// The mount points of a whole table that the drive list offers, each once,
// sorted by path (so the root comes first).
std::vector<std::string> UserVolumes(std::string_view table, std::string_view home);

} // namespace store
