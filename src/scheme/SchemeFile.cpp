#include "scheme/SchemeFile.h"

#include <algorithm>

#include "scheme/FileBytes.h"

namespace SchemeFile {

std::string SchemePath(const std::string& path) {
    const size_t slash = path.rfind('/');
    const size_t nameStart = slash == std::string::npos ? 0 : slash + 1;
    const size_t dot = path.rfind('.');
    const bool inFileName = dot != std::string::npos && dot >= nameStart;
    return (inFileName ? path.substr(0, dot) : path) + ".csc";
}

namespace {

void PutInt16(std::vector<uint8_t>& out, int v) {
    out.push_back(static_cast<uint8_t>(v & 0xFF));
    out.push_back(static_cast<uint8_t>((v >> 8) & 0xFF));
}

void PutInt32(std::vector<uint8_t>& out, int32_t v) {
    const auto u = static_cast<uint32_t>(v);
    for (int shift = 0; shift < 32; shift += 8) out.push_back(static_cast<uint8_t>((u >> shift) & 0xFFu));
}

int16_t GetInt16(const uint8_t* p) { return static_cast<int16_t>(static_cast<uint16_t>(p[0] | (p[1] << 8))); }

int32_t GetInt32(const uint8_t* p) {
    const uint32_t u = uint32_t{p[0]} | (uint32_t{p[1]} << 8) | (uint32_t{p[2]} << 16) | (uint32_t{p[3]} << 24);
    return static_cast<int32_t>(u);
}

bool IsColorValue(int32_t v) { return v >= 0 && v <= 0xFFFFFF; }

Decoded Fail(std::string problem) {
    Decoded d;
    d.problem = std::move(problem);
    return d;
}

std::string Box(int i) { return "box " + std::to_string(i); }

} // namespace

std::vector<uint8_t> Encode(const ColorBoxes& boxes) {
    std::vector<uint8_t> out;
    for (int i = 1; i <= kColorBoxCount; ++i) {
        std::string name = ToWindows1252(boxes[i].name);
        if (name.size() > static_cast<size_t>(kMaxNameBytes)) name.resize(kMaxNameBytes);
        PutInt16(out, static_cast<int>(name.size()));
        out.insert(out.end(), name.begin(), name.end());
        PutInt32(out, boxes[i].color);
        PutInt32(out, boxes[i].reference);
    }
    return out;
}

Decoded Decode(const uint8_t* data, size_t size) {
    if (size == 0) return Fail("The file is empty.");
    Decoded result;
    size_t pos = 0;
    for (int i = 1; i <= kColorBoxCount; ++i) {
        const size_t left = size - pos;
        if (left == 0)
            return Fail("The file holds only " + std::to_string(i - 1) + " of the 12 colour boxes.");
        if (left < 2) return Fail("The file ends inside the record of " + Box(i) + ".");
        const int n = GetInt16(data + pos);
        pos += 2;
        if (n < 0)
            return Fail("The name of " + Box(i) + " has a negative length (" + std::to_string(n) + ").");
        if (static_cast<size_t>(n) > size - pos)
            return Fail("The name of " + Box(i) + " runs past the end of the file.");
        const std::string name(reinterpret_cast<const char*>(data + pos), static_cast<size_t>(n));
        pos += static_cast<size_t>(n);
        if (size - pos < 8) return Fail("The file ends inside the record of " + Box(i) + ".");
        const int32_t color = GetInt32(data + pos);
        const int32_t reference = GetInt32(data + pos + 4);
        pos += 8;
        if (color != kButtonFace && !IsColorValue(color))
            return Fail("The colour of " + Box(i) + " is not a colour value (" + std::to_string(color) + ").");
        if (!IsColorValue(reference))
            return Fail("The reference of " + Box(i) + " is not a colour value (" + std::to_string(reference) + ").");
        result.boxes[i] = ColorBox{FromWindows1252(name), color, reference};
    }
    result.ok = true;
    return result;
}

bool Read(const std::string& path, std::vector<uint8_t>& bytes, std::string& problem) {
    return FileBytes::ReadFile(path, bytes, kMaxSchemeBytes, problem);
}

bool Write(const std::string& path, const ColorBoxes& boxes, std::string& problem) {
    return FileBytes::CommitFile(path, Encode(boxes), problem);
}

} // namespace SchemeFile
