#include "tour.hpp"

#include "convert.hpp"
#include "failure.hpp"
#include "image_file.hpp"
#include "mosaic_figures.hpp"
#include "preview.hpp"
#include "sheet.hpp"

#include <algorithm>
#include <optional>
#include <ostream>

namespace tool
{

namespace
{

constexpr RoiSize pictureBox = {480, 720};
constexpr double secondsForEach = 0.02;

/// The part of the picture in whole blocks of all chroma forms and filters. What conversions leave of a part of a block
/// would show as a stripe of green or black.
Image inWholeBlocks(const Image& picture)
{
    const auto whole = [](int length, int block) { return length < block ? length : length / block * block; };
    return cropped(picture, {whole(picture.size().width, 4), whole(picture.size().height, 8)});
}

/// The image at the end of the route; if an export fails on it, `why` tells so.
std::optional<Image> tryFollow(const Route& route, Image image, std::string& why)
{
    try {
        return follow(route, std::move(image));
    } catch (const Failure& failure) {
        why = failure.what();
        return std::nullopt;
    }
}

class Tour
{
public:
    Tour(const Image& picture, const StagedDirectory& directory)
        : picture_(picture), directory_(directory), graph_(catalog::exports())
    {
    }

    Shown show(const std::string& file, const Image& image) const
    {
        directory_.write(file, encodePng(image));
        return {file, image.size()};
    }

    Card visit(const catalog::Export& entry) const
    {
        Card card;
        card.entry = &entry;
        const auto way = graph_.find(picture_.format(), sourceOf(entry));
        if (!way) {
            card.note = "No conversion makes its source yet.";
            return card;
        }
        const int least = entry.traits.withinImagesFrom;
        if (picture_.size().width < least || picture_.size().height < least) {
            card.note = "The picture is too small.";
            return card;
        }
        card.madeBy = describe(*way);
        if (const auto source = tryFollow(*way, picture_, card.note)) call(card, *source);
        return card;
    }

private:
    void call(Card& card, const Image& source) const
    {
        const Measured done = measure(*card.entry, source, Parameters(*card.entry), secondsForEach);
        card.called = true;
        card.status = done.status;
        card.seconds = done.seconds;
        card.bytes = done.bytes;
        if (done.status < 0) {
            card.note = "Nothing was written.";
        } else {
            showTarget(card, done.target);
        }
    }

    void showTarget(Card& card, const Image& target) const
    {
        const std::string name(card.entry->name);
        card.components = componentsOf(target.side());
        const int tiles = std::max(static_cast<int>(card.components.size()), 3);
        const RoiSize tile = fitted(picture_.size(), {pictureBox.width / tiles, pictureBox.height / tiles});
        card.tiles = show(name + ".parts.png", componentTiles(target, tile));
        const auto back = wayToPicture(graph_, target.format());
        if (!back) {
            card.shownBy = "its components alone, since no conversion leads back yet";
            return;
        }
        card.shownBy = describe(*back);
        const auto picture = tryFollow(*back, target, card.shownBy);
        if (picture) card.picture = show(name + ".png", eightBit(scaledDown(*picture, pictureBox)));
    }

    const Image& picture_;
    const StagedDirectory& directory_;
    Graph graph_;
};

} // namespace

void writeTour(const Image& given, const std::string& title, std::span<const catalog::Export* const> exports,
               const fs::path& directory, std::ostream& progress)
{
    const Image picture = inWholeBlocks(given);
    StagedDirectory staged(directory);
    const Tour tour(picture, staged);
    Sheet sheet{title, {}, given.size(), picture.size(), {}};
    sheet.picture = tour.show("picture.png", eightBit(scaledDown(picture, pictureBox)));
    for (const catalog::FamilyInfo& family : catalog::families()) {
        Section section{&family, {}};
        for (const catalog::Export* entry : exports) {
            if (entry->family == family.family) section.cards.push_back(tour.visit(*entry));
        }
        if (section.cards.empty()) continue;
        if (family.family == catalog::Family::demosaicAhd) {
            section.aboutFigures = mosaicFiguresText;
            for (const NamedImage& figure : mosaicFigures(picture))
                section.figures.push_back({tour.show("mosaic." + figure.file + ".png", figure.image), figure.caption});
        }
        progress << family.slug << ": " << section.cards.size() << std::endl;
        sheet.sections.push_back(std::move(section));
    }
    const std::string page = html(sheet);
    staged.write("index.html", {reinterpret_cast<const u8*>(page.data()), page.size()});
    staged.commit();
}

} // namespace tool
