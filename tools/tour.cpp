#include "tour.hpp"

#include "convert.hpp"
#include "failure.hpp"
#include "image_file.hpp"
#include "preview.hpp"
#include "sheet.hpp"

#include <algorithm>
#include <ostream>

namespace tool
{

namespace
{

constexpr RoiSize pictureBox = {480, 720};
constexpr double secondsForEach = 0.02;

/// The largest size within `size` that is a multiple of what the export asks for.
RoiSize wholeBlocks(const catalog::Minimum& minimum, RoiSize size)
{
    return {size.width / minimum.widthMultiple * minimum.widthMultiple,
            size.height / minimum.heightMultiple * minimum.heightMultiple};
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
        card.size = wholeBlocks(entry.traits.minimum, picture_.size());
        const auto way = graph_.find(picture_.format(), sourceOf(entry));
        if (!way) {
            card.note = "No conversion makes its source yet.";
            return card;
        }
        try {
            checkSize(card.size.width, card.size.height, "the part of the picture that it takes");
            call(card, *way);
        } catch (const Failure& failure) {
            card.note = failure.what();
        }
        return card;
    }

private:
    void call(Card& card, const Route& way) const
    {
        const catalog::Export& entry = *card.entry;
        const Image source = follow(way, cropped(picture_, card.size));
        const Measured done = measure(entry, source, Parameters(entry), secondsForEach);
        card.called = true;
        card.status = done.status;
        card.seconds = done.seconds;
        card.bytes = done.bytes;
        card.madeBy = describe(way);
        if (done.status < 0) {
            card.note = "Nothing was written.";
        } else {
            showTarget(card, done.target);
        }
    }

    void showTarget(Card& card, const Image& target) const
    {
        const std::string name(card.entry->name);
        for (std::string_view component : componentsOf(target.side())) card.components.push_back(component);
        const int tiles = std::max(static_cast<int>(card.components.size()), 3);
        const RoiSize tile = fitted(card.size, {pictureBox.width / tiles, pictureBox.height / tiles});
        card.tiles = show(name + ".parts.png", componentTiles(target, tile));
        const auto back = wayToPicture(graph_, target.format());
        if (!back) return;
        card.picture = show(name + ".png", eightBit(scaledDown(follow(*back, target), pictureBox)));
        card.shownBy = describe(*back);
    }

    const Image& picture_;
    const StagedDirectory& directory_;
    Graph graph_;
};

} // namespace

void writeTour(const Image& picture, const std::string& title, std::span<const catalog::Export* const> exports,
               const fs::path& directory, std::ostream& progress)
{
    StagedDirectory staged(directory);
    const Tour tour(picture, staged);
    Sheet sheet{title, {}, picture.size(), {}};
    sheet.picture = tour.show("picture.png", eightBit(scaledDown(picture, pictureBox)));
    for (const catalog::FamilyInfo& family : catalog::families()) {
        Section section{&family, {}};
        for (const catalog::Export* entry : exports) {
            if (entry->family == family.family) section.cards.push_back(tour.visit(*entry));
        }
        if (section.cards.empty()) continue;
        progress << family.slug << ": " << section.cards.size() << std::endl;
        sheet.sections.push_back(std::move(section));
    }
    const std::string page = html(sheet);
    staged.write("index.html", {reinterpret_cast<const u8*>(page.data()), page.size()});
    staged.commit();
}

} // namespace tool
