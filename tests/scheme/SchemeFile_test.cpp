#include "scheme/SchemeFile.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using Bytes = std::vector<uint8_t>;

Bytes Slice(const Bytes& b, size_t from, size_t count) {
    return Bytes(b.begin() + static_cast<long>(from), b.begin() + static_cast<long>(from + count));
}

// A scheme with colours, references and changed names, different in every box.
ColorBoxes PaintedScheme() {
    ColorBoxes boxes = StartupColorBoxes();
    boxes[1] = {"Sky Blue Ceiling", 0xE0C080, 0x406080};
    boxes[2] = {"", 0x0000FF, 0};
    boxes[3].color = 0x00FF00;
    boxes[5] = {"Café wall", 0x123456, 0xFFFFFF};
    boxes[7].reference = 0x010203;
    boxes[12] = {"Extra 4", 0, 0x00FF00};
    return boxes;
}

TEST(SchemeFileBytes, StartupSchemeIs224BytesWithNoColourAndNoReference) {
    const Bytes bytes = SchemeFile::Encode(StartupColorBoxes());
    ASSERT_EQ(bytes.size(), 224u);
    const char* names[] = {"Ceiling", "Cornice", "Upper Wall", "Picture Rail", "Lower Wall", "Skirting Board",
                           "Door Frames", "Floor", "Extra 1", "Extra 2", "Extra 3", "Extra 4"};
    size_t pos = 0;
    for (const char* name : names) {
        const std::string expected(name);
        SCOPED_TRACE(expected);
        EXPECT_EQ(Slice(bytes, pos, 2), (Bytes{static_cast<uint8_t>(expected.size()), 0}));
        EXPECT_EQ(std::string(bytes.begin() + static_cast<long>(pos + 2),
                              bytes.begin() + static_cast<long>(pos + 2 + expected.size())),
                  expected);
        pos += 2 + expected.size();
        EXPECT_EQ(Slice(bytes, pos, 4), (Bytes{0x0F, 0x00, 0x00, 0x80}));
        EXPECT_EQ(Slice(bytes, pos + 4, 4), (Bytes{0, 0, 0, 0}));
        pos += 8;
    }
    EXPECT_EQ(pos, bytes.size());
}

struct ColourBytesCase {
    int32_t color;
    Bytes stored;
};

class SchemeFileColourBytes : public ::testing::TestWithParam<ColourBytesCase> {};

TEST_P(SchemeFileColourBytes, ColourIsStoredLittleEndianRedFirst) {
    ColorBoxes boxes = StartupColorBoxes();
    boxes[1].color = GetParam().color;
    boxes[1].reference = GetParam().color;
    const Bytes bytes = SchemeFile::Encode(boxes);
    EXPECT_EQ(Slice(bytes, 2 + 7, 4), GetParam().stored);      // "Ceiling" is 7 bytes
    EXPECT_EQ(Slice(bytes, 2 + 7 + 4, 4), GetParam().stored);
    EXPECT_EQ(Slice(bytes, 2 + 7 + 8, 2), (Bytes{7, 0}));      // box 2 starts right after
}

INSTANTIATE_TEST_SUITE_P(Colours, SchemeFileColourBytes,
                         ::testing::Values(ColourBytesCase{0x0000FF, {0xFF, 0x00, 0x00, 0x00}},
                                           ColourBytesCase{0xFF0000, {0x00, 0x00, 0xFF, 0x00}},
                                           ColourBytesCase{0x00FF00, {0x00, 0xFF, 0x00, 0x00}},
                                           ColourBytesCase{0x8040C0, {0xC0, 0x40, 0x80, 0x00}}));

TEST(SchemeFileBytes, FifteenCharacterNameTakesTwentyFiveBytes) {
    ColorBoxes boxes = StartupColorBoxes();
    boxes[1].name = "Kitchen Cabinet";  // 15 characters
    const Bytes bytes = SchemeFile::Encode(boxes);
    EXPECT_EQ(bytes.size(), 224u - 7u + 15u);
    EXPECT_EQ(Slice(bytes, 0, 2), (Bytes{15, 0}));
    EXPECT_EQ(Slice(bytes, 25, 2), (Bytes{7, 0}));  // "Cornice" begins at byte 25
}

struct NameCase {
    std::string utf8;
    Bytes stored;
    std::string readBack;
};

class SchemeFileNames : public ::testing::TestWithParam<NameCase> {};

TEST_P(SchemeFileNames, NamesAreWindows1252InTheFile) {
    const NameCase& c = GetParam();
    ColorBoxes boxes = StartupColorBoxes();
    boxes[4].name = c.utf8;
    const Bytes bytes = SchemeFile::Encode(boxes);
    const size_t at = 3 * 10 + 7 + 7 + 10;  // after Ceiling, Cornice, Upper Wall
    EXPECT_EQ(Slice(bytes, at, 2), (Bytes{static_cast<uint8_t>(c.stored.size()), 0}));
    EXPECT_EQ(Slice(bytes, at + 2, c.stored.size()), c.stored);
    const SchemeFile::Decoded back = SchemeFile::Decode(bytes);
    ASSERT_TRUE(back.ok) << back.problem;
    EXPECT_EQ(back.boxes[4].name, c.readBack);
    EXPECT_EQ(back.boxes[3].name, "Upper Wall");
    EXPECT_EQ(back.boxes[5].name, "Lower Wall");
}

INSTANTIATE_TEST_SUITE_P(
    Names, SchemeFileNames,
    ::testing::Values(NameCase{"Café", {'C', 'a', 'f', 0xE9}, "Café"},
                      NameCase{"€ Trim", {0x80, ' ', 'T', 'r', 'i', 'm'}, "€ Trim"},
                      NameCase{"Rot ✓ Grün", {'R', 'o', 't', ' ', '?', ' ', 'G', 'r', 0xFC, 'n'}, "Rot ? Grün"},
                      NameCase{"Bad \xC3(", {'B', 'a', 'd', ' ', '?', '('}, "Bad ?("},
                      NameCase{"", {}, ""}));

TEST(SchemeFileBytes, UndefinedWindows1252ByteReadsAsQuestionMark) {
    EXPECT_EQ(SchemeFile::FromWindows1252(std::string("A\x81" "B\x9D", 4)), "A?B?");
    EXPECT_EQ(SchemeFile::FromWindows1252(std::string("\xE9t\xE9", 3)), "été");
}

TEST(SchemeFileBytes, ColouredRenamedSchemeRoundTrips) {
    const ColorBoxes boxes = PaintedScheme();
    const SchemeFile::Decoded back = SchemeFile::Decode(SchemeFile::Encode(boxes));
    ASSERT_TRUE(back.ok) << back.problem;
    for (int i = 1; i <= kColorBoxCount; ++i) EXPECT_EQ(back.boxes[i], boxes[i]) << "box " << i;
}

TEST(SchemeFileBytes, TrailingBytesAreIgnored) {
    Bytes bytes = SchemeFile::Encode(PaintedScheme());
    bytes.insert(bytes.end(), {0xFF, 0xFF, 0x01, 0x02, 0x03});
    const SchemeFile::Decoded back = SchemeFile::Decode(bytes);
    ASSERT_TRUE(back.ok) << back.problem;
    EXPECT_EQ(back.boxes[12], PaintedScheme()[12]);
}

TEST(SchemeFileBytes, EveryCutOfAValidFileFails) {
    const Bytes full = SchemeFile::Encode(PaintedScheme());
    for (size_t size = 0; size < full.size(); ++size) {
        const SchemeFile::Decoded d = SchemeFile::Decode(full.data(), size);
        EXPECT_FALSE(d.ok) << "cut at " << size;
        EXPECT_FALSE(d.problem.empty()) << "cut at " << size;
    }
    EXPECT_TRUE(SchemeFile::Decode(full).ok);
}

// The first record's name length replaced by `length`, the rest left intact.
Bytes WithFirstNameLength(int16_t length) {
    Bytes bytes = SchemeFile::Encode(StartupColorBoxes());
    bytes[0] = static_cast<uint8_t>(static_cast<uint16_t>(length) & 0xFF);
    bytes[1] = static_cast<uint8_t>(static_cast<uint16_t>(length) >> 8);
    return bytes;
}

TEST(SchemeFileBytes, NegativeAndOverlongNameLengthsFail) {
    for (int16_t length : {int16_t{-1}, int16_t{-32768}, int16_t{32767}, int16_t{225}}) {
        const SchemeFile::Decoded d = SchemeFile::Decode(WithFirstNameLength(length));
        EXPECT_FALSE(d.ok) << length;
        EXPECT_NE(d.problem.find("box 1"), std::string::npos) << d.problem;
    }
}

TEST(SchemeFileBytes, ZeroLengthNameIsAnEmptyName) {
    // "Ceiling" left in the file then becomes box 1's colour bytes: 'C' 'e' 'i' 'l'
    // is not a colour value, so this particular file is refused; a real empty
    // name is fine.
    EXPECT_FALSE(SchemeFile::Decode(WithFirstNameLength(0)).ok);
    ColorBoxes boxes = StartupColorBoxes();
    boxes[1].name.clear();
    const SchemeFile::Decoded d = SchemeFile::Decode(SchemeFile::Encode(boxes));
    ASSERT_TRUE(d.ok) << d.problem;
    EXPECT_EQ(d.boxes[1].name, "");
    EXPECT_EQ(d.boxes[2].name, "Cornice");
}

TEST(SchemeFileBytes, ColourThatIsNoColourValueFails) {
    for (uint8_t high : {uint8_t{0x01}, uint8_t{0x80}, uint8_t{0xFF}}) {
        Bytes bytes = SchemeFile::Encode(StartupColorBoxes());
        bytes[2 + 7 + 8 + 2 + 7 + 3] = high;  // box 2's colour, top byte: 0x80 keeps 0x8000000F
        const SchemeFile::Decoded d = SchemeFile::Decode(bytes);
        EXPECT_EQ(d.ok, high == 0x80) << int{high};
    }
    Bytes bytes = SchemeFile::Encode(StartupColorBoxes());
    bytes[2 + 7 + 7] = 0x01;  // box 1's reference, top byte
    EXPECT_FALSE(SchemeFile::Decode(bytes).ok);
}

struct PathCase {
    std::string given;
    std::string scheme;
};

class SchemeFilePath : public ::testing::TestWithParam<PathCase> {};

TEST_P(SchemeFilePath, LastExtensionOfTheFileNameBecomesCsc) {
    EXPECT_EQ(SchemeFile::SchemePath(GetParam().given), GetParam().scheme);
}

INSTANTIATE_TEST_SUITE_P(
    Paths, SchemeFilePath,
    ::testing::Values(PathCase{"/home/ann/PICS/garden.bmp", "/home/ann/PICS/garden.csc"},
                      PathCase{"/home/ann/PICS/garden", "/home/ann/PICS/garden.csc"},
                      PathCase{"/home/ann/PICS/garden.csc", "/home/ann/PICS/garden.csc"},
                      PathCase{"/home/ann/PICS/garden.bmo", "/home/ann/PICS/garden.csc"},
                      PathCase{"/p/my.house.front.jpg", "/p/my.house.front.csc"},
                      PathCase{"/My.Folder/PICS/house", "/My.Folder/PICS/house.csc"},
                      PathCase{"/My.Folder/v1.2/house.v2", "/My.Folder/v1.2/house.csc"},
                      PathCase{"/a.b/", "/a.b/.csc"},
                      PathCase{"/p/.hidden", "/p/.csc"},
                      PathCase{"house.", "house.csc"},
                      PathCase{"house", "house.csc"}));

} // namespace
