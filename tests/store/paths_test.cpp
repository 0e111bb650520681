#include <gtest/gtest.h>

#include "store/Paths.h"

namespace {

struct PathRow {
    const char* path;
    const char* stripped;   // StripExtension
    const char* noSlash;    // StripTrailingBackslash
    const char* folder;     // FolderOf
    const char* name;       // FileNameOf
};

const PathRow kRows[] = {
    {"/A.B/house", "/A.B/house", "/A.B/house", "/A.B/", "house"},
    {"/A.B/house.bmp", "/A.B/house", "/A.B/house.bmp", "/A.B/", "house.bmp"},
    {"house.tar.gz", "house.tar", "house.tar.gz", "", ""},
    {"/PICS/house.bmp", "/PICS/house", "/PICS/house.bmp", "/PICS/", "house.bmp"},
    {"/PICS/", "/PICS/", "/PICS", "/", "PICS"},
    {"house.bmp", "house", "house.bmp", "", ""},
    {"", "", "", "", ""},
    {"/", "/", "", "", ""},
    {"/my.folder/PICS/house", "/my.folder/PICS/house", "/my.folder/PICS/house", "/my.folder/PICS/", "house"},
    {"/p/.hidden", "/p/", "/p/.hidden", "/p/", ".hidden"},
    {"/p/From Clipboard.xyz", "/p/From Clipboard", "/p/From Clipboard.xyz", "/p/", "From Clipboard.xyz"},
};

class PathHelpers : public testing::TestWithParam<PathRow> {};

TEST_P(PathHelpers, FollowTheLastSlashAndDot) {
    const PathRow& r = GetParam();
    EXPECT_EQ(store::StripExtension(r.path), r.stripped);
    EXPECT_EQ(store::StripTrailingBackslash(r.path), r.noSlash);
    EXPECT_EQ(store::FolderOf(r.path), r.folder);
    EXPECT_EQ(store::FileNameOf(r.path), r.name);
}

INSTANTIATE_TEST_SUITE_P(Table, PathHelpers, testing::ValuesIn(kRows));

TEST(PathHelpers, BaseOfAWorkReachesAllFourFiles) {
    // The mask reader gets the .bmo path, the writer the bare base: both land on one name.
    EXPECT_EQ(store::StripExtension("/PICS/garden.bmo") + ".msk", store::StripExtension("/PICS/garden") + ".msk");
}

} // namespace
