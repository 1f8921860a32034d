#include "tour.hpp"

#include "convert.hpp"
#include "failure.hpp"
#include "image_file.hpp"
#include "preview.hpp"
#include "repack.hpp"
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
        if (!way || card.size.width < 1 || card.size.height < 1) return card;
        try {
            const Image source = follow(*way, cropped(picture_, card.size));
            const Measured done = measure(entry, source, Parameters(entry), secondsForEach);
            card.called = true;
            card.status = done.status;
            card.seconds = done.seconds;
            card.bytes = done.bytes;
            if (!way->empty()) card.way = "Source: " + describe(*way) + ".";
            if (done.status >= 0) showTarget(card, done.target);
        } catch (const Failure& failure) {
            card.way = failure.what();
        }
        return card;
    }

private:
    void showTarget(Card& card, const Image& target) const
    {
        const std::string name(card.entry->name);
        for (std::string_view component : componentsOf(target.side())) card.components.push_back(component);
        const int tiles = std::max(static_cast<int>(card.components.size()), 3);
        const RoiSize tile = fitted(card.size, {pictureBox.width / tiles, pictureBox.height / tiles});
        card.tiles = show(name + ".parts.png", componentTiles(target, tile));
        const auto back = wayToPicture(graph_, target.format());
        if (!back) return;
        card.picture = show(name + ".png", scaledDown(follow(*back, target), pictureBox));
        if (!back->empty())
            card.way += (card.way.empty() ? "" : " ") + std::string("Shown by: ") + describe(*back) + ".";
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
    sheet.picture = tour.show("picture.png", scaledDown(repack(picture, pictureFormat(picture.format())), pictureBox));
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
