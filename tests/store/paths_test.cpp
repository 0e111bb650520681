#include <gtest/gtest.h>

#include "store/Paths.h"

TEST(PathHelpers, FollowTheLastSlashAndDot) {
    struct Row { const char *path, *stripped, *noSlash, *folder, *name; };
    const Row rows[] = {
        {"/A.B/house", "/A.B/house", "/A.B/house", "/A.B/", "house"},   // a dot in a folder is never cut
        {"/A.B/house.bmp", "/A.B/house", "/A.B/house.bmp", "/A.B/", "house.bmp"},
        {"house.tar.gz", "house.tar", "house.tar.gz", "", ""},          // a bare name has no file name
        {"/PICS/", "/PICS/", "/PICS", "/", "PICS"},
        {"/p/.hidden", "/p/", "/p/.hidden", "/p/", ".hidden"},
        {"", "", "", "", ""},
    };
    for (const Row& r : rows) {
        EXPECT_EQ(store::StripExtension(r.path), r.stripped) << r.path;
        EXPECT_EQ(store::StripTrailingBackslash(r.path), r.noSlash) << r.path;
        EXPECT_EQ(store::FolderOf(r.path), r.folder) << r.path;
        EXPECT_EQ(store::FileNameOf(r.path), r.name) << r.path;
    }
}
