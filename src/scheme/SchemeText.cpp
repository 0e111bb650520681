// Name text between the program (UTF-8) and the scheme file (Windows-1252).
#include <iconv.h>

#include <algorithm>
#include <cerrno>
#include <string>

#include "scheme/SchemeFile.h"

namespace {

class Converter {
public:
    Converter(const char* to, const char* from) : cd_(iconv_open(to, from)) {}
    ~Converter() {
        if (ok()) iconv_close(cd_);
    }
    Converter(const Converter&) = delete;
    Converter& operator=(const Converter&) = delete;
    bool ok() const { return cd_ != reinterpret_cast<iconv_t>(-1); }

    // Converts `in`; whatever cannot be converted becomes "?", skipping the
    // `skip(p, left)` input bytes of that one character.
    template <typename Skip>
    std::string run(const std::string& in, size_t outPerIn, Skip skip) {
        std::string out(in.size() * outPerIn + 4, '\0');
        char* src = const_cast<char*>(in.data());
        size_t srcLeft = in.size();
        char* dst = out.data();
        size_t dstLeft = out.size();
        while (srcLeft > 0) {
            if (iconv(cd_, &src, &srcLeft, &dst, &dstLeft) != static_cast<size_t>(-1)) break;
            if (errno != EILSEQ && errno != EINVAL) break;  // output is sized so E2BIG cannot happen
            *dst++ = '?';
            --dstLeft;
            const size_t n = std::max<size_t>(1, std::min(srcLeft, skip(reinterpret_cast<const unsigned char*>(src), srcLeft)));
            src += n;
            srcLeft -= n;
            iconv(cd_, nullptr, nullptr, nullptr, nullptr);
        }
        out.resize(out.size() - dstLeft);
        return out;
    }

private:
    iconv_t cd_;
};

// Bytes of the UTF-8 character at p: its lead byte and the continuation
// bytes that follow it (a stray byte counts alone).
size_t Utf8Length(const unsigned char* p, size_t left) {
    const unsigned char lead = p[0];
    const size_t want = (lead >= 0xF0 && lead <= 0xF4) ? 4 : (lead >= 0xE0 && lead <= 0xEF) ? 3 : (lead >= 0xC2 && lead <= 0xDF) ? 2 : 1;
    size_t n = 1;
    while (n < want && n < left && (p[n] & 0xC0) == 0x80) ++n;
    return n;
}

// Without a converter only plain ASCII survives.
std::string AsciiOnly(const std::string& in, size_t (*skip)(const unsigned char*, size_t)) {
    std::string out;
    for (size_t i = 0; i < in.size();) {
        const auto c = static_cast<unsigned char>(in[i]);
        if (c < 0x80) {
            out += static_cast<char>(c);
            ++i;
        } else {
            out += '?';
            i += skip(reinterpret_cast<const unsigned char*>(in.data()) + i, in.size() - i);
        }
    }
    return out;
}

size_t OneByte(const unsigned char*, size_t) { return 1; }

} // namespace

namespace SchemeFile {

std::string ToWindows1252(const std::string& utf8) {
    Converter conv("WINDOWS-1252", "UTF-8");
    if (!conv.ok()) return AsciiOnly(utf8, Utf8Length);
    return conv.run(utf8, 1, Utf8Length);
}

std::string FromWindows1252(const std::string& bytes) {
    Converter conv("UTF-8", "WINDOWS-1252");
    if (!conv.ok()) return AsciiOnly(bytes, OneByte);
    return conv.run(bytes, 3, OneByte);
}

} // namespace SchemeFile
