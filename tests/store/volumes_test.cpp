// The drive list's choice among the mounts of a desktop machine.
#include <gtest/gtest.h>

#include "store/Volumes.h"

namespace {

constexpr const char* kHome = "/home/anna";

// Mount table lines as a desktop, a container and a laptop with snaps list
// them, and whether the drive list offers each.
TEST(Volumes, OffersThePlacesAPersonWouldPick) {
    const struct { const char* line; bool offered; } rows[] = {
        {"/dev/nvme0n1p2 / ext4 rw,relatime 0 0", true},
        {"overlay / overlay rw,relatime,lowerdir=/var/lib/docker/l/A:/var/lib/docker/l/B 0 0", true},  // a container's root
        {"/dev/nvme0n1p3 /home ext4 rw,relatime 0 0", true},
        {"/dev/sdb1 /media/anna/HOLIDAY\\040PICS vfat rw,nosuid,nodev 0 0", true},
        {"/dev/sdc1 /run/media/anna/CAMERA exfat rw,nosuid,nodev 0 0", true},
        {"/dev/sr0 /media/cdrom0 iso9660 ro,nosuid,nodev 0 0", true},
        {"/dev/sdd1 /mnt/backup ntfs3 rw 0 0", true},
        {"tmpfs /mnt/scratch tmpfs rw,size=1G 0 0", true},  // a memory disk the user made
        {"//nas/photos /srv/photos cifs rw,vers=3.0 0 0", true},
        {"nas:/export/pics /net/pics nfs4 rw,relatime 0 0", true},
        {"anna@host:/pics /home/anna/remote fuse.sshfs rw,nosuid,nodev 0 0", true},
        {"/dev/sde1 /data xfs rw 0 0", true},
        {"/dev/mapper/home /var/home btrfs rw 0 0", false},  // below /var, and not anna's home
        {"sysfs /sys sysfs rw,nosuid,nodev,noexec,relatime 0 0", false},
        {"proc /proc proc rw,nosuid,nodev,noexec,relatime 0 0", false},
        {"udev /dev devtmpfs rw,nosuid,relatime 0 0", false},
        {"devpts /dev/pts devpts rw,nosuid,noexec 0 0", false},
        {"tmpfs /run tmpfs rw,nosuid,nodev,noexec 0 0", false},
        {"tmpfs /dev/shm tmpfs rw,nosuid,nodev 0 0", false},
        {"tmpfs /tmp tmpfs rw,nosuid,nodev 0 0", false},
        {"tmpfs /run/user/1000 tmpfs rw,nosuid,nodev,relatime 0 0", false},
        {"cgroup2 /sys/fs/cgroup cgroup2 rw,nosuid 0 0", false},
        {"securityfs /sys/kernel/security securityfs rw 0 0", false},
        {"systemd-1 /proc/sys/fs/binfmt_misc autofs rw,relatime 0 0", false},
        {"/dev/sda2 /boot ext4 rw,relatime 0 0", false},
        {"/dev/nvme0n1p1 /boot/efi vfat rw,relatime,fmask=0077 0 0", false},
        {"/dev/loop3 /snap/core22/1380 squashfs ro,nodev,relatime 0 0", false},
        {"overlay /var/lib/docker/overlay2/3f2a/merged overlay rw,relatime 0 0", false},
        {"/dev/nvme0n1p2 /var/lib/docker/btrfs ext4 rw 0 0", false},
        {"gvfsd-fuse /run/user/1000/gvfs fuse.gvfsd-fuse rw,nosuid,nodev 0 0", false},
        {"portal /run/user/1000/doc fuse.portal rw,nosuid,nodev 0 0", false},
        {"systemd-1 /mnt/auto autofs rw,relatime,fd=48 0 0", false},  // the mount appears below it once used
        {"/dev/sda1", false},                                         // a broken line
    };
    for (const auto& row : rows) {
        const auto entry = store::ParseMountLine(row.line);
        EXPECT_EQ(entry && store::IsUserVolume(*entry, kHome), row.offered) << row.line;
    }
}

// A home below /var (as image-based systems keep it) brings its volume along.
TEST(Volumes, TheVolumeOfHomeIsAlwaysOffered) {
    const auto entry = store::ParseMountLine("/dev/mapper/home /var/home btrfs rw 0 0");
    ASSERT_TRUE(entry);
    EXPECT_TRUE(store::IsUserVolume(*entry, "/var/home/anna"));
    EXPECT_FALSE(store::IsUserVolume(*entry, "/home/anna"));
}

TEST(Volumes, TableIsParsedEscapedSortedAndEachMountListedOnce) {
    const char* table =
        "proc /proc proc rw 0 0\n"
        "/dev/sdb1 /media/anna/HOLIDAY\\040PICS\\011tab vfat rw 0 0\n"
        "/dev/sda1 / ext4 rw 0 0\n"
        "/dev/sda1 /media/anna/HOLIDAY\\040PICS\\011tab vfat rw 0 0\r\n"   // mounted again on top
        "\n"
        "/dev/sdc1 /home ext4 rw 0 0";
    EXPECT_EQ(store::UserVolumes(table, kHome),
              (std::vector<std::string>{"/", "/home", "/media/anna/HOLIDAY PICS\ttab"}));
    const auto entry = store::ParseMountLine("a\\134b /x\\04 ext4");  // a backslash; a short escape stays as it is
    ASSERT_TRUE(entry);
    EXPECT_EQ(std::tuple(entry->device, entry->mountPoint, entry->fsType), std::tuple("a\\b", "/x\\04", "ext4"));
}

} // namespace
