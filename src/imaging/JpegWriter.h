#pragma once
#include <cstdint>
#include <stdexcept>
#include <string>

#include "imaging/DibSurface.h"
#include "paint/Picture.h"

// Writes pictures as JPEG files through a codec driven in three calls on one
// properties record: ijlInit, ijlWrite, ijlFree. The program's codec is
// libjpeg-turbo (TurboJpeg()); tests hand in their own.
namespace imaging {

// The record the writer fills for the codec; it sets these fields and no others.
struct JpegProperties {
    const uint8_t* DIBBytes = nullptr;  // first byte of the block (its bottom row)
    int32_t DIBWidth = 0;
    int32_t DIBHeight = 0;              // negative: rows run bottom-up
    int32_t DIBPadBytes = 0;            // 0..3 bytes at the end of each row
    std::string JPGFile;                // the file to create
    int32_t JPGWidth = 0;
    int32_t JPGHeight = 0;
    int32_t jquality = 0;
    void* codec = nullptr;              // the codec's own state from init to free
};

// ijlWrite's mode: compress the whole image into the file JPGFile.
inline constexpr int kWriteWholeImageToFile = 8;

// Results of the program's codec besides 0 (success).
inline constexpr int kJpegCodecFailed = -1;    // libjpeg-turbo refused or failed
inline constexpr int kJpegBadProperties = -2;  // no pixels, a size that does not fit, an unknown mode
inline constexpr int kJpegFileFailed = -3;     // the file could not be created or written whole

class JpegLibrary {
public:
    virtual ~JpegLibrary() = default;
    virtual int ijlInit(JpegProperties& props) = 0;
    virtual int ijlWrite(JpegProperties& props, int mode) = 0;
    virtual int ijlFree(JpegProperties& props) = 0;
};

// libjpeg-turbo: 4:2:0 subsampling, the block taken bottom-up as it lies.
JpegLibrary& TurboJpeg();

inline constexpr int kJpegErrorNumber = 26001;
inline constexpr int kFileAccessErrorNumber = 75;
inline constexpr const char* kJpegErrorSource = "tintrolla.mIntelJPEGLibrary";
inline constexpr const char* kInitFailedText = "Failed to initialise the IJL library: ";
inline constexpr const char* kSaveFailedText = "Failed to save to JPG ";

// A failure of the writer: number 26001 with the codec's result in the text,
// or 75 when the target may not be replaced.
class JpegError : public std::runtime_error {
public:
    JpegError(int number, const std::string& description) : std::runtime_error(description), number_(number) {}
    int number() const { return number_; }
    std::string source() const { return kJpegErrorSource; }
    std::string description() const { return what(); }

private:
    int number_;
};

// Writes the surface's block to `fileName` at `quality`. The new file is made
// beside the old one and moved into place only once it is complete, taking
// over the old file's permission bits and access and modification times; a
// read-only file is left as it was. True when written; failures throw JpegError.
bool SaveJPG(const DibSurface& surface, const std::string& fileName, int32_t quality,
             JpegLibrary& library = TurboJpeg());

// The picture through a surface at quality 90.
bool SaveJPGpicture(const Picture& picture, const std::string& fileName, JpegLibrary& library = TurboJpeg());

} // namespace imaging
