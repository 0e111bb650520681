#pragma once
#include <span>
#include <string>
#include <string_view>
#include <vector>

// The fourteen short help topics of the Help menu's "&Tips" sub-menu. Each is
// a menu item (control name and caption) and a message box (title and text).
struct HelpTopic {
    std::string_view control;   // menu item's control name
    std::string_view caption;   // menu caption (no accelerator)
    std::string_view title;     // message box title
    std::vector<std::string_view> lines;  // "" is an empty line
};

// The topics in menu order.
std::span<const HelpTopic> HelpTopics();

// The message text: the lines joined by "\r\n", none at the end.
std::string HelpText(const HelpTopic& topic);
