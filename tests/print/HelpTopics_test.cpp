#include "print/HelpTopics.h"

#include <gtest/gtest.h>

#include <algorithm>

TEST(HelpTopics, FourteenTopicsWithPairedBreaksAndBlankLinesOnlyInSixAndFourteen) {
    ASSERT_EQ(HelpTopics().size(), 14u);
    for (size_t i = 0; i < 14; ++i) {
        const std::string text = HelpText(HelpTopics()[i]);
        // Every break is a "\r\n" pair, and none ends the text.
        const auto breaks = static_cast<long>(HelpTopics()[i].lines.size()) - 1;
        EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), breaks) << i;
        EXPECT_EQ(std::count(text.begin(), text.end(), '\r'), breaks) << i;
        EXPECT_FALSE(text.ends_with("\r\n")) << i;
        EXPECT_EQ(text.find("\r\n\r\n") != std::string::npos, i == 5 || i == 13) << i;
        // Only topic five ends in blanks.
        EXPECT_EQ(text.ends_with(" "), i == 4) << i;
    }
}

TEST(HelpTopics, ChosenTopicsWordForWord) {
    // how: '=' the whole text, '>' its ending, '~' somewhere inside.
    const struct { size_t index; const char *control, *caption, *title; char how; const char* text; } rows[] = {
        {1, "WhatisaColourSchemeMenuItem", "What is a Color Scheme?", "What is a Color Scheme?", '=',
         "This is your chosen group of colors for repainting the photo.\r\nYou can choose a NEW color or PICKUP a color from the "
         "photo.\r\nYou can rename a color by clicking the right mouse button.\r\nThe Color Scheme is SAVED with the edited photo."},
        {3, "UsingtheEraserMenuItem", "Using the Eraser", "Using the Eraser.", '~', "button.\r\nThe eraser Icon appears.  Move the mouse"},
        {4, "HowDoIrenameColorBoxMenuItem", "How do I rename a Color box?", "How do I rename a Color Box?", '>',
         "\r\nColor names are saved with the color scheme.  "},
        {5, "WhatIsSetReferanceToolMenuItem", "What is the \"Set Referance\" tool?", "What is the \"Set referance\" tool?", '~',
         "\r\narea.\r\n\r\nSelect the \"Set Referance\" tool and a gray scale icon will\r\n"},
        {6, "WhatisthePICSfolderMenuItem", "What is the \"PICS\" folder?", "What is the PICS folder ?", '>', "in the Open File list as (*.BMP)"},
        {7, "ThetwoFacesofOpenMenuItem", "The \"two faces\" of OPEN", "The two faces of OPEN.", '~', "currrent Color Scheme.  \"Tint-Rolla\" automatically"},
    };
    for (const auto& r : rows) {
        const HelpTopic& topic = HelpTopics()[r.index];
        EXPECT_EQ(std::string(topic.control) + "|" + std::string(topic.caption) + "|" + std::string(topic.title),
                  std::string(r.control) + "|" + r.caption + "|" + r.title);
        const std::string text = HelpText(topic);
        const bool ok = r.how == '=' ? text == r.text : r.how == '>' ? text.ends_with(r.text) : text.find(r.text) != std::string::npos;
        EXPECT_TRUE(ok) << r.index << ": " << text;
    }
}
