#include "print/HelpTopics.h"

#include <gtest/gtest.h>

#include <set>
#include <string>

namespace {
const HelpTopic* Find(std::string_view control) {
    for (const HelpTopic& t : HelpTopics())
        if (t.control == control) return &t;
    return nullptr;
}

std::vector<std::string> Split(const std::string& text) {
    std::vector<std::string> lines;
    size_t start = 0;
    for (size_t at; (at = text.find("\r\n", start)) != std::string::npos; start = at + 2)
        lines.push_back(text.substr(start, at - start));
    lines.push_back(text.substr(start));
    return lines;
}
} // namespace

TEST(HelpTopics, FourteenTopicsWithDistinctControls) {
    ASSERT_EQ(HelpTopics().size(), 14u);
    std::set<std::string_view> controls;
    for (const HelpTopic& t : HelpTopics()) {
        EXPECT_TRUE(controls.insert(t.control).second) << t.control;
        EXPECT_TRUE(t.control.ends_with("MenuItem") || t.control.ends_with("menuItem")) << t.control;
        EXPECT_FALSE(t.caption.empty());
        EXPECT_FALSE(t.title.empty());
    }
    EXPECT_EQ(HelpTopics().front().control, "UsingTintrollaMenuItem");
    EXPECT_EQ(HelpTopics().back().control, "WhyPrintoutDifferentColorMenuItem");
}

TEST(HelpTopics, TextsAreLinesJoinedWithoutATrailingBreak) {
    for (const HelpTopic& t : HelpTopics()) {
        const std::string text = HelpText(t);
        EXPECT_FALSE(text.ends_with("\r\n")) << t.control;
        EXPECT_FALSE(text.starts_with("\r\n")) << t.control;
        // No bare line feeds or carriage returns: every break is a pair.
        const auto lines = Split(text);
        ASSERT_EQ(lines.size(), t.lines.size()) << t.control;
        for (const std::string& line : lines) {
            EXPECT_EQ(line.find('\n'), std::string::npos) << t.control;
            EXPECT_EQ(line.find('\r'), std::string::npos) << t.control;
        }
    }
}

TEST(HelpTopics, EmptyLinesOnlyInTopicsSixAndFourteen) {
    const auto topics = HelpTopics();
    for (size_t i = 0; i < topics.size(); ++i) {
        const std::string text = HelpText(topics[i]);
        const bool blank = text.find("\r\n\r\n") != std::string::npos;
        EXPECT_EQ(blank, i == 5 || i == 13) << topics[i].control;
    }
    const auto six = Split(HelpText(topics[5]));
    ASSERT_EQ(six.size(), 13u);
    EXPECT_EQ(six[6], "");
    const auto fourteen = Split(HelpText(topics[13]));
    ASSERT_EQ(fourteen.size(), 12u);
    EXPECT_EQ(fourteen[4], "");
    EXPECT_EQ(fourteen[9], "");
}

TEST(HelpTopics, TrailingBlanksAndOddEndingsKept) {
    const std::string five = HelpText(HelpTopics()[4]);
    EXPECT_TRUE(five.ends_with("Color names are saved with the color scheme.  ")) << five;
    const std::string seven = HelpText(HelpTopics()[6]);
    EXPECT_TRUE(seven.ends_with("in the Open File list as (*.BMP)")) << seven;
    // Only topic five ends in blanks.
    for (size_t i = 0; i < HelpTopics().size(); ++i)
        if (i != 4) { EXPECT_FALSE(HelpText(HelpTopics()[i]).ends_with(" ")) << i; }
}

TEST(HelpTopics, ChosenTopicsWordForWord) {
    const HelpTopic* scheme = Find("WhatisaColourSchemeMenuItem");
    ASSERT_NE(scheme, nullptr);
    EXPECT_EQ(scheme->caption, "What is a Color Scheme?");
    EXPECT_EQ(scheme->title, "What is a Color Scheme?");
    EXPECT_EQ(HelpText(*scheme),
              "This is your chosen group of colors for repainting the photo.\r\n"
              "You can choose a NEW color or PICKUP a color from the photo.\r\n"
              "You can rename a color by clicking the right mouse button.\r\n"
              "The Color Scheme is SAVED with the edited photo.");

    const HelpTopic* eraser = Find("UsingtheEraserMenuItem");
    ASSERT_NE(eraser, nullptr);
    EXPECT_EQ(eraser->caption, "Using the Eraser");
    EXPECT_EQ(eraser->title, "Using the Eraser.");
    EXPECT_EQ(HelpText(*eraser),
              "It is sometimes necessary to erase small areas of repainted color.\r\n"
              "To use the eraser tool press-and-hold the right mouse button.\r\n"
              "The eraser Icon appears.  Move the mouse over the area of paint to\r\n"
              "be removed from the Paint Mask.");

    const HelpTopic* reference = Find("WhatIsSetReferanceToolMenuItem");
    ASSERT_NE(reference, nullptr);
    EXPECT_EQ(reference->caption, "What is the \"Set Referance\" tool?");
    EXPECT_EQ(reference->title, "What is the \"Set referance\" tool?");
    EXPECT_TRUE(HelpText(*reference).starts_with(
        "So that lighting and shadows can show through a recolored\r\n"
        "area, a luminance referance is used to set the shade of the\r\n"));
    EXPECT_NE(HelpText(*reference).find("\r\narea.\r\n\r\nSelect the \"Set Referance\" tool and a gray scale icon will\r\n"),
              std::string::npos);

    const HelpTopic* first = Find("UsingTintrollaMenuItem");
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(first->caption, "Using Tint-Rolla");
    EXPECT_EQ(first->title, "Using \"Tint-Rolla\"");

    const HelpTopic* protect = Find("WhyUseProtectPaintedAreasMenuItem");
    ASSERT_NE(protect, nullptr);
    EXPECT_EQ(protect->title, "Why use the \"Protected Painted Areas\" feature?");
    EXPECT_EQ(HelpText(*protect),
              "This just makes repainting easy.  With this feature turned ON\r\n"
              "you can not accidently overpaint an area which has already been repainted.\r\n"
              "If a painting mistake is made you can use the UNDO or ERASER features to\r\n"
              "correct it, or turn the \"Protect-Painted-Areas\" feature OFF.");

    const HelpTopic* open = Find("ThetwoFacesofOpenMenuItem");
    ASSERT_NE(open, nullptr);
    EXPECT_EQ(open->caption, "The \"two faces\" of OPEN");
    EXPECT_NE(HelpText(*open).find("and leaves the currrent Color Scheme.  \"Tint-Rolla\" automatically assumes"),
              std::string::npos);
}
