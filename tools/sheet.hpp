// The contact sheet as a page of HTML.
#pragma once

#include "catalog.hpp"

#include <string>
#include <vector>

namespace tool
{

/// A picture beside the page.
struct Shown {
    std::string file; ///< empty if there is nothing to show
    RoiSize size = {0, 0};
};

struct Card {
    const catalog::Export* entry = nullptr;
    Shown picture;
    Shown tiles;
    std::vector<std::string_view> components; ///< what the tiles show
    bool called = false;
    PyxStatus status = 0;
    double seconds = 0;  ///< of a call
    double bytes = 0;    ///< read and written by a call
    std::string madeBy;  ///< how the source was made from the picture
    std::string shownBy; ///< how the target was brought back
    std::string note;    ///< why there is nothing to see
};

/// A picture that is not of one conversion alone.
struct Figure {
    Shown picture;
    std::string caption;
};

struct Section {
    const catalog::FamilyInfo* family = nullptr;
    std::vector<Card> cards;
    std::vector<Figure> figures = {};
    std::string aboutFigures = {};
};

struct Sheet {
    std::string title;
    Shown picture;
    RoiSize given = {0, 0}; ///< of the whole picture
    RoiSize size = {0, 0};  ///< of the part that was converted
    std::vector<Section> sections;
};

std::string html(const Sheet& sheet);

/// "0.123 ms" and "3.45 GB/s"
std::string timeText(double seconds);
std::string rateText(double bytes, double seconds);

} // namespace tool
