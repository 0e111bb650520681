#include "scheme/SchemeFile.h"

#include <gtest/gtest.h>

#include <cstring>
#include <filesystem>

#include "scheme/FileBytes.h"

namespace {

using Bytes = std::vector<uint8_t>;

Bytes Slice(const Bytes& b, size_t from, size_t count) {
    return Bytes(b.begin() + static_cast<long>(from), b.begin() + static_cast<long>(from + count));
}

TEST(SchemeFileBytes, StartupSchemeIs224BytesWithNoColourAndNoReference) {
    const Bytes bytes = SchemeFile::Encode(StartupColorBoxes());
    ASSERT_EQ(bytes.size(), 224u);
    size_t pos = 0;
    for (const char* name : {"Ceiling", "Cornice", "Upper Wall", "Picture Rail", "Lower Wall", "Skirting Board",
                             "Door Frames", "Floor", "Extra 1", "Extra 2", "Extra 3", "Extra 4"}) {
        const size_t n = std::strlen(name);
        EXPECT_EQ(Slice(bytes, pos, 2), (Bytes{static_cast<uint8_t>(n), 0})) << name;
        EXPECT_EQ(std::string(bytes.begin() + static_cast<long>(pos + 2), bytes.begin() + static_cast<long>(pos + 2 + n)), name);
        EXPECT_EQ(Slice(bytes, pos + 2 + n, 8), (Bytes{0x0F, 0, 0, 0x80, 0, 0, 0, 0})) << name;
        pos += 10 + n;
    }
}

TEST(SchemeFileBytes, PaintedSchemeRoundTripsWithNamesInWindows1252) {
    ColorBoxes boxes = StartupColorBoxes();
    boxes[1] = {"€ ✓ü", 0x8040C0, 0x010203};
    boxes[2] = {"Bad \xC3(", 0x0000FF, 0};
    boxes[12] = {"", 0, 0x00FF00};
    Bytes bytes = SchemeFile::Encode(boxes);
    EXPECT_EQ(Slice(bytes, 0, 16), (Bytes{4, 0, 0x80, ' ', '?', 0xFC, 0xC0, 0x40, 0x80, 0, 3, 2, 1, 0, 6, 0}));
    bytes.insert(bytes.end(), {0xFF, 0xFF, 0x01});  // ignored
    const SchemeFile::Decoded d = SchemeFile::Decode(bytes);
    ASSERT_TRUE(d.ok) << d.problem;
    boxes[1].name = "€ ?ü";
    boxes[2].name = "Bad ?(";
    EXPECT_EQ(d.boxes, boxes);
    EXPECT_EQ(SchemeFile::FromWindows1252(std::string("A\x81" "B\x9D\xE9", 5)), "A?B?é");  // undefined bytes
}

TEST(SchemeFileBytes, DamagedRecordsAreRefused) {
    // Bytes laid over the start-up scheme at `at`; box 1's colour is at 9,
    // its reference at 13, box 2's colour at 26. An empty problem means sound.
    struct Row { size_t at; Bytes patch; std::string problem; };
    const Row rows[] = {{0, {0xFF, 0xFF}, "The name of box 1 has a negative length (-1)."},
                        {0, {222, 0}, "The file ends inside the record of box 1."},
                        {0, {223, 0}, "The name of box 1 runs past the end of the file."},
                        {0, {0, 0}, "The colour of box 1 is not a colour value"},  // "Ceil" read as a colour
                        {29, {0x01}, "The colour of box 2 is not a colour value"},
                        {29, {0x80}, ""},
                        {16, {0x01}, "The reference of box 1 is not a colour value"}};
    for (const Row& r : rows) {
        Bytes bytes = SchemeFile::Encode(StartupColorBoxes());
        std::copy(r.patch.begin(), r.patch.end(), bytes.begin() + static_cast<long>(r.at));
        const SchemeFile::Decoded d = SchemeFile::Decode(bytes);
        EXPECT_EQ(d.ok, r.problem.empty()) << r.problem;
        EXPECT_EQ(d.problem.substr(0, r.problem.size()), r.problem);
    }
}

TEST(SchemeFilePath, LastExtensionOfTheFileNameBecomesCsc) {
    const std::pair<std::string, std::string> rows[] = {
        {"/p/garden.bmp", "/p/garden.csc"}, {"/p/garden", "/p/garden.csc"}, {"/p/.hidden", "/p/.csc"},
        {"/p/my.house.front.jpg", "/p/my.house.front.csc"}, {"house.", "house.csc"},
        {"/My.Folder/v1.2/house", "/My.Folder/v1.2/house.csc"}, {"/a.b/", "/a.b/.csc"}};
    for (const auto& [given, scheme] : rows) EXPECT_EQ(SchemeFile::SchemePath(given), scheme) << given;
}

namespace fs = std::filesystem;

class FileBytesTest : public ::testing::Test {
protected:
    void SetUp() override {
        std::string pattern = (fs::temp_directory_path() / "filebytes.XXXXXX").string();
        ASSERT_NE(::mkdtemp(pattern.data()), nullptr);
        dir = pattern;
    }
    void TearDown() override { fs::remove_all(dir); }
    size_t Entries() const { return static_cast<size_t>(std::distance(fs::directory_iterator(dir), {})); }
    fs::path dir;
    std::string problem;
};

TEST_F(FileBytesTest, CommitReplacesTheFileKeepsItsModeAndLeavesNoTemporaryFile) {
    const std::string path = (dir / "house.csc").string();
    ASSERT_TRUE(FileBytes::CommitFile(path, {1, 2, 3, 4, 5, 6, 7}, problem)) << problem;
    fs::permissions(path, fs::perms(0640));
    ASSERT_TRUE(FileBytes::CommitFile(path, {0x41, 0x00, 0x42}, problem)) << problem;
    std::vector<uint8_t> back;
    ASSERT_TRUE(FileBytes::ReadFile(path, back, 100, problem));
    EXPECT_EQ(back, (std::vector<uint8_t>{0x41, 0x00, 0x42}));
    ASSERT_TRUE(FileBytes::ReadFile(path, back, 2, problem));  // reading stops at the limit
    EXPECT_EQ(back, (std::vector<uint8_t>{0x41, 0x00}));
    EXPECT_EQ(Entries(), 1u);
    EXPECT_EQ(fs::status(path).permissions(), fs::perms(0640));
}

TEST_F(FileBytesTest, FailuresCreateNothingAndLeaveNothingBehind) {
    std::vector<uint8_t> bytes;
    EXPECT_FALSE(FileBytes::ReadFile((dir / "nothing.csc").string(), bytes, 100, problem));
    EXPECT_EQ(problem, "The file does not exist.");
    EXPECT_FALSE(FileBytes::CommitFile((dir / "gone" / "house.csc").string(), {1, 2}, problem));
    EXPECT_EQ(problem, "The folder does not exist.");
    fs::create_directory(dir / "taken.csc");
    EXPECT_FALSE(FileBytes::CommitFile((dir / "taken.csc").string(), {1, 2}, problem));
    EXPECT_EQ(Entries(), 1u);
}

} // namespace
