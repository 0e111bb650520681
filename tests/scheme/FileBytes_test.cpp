#include "scheme/FileBytes.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "scheme/SchemeFile.h"

namespace {

namespace fs = std::filesystem;

class FileBytesTest : public ::testing::Test {
protected:
    void SetUp() override {
        std::string pattern = (fs::temp_directory_path() / "filebytes.XXXXXX").string();
        ASSERT_NE(::mkdtemp(pattern.data()), nullptr);
        dir = pattern;
    }
    void TearDown() override { fs::remove_all(dir); }
    size_t EntriesInDir() const {
        return static_cast<size_t>(std::distance(fs::directory_iterator(dir), fs::directory_iterator()));
    }
    fs::path dir;
};

TEST_F(FileBytesTest, ReadingAMissingFileDoesNotCreateIt) {
    const std::string path = (dir / "nothing.csc").string();
    std::vector<uint8_t> bytes{1, 2, 3};
    std::string problem;
    EXPECT_FALSE(FileBytes::ReadFile(path, bytes, 100, problem));
    EXPECT_EQ(problem, "The file does not exist.");
    EXPECT_FALSE(fs::exists(path));
    EXPECT_EQ(bytes, (std::vector<uint8_t>{1, 2, 3}));
}

TEST_F(FileBytesTest, ReadingAFolderFails) {
    std::vector<uint8_t> bytes;
    std::string problem;
    EXPECT_FALSE(FileBytes::ReadFile(dir.string(), bytes, 100, problem));
    EXPECT_FALSE(problem.empty());
}

TEST_F(FileBytesTest, CommitReplacesTheFileAndLeavesNoTemporaryFile) {
    const std::string path = (dir / "house.csc").string();
    { std::ofstream(path, std::ios::binary) << "old content that is longer"; }
    ::chmod(path.c_str(), 0640);
    std::string problem;
    ASSERT_TRUE(FileBytes::CommitFile(path, {0x41, 0x00, 0x42}, problem)) << problem;
    std::vector<uint8_t> back;
    ASSERT_TRUE(FileBytes::ReadFile(path, back, 100, problem));
    EXPECT_EQ(back, (std::vector<uint8_t>{0x41, 0x00, 0x42}));
    EXPECT_EQ(EntriesInDir(), 1u);
    struct stat info {};
    ASSERT_EQ(::stat(path.c_str(), &info), 0);
    EXPECT_EQ(info.st_mode & 0777, 0640u);
}

TEST_F(FileBytesTest, ReadStopsAtTheLimit) {
    const std::string path = (dir / "big.bin").string();
    { std::ofstream(path, std::ios::binary) << std::string(1000, 'x'); }
    std::vector<uint8_t> bytes;
    std::string problem;
    ASSERT_TRUE(FileBytes::ReadFile(path, bytes, 10, problem));
    EXPECT_EQ(bytes.size(), 10u);
}

TEST_F(FileBytesTest, CommitIntoAMissingFolderFailsCleanly) {
    const std::string path = (dir / "gone" / "house.csc").string();
    std::string problem;
    EXPECT_FALSE(FileBytes::CommitFile(path, {1, 2}, problem));
    EXPECT_EQ(problem, "The folder does not exist.");
    EXPECT_EQ(EntriesInDir(), 0u);
}

TEST_F(FileBytesTest, CommitOverAFolderKeepsTheFolderAndCleansUp) {
    fs::create_directory(dir / "taken.csc");
    std::string problem;
    EXPECT_FALSE(FileBytes::CommitFile((dir / "taken.csc").string(), {1, 2}, problem));
    EXPECT_FALSE(problem.empty());
    EXPECT_TRUE(fs::is_directory(dir / "taken.csc"));
    EXPECT_EQ(EntriesInDir(), 1u);
}

TEST_F(FileBytesTest, SchemeWrittenToDiskReadsBack) {
    ColorBoxes boxes = StartupColorBoxes();
    boxes[8] = {"Décor", 0x336699, 0x996633};
    const std::string path = (dir / "s.csc").string();
    std::string problem;
    ASSERT_TRUE(SchemeFile::Write(path, boxes, problem)) << problem;
    EXPECT_EQ(fs::file_size(path), 224u - 5u + 5u);  // "Floor" and "Décor" are both 5 bytes
    std::vector<uint8_t> bytes;
    ASSERT_TRUE(SchemeFile::Read(path, bytes, problem)) << problem;
    const SchemeFile::Decoded d = SchemeFile::Decode(bytes);
    ASSERT_TRUE(d.ok) << d.problem;
    EXPECT_EQ(d.boxes[8], boxes[8]);
}

} // namespace
