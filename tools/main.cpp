// The command line of pyxcc.
#include "describe.hpp"
#include "failure.hpp"
#include "image_file.hpp"
#include "lookup.hpp"
#include "run.hpp"
#include "test_card.hpp"
#include "tour.hpp"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <charconv>
#include <iomanip>
#include <iostream>

namespace
{

using namespace tool;

constexpr RoiSize cardSize = {960, 640};

/// "WxH"
RoiSize readSize(const std::string& text)
{
    RoiSize size = {0, 0};
    const char* const end = text.data() + text.size();
    const auto [cross, widthError] = std::from_chars(text.data(), end, size.width);
    if (widthError != std::errc{} || cross == end || *cross != 'x') fail("--size takes WxH, not '", text, "'");
    const auto [rest, heightError] = std::from_chars(cross + 1, end, size.height);
    if (heightError != std::errc{} || rest != end) fail("--size takes WxH, not '", text, "'");
    checkSize(size.width, size.height, "--size");
    return size;
}

void list(const std::string& filter)
{
    const auto found = matching(filter);
    std::size_t nameWidth = 0, familyWidth = 0;
    for (const catalog::Export* entry : found) {
        nameWidth = std::max(nameWidth, entry->name.size());
        familyWidth = std::max(familyWidth, catalog::infoOf(entry->family).slug.size());
    }
    const auto column = [](std::size_t width) { return std::setw(static_cast<int>(width) + 2); };
    std::cout << std::left;
    for (const catalog::Export* entry : found) {
        std::cout << column(nameWidth) << entry->name << column(familyWidth) << catalog::infoOf(entry->family).slug
                  << conversionOf(*entry) << "\n";
    }
    std::cout << found.size() << (found.size() == 1 ? " export\n" : " exports\n");
}

void tour(const std::string& input, const std::string& filter, const std::string& output)
{
    const Image picture = input.empty() ? testCard(cardSize) : readPicture(input);
    const std::string title = input.empty() ? "the test card" : fs::path(input).filename().string();
    const auto exports = matching(filter);
    writeTour(picture, title, exports, output, std::cout);
    std::cout << "written: " << (fs::path(output) / "index.html").string() << "\n";
}

void card(const std::string& size, const std::string& output)
{
    const File file = {output, encodePng(testCard(size.empty() ? cardSize : readSize(size)))};
    writeFiles({&file, 1});
}

int parseAndRun(int argc, char** argv)
{
    CLI::App app("Tries the conversions of pyxcc on pictures.", "pyxcc");
    app.require_subcommand(1);
    app.set_version_flag("--version", std::string("pyxcc ") + pyxccGetLibVersion()->versionText);

    std::string filter, name, input, output, size;
    std::vector<std::string> assignments;

    CLI::App* const listing = app.add_subcommand("list", "List exports with family, source and target");
    listing->add_option("FILTER", filter, "A part of the name, or a family");
    listing->callback([&] { list(filter); });

    CLI::App* const show = app.add_subcommand("show", "Show an export's prototype, layouts, tests and statuses");
    show->add_option("NAME", name, "The export")->required();
    show->callback([&] { std::cout << sheetOf(named(name)); });

    CLI::App* const running = app.add_subcommand("run", "Run an export on a picture");
    running->add_option("NAME", name, "The export")->required();
    running->add_option("IN", input, "A PNG, PPM, PGM or PFM file, or raw planes with --size")->required();
    running->add_option("-o,--output", output, "A PNG file, or else raw planes with a PNG file beside them")
        ->required();
    running->add_option("--size", size, "WxH: IN holds the planes of the export's source, one after another");
    running->add_option("--set", assignments, "name=value: a parameter of the export")->allow_extra_args(false);
    running->callback([&] {
        RunOptions options{input, output, std::nullopt, assignments};
        if (!size.empty()) options.rawSize = readSize(size);
        run(named(name), options, std::cout);
    });

    CLI::App* const touring = app.add_subcommand("tour", "Make a page that shows what every export does to a picture");
    touring->add_option("IN", input, "A PNG, PPM, PGM or PFM file; the test card if there is none");
    touring->add_option("-o,--output", output, "The directory to make")->required();
    touring->add_option("--only", filter, "Only the exports with this in their name, or of this family");
    touring->callback([&] { tour(input, filter, output); });

    CLI::App* const drawing = app.add_subcommand("card", "Write the test card");
    drawing->add_option("-o,--output", output, "A PNG file")->required();
    drawing->add_option("--size", size, "WxH; 960x640 if not given");
    drawing->callback([&] { card(size, output); });

    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        if (error.get_exit_code() == 0) return app.exit(error); // help and version
        fail(error.what(), "; see pyxcc --help");
    }
    std::cout.flush();
    if (!std::cout) fail("cannot write to standard output");
    return 0;
}

/// An error is one line, whatever stands in a file's name.
void tell(std::string text)
{
    std::ranges::replace_if(
        text, [](unsigned char c) { return c < ' ' || c == 0x7f; }, '?');
    std::cerr << "pyxcc: " << text << "\n";
}

} // namespace

int main(int argc, char** argv)
{
    try {
        return parseAndRun(argc, argv);
    } catch (const std::bad_alloc&) {
        tell("out of memory");
    } catch (const std::exception& error) {
        tell(error.what());
    }
    return 1;
}
