#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <csignal>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <map>
#include <sys/resource.h>
#include <sys/stat.h>
#include <turbojpeg.h>
#include <unistd.h>

#include "imaging/HSLcolor.h"
#include "imaging/JpegWriter.h"
#include "store/ReplaceFile.h"

namespace fs = std::filesystem;

namespace {

using imaging::JpegError;
using imaging::JpegProperties;

// Twelve 100-pixel cells, none grey, none the same read mirrored or with red and blue swapped.
const char* const kArt[] = {"RR.B", "GYYW", ".BGR"};
int32_t CellColor(char c) {
    switch (c) {
    case 'R': return HSLcolor::JoinColor(220, 30, 20);
    case 'G': return HSLcolor::JoinColor(20, 180, 40);
    case 'B': return HSLcolor::JoinColor(30, 40, 210);
    case 'Y': return HSLcolor::JoinColor(240, 220, 30);
    case 'W': return HSLcolor::JoinColor(250, 250, 245);
    default: return HSLcolor::JoinColor(90, 60, 30);
    }
}
Picture House(int width = 400) {
    Picture p(width, 300);
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < width; ++x) p.setPixel(x, y, CellColor(kArt[y / 100][std::min(x / 100, 3)]));
    return p;
}

std::string ReadAll(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
}

// Stands in for the codec: records the calls and the record, and answers as told.
struct FakeJpeg : imaging::JpegLibrary {
    int initResult = 0;
    int writeResult = 0;
    std::vector<std::string> calls;
    JpegProperties seen;
    std::array<int, 3> firstPixel{};
    int ijlInit(JpegProperties&) override {
        calls.push_back("init");
        return initResult;
    }
    int ijlWrite(JpegProperties& props, int mode) override {
        calls.push_back("write " + std::to_string(mode));
        seen = props;
        if (props.DIBBytes) firstPixel = {props.DIBBytes[0], props.DIBBytes[1], props.DIBBytes[2]};
        // A failing codec may leave half a file behind; a good one writes it whole.
        std::string error;
        store::WriteNewFile(props.JPGFile, store::Bytes{0xFF, 0xD8, 'x'}, error);
        return writeResult;
    }
    int ijlFree(JpegProperties&) override {
        calls.push_back("free");
        return 0;
    }
};

class JpegWriter : public testing::Test {
protected:
    void SetUp() override { fs::create_directories(dir); }
    void TearDown() override {
        fs::permissions(dir, fs::perms::owner_all);
        fs::remove_all(dir);
    }
    std::string path(const char* name) const { return (dir / name).string(); }
    std::vector<std::string> Files() const {
        std::vector<std::string> names;
        for (const auto& e : fs::directory_iterator(dir)) names.push_back(e.path().filename().string());
        std::sort(names.begin(), names.end());
        return names;
    }
    void Put(const char* name, const std::string& bytes, mode_t mode = 0644) const {
        std::ofstream(path(name), std::ios::binary) << bytes;
        ::chmod(path(name).c_str(), mode);
    }
    const fs::path dir = fs::temp_directory_path() / ("jpeg_writer_" + std::to_string(::getpid()));
};

TEST_F(JpegWriter, CodecGetsTheBlockAsItLies) {
    // Width, padding; the block starts with the bottom-left pixel ('.', brown) in blue, green, red.
    for (const auto& [width, pad] : {std::pair{400, 0}, {401, 1}}) {
        FakeJpeg fake;
        ASSERT_TRUE(imaging::SaveJPGpicture(House(width), path("house.jpg"), fake));
        EXPECT_EQ(fake.calls, (std::vector<std::string>{"init", "write 8", "free"}));
        EXPECT_EQ(fake.seen.DIBWidth, width);
        EXPECT_EQ(fake.seen.DIBHeight, -300);
        EXPECT_EQ(fake.seen.DIBPadBytes, pad);
        EXPECT_EQ(fake.seen.JPGWidth, width);
        EXPECT_EQ(fake.seen.JPGHeight, 300);
        EXPECT_EQ(fake.seen.jquality, 90);
        EXPECT_EQ(fake.firstPixel, (std::array<int, 3>{30, 60, 90}));
        // The codec writes beside the target, never over it.
        EXPECT_EQ(fs::path(fake.seen.JPGFile).parent_path(), dir);
        EXPECT_NE(fake.seen.JPGFile, path("house.jpg"));
        EXPECT_EQ(Files(), std::vector<std::string>{"house.jpg"});
    }
}

TEST_F(JpegWriter, FailuresRaiseTheirTextsAndKeepTheOldFile) {
    const struct { int init, write; mode_t mode; int number; const char* text; std::vector<std::string> calls; } rows[] = {
        {-5, 0, 0644, 26001, "Failed to initialise the IJL library: -5", {"init"}},
        {0, -7, 0644, 26001, "Failed to save to JPG -7", {"init", "write 8", "free"}},
        {0, 0, 0444, 75, "is read-only", {"init", "free"}},
    };
    for (const auto& row : rows) {
        Put("old.jpg", "old picture", row.mode);
        FakeJpeg fake;
        fake.initResult = row.init;
        fake.writeResult = row.write;
        try {
            imaging::SaveJPGpicture(House(), path("old.jpg"), fake);
            ADD_FAILURE() << row.text;
        } catch (const JpegError& e) {
            EXPECT_EQ(e.number(), row.number);
            EXPECT_NE(std::string(e.what()).find(row.text), std::string::npos) << e.what();
            EXPECT_EQ(e.source(), "tintrolla.mIntelJPEGLibrary");
        }
        EXPECT_EQ(fake.calls, row.calls) << row.text;
        EXPECT_EQ(ReadAll(path("old.jpg")), "old picture");
        EXPECT_EQ(Files(), std::vector<std::string>{"old.jpg"}) << row.text;
        ::chmod(path("old.jpg").c_str(), 0644);
    }
}

TEST_F(JpegWriter, SurfaceWithoutPixelsFailsInTheWrite) {
    DibSurface empty;
    EXPECT_FALSE(empty.Create(0, 300));
    try {
        imaging::SaveJPG(empty, path("none.jpg"), 90);
        ADD_FAILURE() << "nothing to write";
    } catch (const JpegError& e) {
        EXPECT_EQ(std::string(e.what()), "Failed to save to JPG " + std::to_string(imaging::kJpegBadProperties));
    }
    EXPECT_TRUE(Files().empty());
}

TEST_F(JpegWriter, FullDiskKeepsTheOldFileByteForByte) {
    const std::string old(5000, 'o');
    Put("full.jpg", old);
    std::signal(SIGXFSZ, SIG_IGN);
    rlimit previous{};
    getrlimit(RLIMIT_FSIZE, &previous);
    const rlimit lower = {1000, previous.rlim_max};
    setrlimit(RLIMIT_FSIZE, &lower);
    try {
        imaging::SaveJPGpicture(House(), path("full.jpg"));
        ADD_FAILURE() << "a JPEG of the house fits in 1000 bytes";
    } catch (const JpegError& e) {
        EXPECT_EQ(e.number(), 26001);
        EXPECT_EQ(std::string(e.what()), "Failed to save to JPG " + std::to_string(imaging::kJpegFileFailed));
    }
    setrlimit(RLIMIT_FSIZE, &previous);
    EXPECT_EQ(ReadAll(path("full.jpg")), old);
    EXPECT_EQ(Files(), std::vector<std::string>{"full.jpg"});
}

TEST_F(JpegWriter, ReplacedFileKeepsItsTimesAndPermissions) {
    Put("house.jpg", "old", 0640);
    const timespec times[2] = {{1000000000, 123456789}, {900000000, 987654321}};
    ASSERT_EQ(::utimensat(AT_FDCWD, path("house.jpg").c_str(), times, 0), 0);
    ASSERT_TRUE(imaging::SaveJPGpicture(House(), path("house.jpg")));
    struct stat st {};
    ASSERT_EQ(::stat(path("house.jpg").c_str(), &st), 0);
    EXPECT_EQ(st.st_mode & 07777, 0640u);
    EXPECT_EQ(st.st_atim.tv_sec, times[0].tv_sec);
    EXPECT_EQ(st.st_atim.tv_nsec, times[0].tv_nsec);
    EXPECT_EQ(st.st_mtim.tv_sec, times[1].tv_sec);
    EXPECT_EQ(st.st_mtim.tv_nsec, times[1].tv_nsec);
    EXPECT_EQ(ReadAll(path("house.jpg")).substr(0, 2), "\xFF\xD8");

    // A new name gets what any new file gets: the usual permissions, the time of writing.
    struct stat reference {};
    std::string error;
    ASSERT_TRUE(store::WriteNewFile(path("reference"), {}, error));
    ASSERT_EQ(::stat(path("reference").c_str(), &reference), 0);
    ASSERT_TRUE(imaging::SaveJPGpicture(House(), path("new.jpg")));
    ASSERT_EQ(::stat(path("new.jpg").c_str(), &st), 0);
    EXPECT_EQ(st.st_mode & 07777, reference.st_mode & 07777);
    EXPECT_GE(st.st_mtim.tv_sec, reference.st_mtim.tv_sec);
}

TEST_F(JpegWriter, FileDecodesBackToThePicture) {
    ASSERT_TRUE(imaging::SaveJPGpicture(House(), path("house.jpg")));
    const std::string jpeg = ReadAll(path("house.jpg"));
    tjhandle decoder = tjInitDecompress();
    int width = 0, height = 0, subsampling = 0, colorspace = 0;
    ASSERT_EQ(tjDecompressHeader3(decoder, reinterpret_cast<const unsigned char*>(jpeg.data()), jpeg.size(), &width,
                                  &height, &subsampling, &colorspace), 0);
    ASSERT_EQ(width, 400);
    ASSERT_EQ(height, 300);
    std::vector<unsigned char> rgb(400 * 300 * 3);
    ASSERT_EQ(tjDecompress2(decoder, reinterpret_cast<const unsigned char*>(jpeg.data()), jpeg.size(), rgb.data(), 400,
                            0, 300, TJPF_RGB, 0), 0);
    tjDestroy(decoder);

    // Every cell well inside its edges holds its colour; the whole picture is close on average.
    const Picture house = House();
    double total = 0;
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) {
            const HSLcolor::RGB want = HSLcolor::SplitColor(house.pixel(x, y));
            const unsigned char* got = &rgb[static_cast<size_t>(3 * (x + 400 * y))];
            const int error[3] = {std::abs(got[0] - want.red), std::abs(got[1] - want.green), std::abs(got[2] - want.blue)};
            total += error[0] + error[1] + error[2];
            if (x % 100 >= 16 && x % 100 < 84 && y % 100 >= 16 && y % 100 < 84) {
                for (const int e : error) ASSERT_LE(e, 8) << x << "," << y;
            }
        }
    EXPECT_LT(total / (400 * 300 * 3), 3.0);
}

TEST_F(JpegWriter, QuantisationTablesAreThoseOfQualityNinety) {
    // The standard tables in natural order, scaled for quality 90: (v * 20 + 50) / 100.
    const int luma[64] = {16, 11, 10, 16, 24,  40,  51,  61,  12, 12, 14, 19, 26,  58,  60,  55,
                          14, 13, 16, 24, 40,  57,  69,  56,  14, 17, 22, 29, 51,  87,  80,  62,
                          18, 22, 37, 56, 68,  109, 103, 77,  24, 35, 55, 64, 81,  104, 113, 92,
                          49, 64, 78, 87, 103, 121, 120, 101, 72, 92, 95, 98, 112, 100, 103, 99};
    const int chroma[64] = {17, 18, 24, 47, 99, 99, 99, 99, 18, 21, 26, 66, 99, 99, 99, 99, 24, 26, 56, 99, 99, 99,
                            99, 99, 47, 66, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99,
                            99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99, 99};
    const int zigzag[64] = {0,  1,  8,  16, 9,  2,  3,  10, 17, 24, 32, 25, 18, 11, 4,  5,  12, 19, 26, 33, 40, 48,
                            41, 34, 27, 20, 13, 6,  7,  14, 21, 28, 35, 42, 49, 56, 57, 50, 43, 36, 29, 22, 15, 23,
                            30, 37, 44, 51, 58, 59, 52, 45, 38, 31, 39, 46, 53, 60, 61, 54, 47, 55, 62, 63};

    ASSERT_TRUE(imaging::SaveJPGpicture(House(), path("house.jpg")));
    const std::string jpeg = ReadAll(path("house.jpg"));
    std::map<int, std::vector<int>> tables;
    for (size_t at = 2; at + 4 <= jpeg.size() && static_cast<uint8_t>(jpeg[at + 1]) != 0xDA;) {
        const size_t length = static_cast<uint8_t>(jpeg[at + 2]) * 256u + static_cast<uint8_t>(jpeg[at + 3]);
        if (static_cast<uint8_t>(jpeg[at + 1]) == 0xDB)
            for (size_t p = at + 4; p + 65 <= at + 2 + length; p += 65)
                for (int k = 0; k < 64; ++k) tables[jpeg[p] & 0x0F].push_back(static_cast<uint8_t>(jpeg[p + 1 + k]));
        at += 2 + length;
    }
    ASSERT_EQ(tables.size(), 2u);
    for (const auto& [id, base] : {std::pair{0, luma}, {1, chroma}})
        for (int k = 0; k < 64; ++k)
            EXPECT_EQ(tables[id][static_cast<size_t>(k)], std::max(1, (base[zigzag[k]] * 20 + 50) / 100)) << id << ":" << k;
}

} // namespace
