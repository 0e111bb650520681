#include <gtest/gtest.h>

#include <csignal>
#include <filesystem>
#include <fstream>
#include <sys/resource.h>
#include <unistd.h>

#include "store/SafeFile.h"

namespace fs = std::filesystem;

namespace {

store::Bytes Slurp(const fs::path& p) {
    std::ifstream in(p, std::ios::binary);
    return store::Bytes(std::istreambuf_iterator<char>(in), {});
}

// Lowers the file-size limit for one scope, so writes past it fail partway.
class FileSizeLimit {
public:
    explicit FileSizeLimit(rlim_t bytes) {
        previousHandler_ = std::signal(SIGXFSZ, SIG_IGN);
        getrlimit(RLIMIT_FSIZE, &previous_);
        rlimit lower = previous_;
        lower.rlim_cur = bytes;
        setrlimit(RLIMIT_FSIZE, &lower);
    }
    ~FileSizeLimit() {
        setrlimit(RLIMIT_FSIZE, &previous_);
        std::signal(SIGXFSZ, previousHandler_);
    }

private:
    rlimit previous_{};
    void (*previousHandler_)(int) = nullptr;
};

class SafeFile : public testing::Test {
protected:
    void SetUp() override {
        dir = fs::temp_directory_path() / ("safe_file_" + std::to_string(::getpid()));
        fs::create_directories(dir);
    }
    void TearDown() override { fs::remove_all(dir); }
    fs::path dir;
};

TEST_F(SafeFile, ReplacesWholeAndLeavesNoTemporary) {
    const fs::path target = dir / "house.bmp";
    std::string error;
    ASSERT_TRUE(store::WriteFileSafely(target.string(), store::Bytes(1000, 0xAB), error));
    ASSERT_TRUE(store::WriteFileSafely(target.string(), store::Bytes{1, 2, 3}, error));
    EXPECT_EQ(Slurp(target), (store::Bytes{1, 2, 3}));
    EXPECT_EQ(std::distance(fs::directory_iterator(dir), fs::directory_iterator()), 1);
}

TEST_F(SafeFile, WriteFailingPartwayKeepsTheOldFile) {
    const fs::path target = dir / "house.msk";
    std::string error;
    const store::Bytes old(5000, 0x11);
    ASSERT_TRUE(store::WriteFileSafely(target.string(), old, error));
    {
        FileSizeLimit limit(3000);   // the new content would need 8000 bytes
        EXPECT_FALSE(store::WriteFileSafely(target.string(), store::Bytes(8000, 0x22), error));
    }
    EXPECT_FALSE(error.empty());
    EXPECT_EQ(Slurp(target), old);
    EXPECT_EQ(std::distance(fs::directory_iterator(dir), fs::directory_iterator()), 1);
}

TEST_F(SafeFile, MissingFolderIsAnErrorNotACrash) {
    std::string error;
    EXPECT_FALSE(store::WriteFileSafely((dir / "nowhere" / "x.msk").string(), store::Bytes{1}, error));
    EXPECT_FALSE(error.empty());
    store::Bytes bytes;
    EXPECT_FALSE(store::ReadFileHead((dir / "nowhere" / "x.msk").string(), 10, bytes));
}

TEST_F(SafeFile, ReadsNoMoreThanAsked) {
    std::string error;
    ASSERT_TRUE(store::WriteFileSafely((dir / "f").string(), store::Bytes(100, 7), error));
    store::Bytes bytes;
    ASSERT_TRUE(store::ReadFileHead((dir / "f").string(), 40, bytes));
    EXPECT_EQ(bytes.size(), 40u);
    ASSERT_TRUE(store::ReadFileHead((dir / "f").string(), 400, bytes));
    EXPECT_EQ(bytes.size(), 100u);
}

} // namespace
