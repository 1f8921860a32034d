// Small things to do with text.
#pragma once

#include <algorithm>
#include <cctype>
#include <string>
#include <string_view>

namespace tool
{

/// The parts in one text with the separator between them.
template <class Parts> std::string joined(const Parts& parts, std::string_view separator)
{
    std::string text;
    bool first = true;
    for (const auto& part : parts) {
        if (!first) text += separator;
        text += part;
        first = false;
    }
    return text;
}

inline std::string lowered(std::string_view text)
{
    std::string lower(text);
    std::ranges::transform(lower, lower.begin(), [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return lower;
}

} // namespace tool
