// Writes the tables of the documentation that follow from the catalogue:
//
//     pyxcc_docs_tables DIRECTORY
//
// exports.md, a page of all exports, and a file <slug>.inc a family, the table that the family's page includes.
#include "describe.hpp"
#include "status.hpp"
#include "text.hpp"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <sstream>

namespace
{

using catalog::Minimum;

std::string least(int minimum, int multiple)
{
    if (minimum == Minimum::any) return "any";
    return std::to_string(minimum) + (multiple > 1 ? " (multiples)" : "");
}

std::string leastSize(const catalog::Export& entry)
{
    const Minimum& minimum = entry.traits.minimum;
    if (minimum.width == Minimum::any && minimum.height == Minimum::any) return "any";
    return least(minimum.width, minimum.widthMultiple) + " by " + least(minimum.height, minimum.heightMultiple);
}

/// What can come back besides pyxOk, pyxErrNullPtr and pyxErrSize.
std::string moreStatuses(const catalog::Export& entry)
{
    std::vector<PyxStatus> statuses;
    const auto add = [&statuses](PyxStatus status) {
        const bool everywhere = status == pyxOk || status == pyxErrSize;
        if (!everywhere && std::ranges::find(statuses, status) == statuses.end()) statuses.push_back(status);
    };
    const catalog::Traits& traits = entry.traits;
    if (traits.warning.widthMultiple > 1 || traits.warning.heightMultiple > 1) add(pyxWarnOddSize);
    if (entry.family == catalog::Family::toneMap) add(pyxWarnNegativeLevel);
    if (traits.stepsTested) add(pyxErrStep);
    for (const catalog::Parameter& parameter : traits.parameters) add(parameter.status);
    if (traits.allocates != nullptr) add(pyxErrNoMemory);

    std::vector<std::string> names;
    for (const PyxStatus status : statuses) names.push_back("::" + std::string(tool::statusName(status)));
    return tool::joined(names, ", ");
}

/// Where a line may break, it is between the two ends.
std::string conversionOf(const catalog::Export& entry)
{
    const std::string words = tool::conversionOf(entry);
    const std::size_t arrow = words.find(" -> ");
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i) {
        if (i == arrow) {
            text += " &rarr; ";
            i += 3;
        } else if (words[i] == ' ') {
            text += "&nbsp;";
        } else {
            text += words[i];
        }
    }
    return text;
}

std::string tableOf(catalog::Family family)
{
    std::ostringstream text;
    text << "| export | from, to | least size | other statuses |\n| :-- | :-- | :-- | :-- |\n";
    for (const catalog::Export& entry : catalog::exports()) {
        if (entry.family != family) continue;
        text << "| @ref " << entry.name << " | " << conversionOf(entry) << " | " << leastSize(entry) << " | "
             << moreStatuses(entry) << " |\n";
    }
    return text.str();
}

bool write(const std::filesystem::path& path, const std::string& text)
{
    std::ofstream file(path, std::ios::binary);
    file << text;
    file.close();
    if (!file) std::cerr << "pyxcc_docs_tables: cannot write " << path.string() << "\n";
    return static_cast<bool>(file);
}

} // namespace

int main(int argc, char** argv)
{
    if (argc != 2) {
        std::cerr << "usage: pyxcc_docs_tables DIRECTORY\n";
        return 2;
    }
    const std::filesystem::path directory = argv[1];
    std::filesystem::create_directories(directory);

    std::ostringstream page;
    page << "# All exports {#exports}\n\nThe " << catalog::exports().size()
         << " conversions by family; each name leads to what is said of it. Sizes are columns by rows. ::pyxOk and "
            "::pyxErrNullPtr come from all, ::pyxErrSize from all that have a least size; the last column names what "
            "else can come. The library's other export is pyxccGetLibVersion().\n\n"
            "\\htmlonly<div id=\"filter\"></div><script src=\"filter.js\"></script>\\endhtmlonly\n\n";
    bool good = true;
    for (const catalog::FamilyInfo& family : catalog::families()) {
        const std::string table = tableOf(family.family);
        page << "## " << family.title << " {#exports-" << family.slug << "}\n\n"
             << family.text << " More: @ref family-" << family.slug << ".\n\n"
             << table << "\n";
        good = write(directory / (std::string(family.slug) + ".inc"), table) && good;
    }
    return write(directory / "exports.md", page.str()) && good ? 0 : 1;
}
