#include "imaging/JpegWriter.h"

#include <climits>
#include <turbojpeg.h>
#include <unistd.h>

#include "store/ReplaceFile.h"

namespace imaging {

namespace {

class TurboJpegLibrary : public JpegLibrary {
public:
    int ijlInit(JpegProperties& props) override {
        props = JpegProperties{};
        props.codec = tjInitCompress();
        return props.codec ? 0 : kJpegCodecFailed;
    }

    int ijlWrite(JpegProperties& props, int mode) override {
        const int32_t height = props.DIBHeight < 0 ? -props.DIBHeight : props.DIBHeight;
        const int64_t stride = int64_t{props.DIBWidth} * 3 + props.DIBPadBytes;
        if (mode != kWriteWholeImageToFile || !props.codec || !props.DIBBytes || props.DIBWidth <= 0 || height <= 0 ||
            props.DIBPadBytes < 0 || props.DIBPadBytes > 3 || stride > INT32_MAX || props.JPGWidth != props.DIBWidth ||
            props.JPGHeight != height || props.JPGFile.empty())
            return kJpegBadProperties;
        unsigned char* jpeg = nullptr;
        unsigned long size = 0;
        // The block goes in as it lies: bottom-up rows with their padding.
        const int flags = (props.DIBHeight < 0 ? TJFLAG_BOTTOMUP : 0);
        if (tjCompress2(static_cast<tjhandle>(props.codec), props.DIBBytes, props.DIBWidth, static_cast<int>(stride),
                        height, TJPF_BGR, &jpeg, &size, TJSAMP_420, props.jquality, flags) != 0) {
            tjFree(jpeg);
            return kJpegCodecFailed;
        }
        const store::Bytes bytes(jpeg, jpeg + size);
        tjFree(jpeg);
        std::string error;
        return store::WriteNewFile(props.JPGFile, bytes, error) ? 0 : kJpegFileFailed;
    }

    int ijlFree(JpegProperties& props) override {
        const int result = props.codec ? tjDestroy(static_cast<tjhandle>(props.codec)) : 0;
        props.codec = nullptr;
        return result == 0 ? 0 : kJpegCodecFailed;
    }
};

} // namespace

JpegLibrary& TurboJpeg() {
    static TurboJpegLibrary library;
    return library;
}

bool SaveJPG(const DibSurface& surface, const std::string& fileName, int32_t quality, JpegLibrary& library) {
    JpegProperties props;
    const int init = library.ijlInit(props);
    if (init != 0) throw JpegError(kJpegErrorNumber, kInitFailedText + std::to_string(init));

    // The old file stays where it is until the new one is complete.
    store::ReplacedFile old;
    std::string problem;
    if (!store::InspectTarget(fileName, old, problem)) {
        library.ijlFree(props);
        throw JpegError(kFileAccessErrorNumber, "Path/File access error: " + problem);
    }
    const std::string temp = store::TempNameBeside(old.path);

    props.DIBBytes = surface.DIBSectionBitsPtr();
    props.DIBWidth = surface.Width();
    props.DIBHeight = -surface.Height();
    props.DIBPadBytes = surface.BytesPerScanLine() - 3 * surface.Width();
    props.JPGFile = temp;
    props.JPGWidth = surface.Width();
    props.JPGHeight = surface.Height();
    props.jquality = quality;

    const int written = library.ijlWrite(props, kWriteWholeImageToFile);
    if (written != 0) {
        library.ijlFree(props);
        ::unlink(temp.c_str());  // whatever part of it the codec managed
        throw JpegError(kJpegErrorNumber, kSaveFailedText + std::to_string(written));
    }
    const bool placed = store::MoveIntoPlace(temp, old, true, problem);
    library.ijlFree(props);
    if (!placed) throw JpegError(kFileAccessErrorNumber, "Path/File access error: " + problem);
    return true;
}

bool SaveJPGpicture(const Picture& picture, const std::string& fileName, JpegLibrary& library) {
    DibSurface surface;
    surface.CreateFromPicture(picture);
    return SaveJPG(surface, fileName, 90, library);
}

} // namespace imaging
