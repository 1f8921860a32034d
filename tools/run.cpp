#include "run.hpp"

#include "convert.hpp"
#include "failure.hpp"
#include "image_file.hpp"
#include "preview.hpp"
#include "sheet.hpp"
#include "status.hpp"
#include "text.hpp"

#include <ostream>

namespace tool
{

namespace
{

constexpr double secondsOfCalls = 0.1;

bool isPngName(const fs::path& path) { return lowered(path.extension().string()) == ".png"; }

/// As a picture again, or as its components in gray where no way leads back.
Image pictureOf(const Graph& graph, const Image& image, std::string& way)
{
    const auto back = wayToPicture(graph, image.format());
    if (!back) {
        way = "the components in gray";
        return componentTiles(image, image.size());
    }
    way = describe(*back);
    return follow(*back, image);
}

} // namespace

void run(const catalog::Export& entry, const RunOptions& options, std::ostream& out)
{
    Parameters parameters(entry);
    for (const std::string& assignment : options.assignments) parameters.set(assignment);

    const Graph graph(catalog::exports());
    const Format wanted = sourceOf(entry);
    const Image input = options.rawSize ? readRaw(options.input, wanted, *options.rawSize) : readPicture(options.input);
    const auto way = graph.find(input.format(), wanted);
    if (!way) fail("no conversion leads from ", nameOf(input.format()), " to ", nameOf(wanted));

    const Measured done = measure(entry, follow(*way, input), parameters, secondsOfCalls);
    const RoiSize size = input.size();
    if (done.status < 0) fail(entry.name, " returns ", statusText(done.status), " at ", size.width, "x", size.height);

    std::string back;
    const Image picture = pictureOf(graph, done.target, back);
    std::vector<File> files;
    if (isPngName(options.output)) {
        files = {{options.output, encodePng(picture)}};
    } else {
        fs::path preview = options.output;
        preview += ".png";
        files = {{options.output, rawBytes(done.target)}, {preview, encodePng(picture)}};
    }
    writeFiles(files);

    out << "export   " << entry.name << "\n"
        << "input    " << options.input.string() << ": " << nameOf(input.format()) << "\n";
    if (!way->empty()) out << "source   " << describe(*way) << "\n";
    out << "target   " << nameOf(done.target.format()) << "\n"
        << "status   " << statusText(done.status) << "\n"
        << "size     " << size.width << "x" << size.height << "\n"
        << "time     " << timeText(done.seconds) << ", " << rateText(done.bytes, done.seconds) << ", best of "
        << done.calls << "\n"
        << "written  " << files.front().path.string() << "\n"
        << "picture  " << files.back().path.string() << (back.empty() ? "" : ": " + back) << "\n";
}

} // namespace tool
