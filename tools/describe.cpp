#include "describe.hpp"

#include "component.hpp"
#include "status.hpp"
#include "text.hpp"

#include <algorithm>
#include <bit>
#include <sstream>

namespace tool
{

namespace
{

using catalog::Arrangement;
using catalog::Minimum;
using catalog::Side;
using catalog::Steps;

/// "u8" of samples; a plane of bits is one of bytes.
std::string typeOf(const Side& side)
{
    return std::string(side.element == catalog::Element::bit ? "u8" : catalog::nameOf(side.element));
}

std::string extent(int count)
{
    std::string text = "[";
    text += std::to_string(count);
    text += "]";
    return text;
}

/// One end's pointers and steps. `qualifier` is "const " for what is only read.
std::string imageArguments(const Side& side, const std::string& name, const std::string& qualifier)
{
    const std::string type = qualifier + typeOf(side);
    if (side.arrangement == Arrangement::semiPlanar) {
        return type + "* " + name + "Y, int " + name + "YStep, " + type + "* " + name + "CbCr, int " + name +
               "CbCrStep";
    }
    const std::string count = extent(side.planes);
    const bool planar = side.arrangement == Arrangement::planar;
    const std::string image = planar ? type + "* const " + name + count : type + "* " + name;
    switch (side.steps) {
    case Steps::one:
        return image + ", int " + name + "Step";
    case Steps::each:
        return image + ", const int " + name + "Step" + count;
    default:
        return image;
    }
}

std::string parameterArgument(const catalog::Parameter& parameter, const catalog::ParameterType& type)
{
    if (type.pointer && parameter.workspace) return std::string(type.type) + "* " + std::string(parameter.name);
    std::string text = (parameter.workspace ? "int" : std::string(type.type)) + " " + std::string(parameter.name);
    if (!type.pointer) return text;
    text.insert(0, "const ");
    return text + (type.columns == 0 ? extent(parameter.count)
                                     : extent(parameter.count / type.columns) + extent(type.columns));
}

/// Those from `first` on in front of `end`.
std::string parameterArguments(const catalog::Export& entry, int first, int end)
{
    std::string text;
    for (int index = first; index < end; ++index) {
        text += ", " + parameterArgument(entry.traits.parameters[index], entry.parameterTypes[index]);
    }
    return text;
}

/// The samples that stand next to each other, in the words of the model: "R G B A", "Y Cb Y Cr".
std::string sampleOrder(const Side& side)
{
    std::vector<std::string_view> names = componentsOf(side);
    if (side.layout == "C2") {
        names = names[0] == "Y" ? std::vector{names[0], names[1], names[0], names[2]}
                                : std::vector{names[0], names[1], names[2], names[1]};
    }
    if (side.spareFourth) names[3] = "-";
    return joined(names, " ");
}

std::string divided(const std::string& length, int shift, bool up)
{
    if (shift == 0) return length;
    const std::string whole = up ? "(" + length + "+" + std::to_string((1 << shift) - 1) + ")" : length;
    return whole + "/" + std::to_string(1 << shift);
}

std::string stepWords(const Side& side)
{
    switch (side.steps) {
    case Steps::none:
        return "rows end to end";
    case Steps::one:
        if (side.stepUnit == 2) return "a step, without its low bit";
        if (side.stepUnit > 2)
            return "a step, without its low " + std::to_string(std::countr_zero(static_cast<unsigned>(side.stepUnit))) +
                   " bits";
        return side.planes == 1 ? "a step" : "one step for all planes";
    default:
        return "a step for each plane";
    }
}

/// `range` is that of the samples; an empty one means the usual.
std::string shapeWords(const Side& side, Range range)
{
    const std::string full = "width x height";
    const std::string chroma =
        divided("width", side.chromaX, side.chromaUp) + " x " + divided("height", side.chromaY, side.chromaUp);
    std::ostringstream text;
    if (isPacked(side)) {
        text << "one 16-bit pixel of the fields " << sampleOrder(side) << " from the low bits up";
    } else if (side.arrangement == Arrangement::interleaved) {
        text << sampleOrder(side);
        if (side.element == catalog::Element::bit) {
            text << ", 8 pixels a byte";
        } else if (side.samples > 1 || catalog::sizeOf(side.element) > 1) {
            text << ", " << side.samples * catalog::sizeOf(side.element) << " bytes a pixel";
        }
        if (side.chromaUp) text << ", to the end of a last pair";
    } else if (side.arrangement == Arrangement::semiPlanar) {
        const auto names = componentsOf(side);
        text << "planes " << names[0] << " (" << full << ") and " << names[1] << ' ' << names[2] << " pairs (" << chroma
             << ")";
    } else {
        text << "planes";
        const auto names = componentsOf(side);
        for (std::size_t plane = 0; plane < names.size(); ++plane) {
            const bool shared = (plane == 1 || plane == 2) && side.chromaX + side.chromaY > 0;
            text << (plane == 0 ? " " : ", ") << names[plane];
            if (side.chromaX + side.chromaY > 0) text << " (" << (shared ? chroma : full) << ")";
        }
    }
    if (range.low == range.high) range = rangeOf(side.element);
    if (!isPacked(side)) text << "; " << range.low << " to " << range.high;
    text << "; " << stepWords(side);
    return text.str();
}

bool testsParameters(const catalog::Export& entry)
{
    return std::ranges::any_of(entry.traits.parameters, [](const auto& p) { return p.status != pyxOk; });
}

std::string orderWords(const catalog::Export& entry)
{
    const bool arrays =
        entry.source.arrangement == Arrangement::planar || entry.target.arrangement == Arrangement::planar;
    std::vector<std::string_view> words;
    for (const catalog::Check check : catalog::checksOf(entry.traits.order)) {
        using enum catalog::Check;
        switch (check) {
        case pointers:
            words.push_back("null pointers");
            break;
        case elements:
            if (arrays) words.push_back("null planes");
            break;
        case positiveSize:
            words.push_back("a size below 1");
            break;
        case size:
            words.push_back("size");
            break;
        case steps:
            if (entry.traits.stepsTested) words.push_back("steps");
            break;
        case parameters:
            if (testsParameters(entry)) words.push_back("parameters");
            break;
        }
    }
    std::string text = joined(words, ", ");
    if (entry.traits.untested == catalog::Untested::sourceArray) text += "; the source's array of planes is not tested";
    if (entry.traits.untested == catalog::Untested::targetArray) text += "; the target's array of planes is not tested";
    if (entry.traits.untested == catalog::Untested::targetAlpha) text += "; the target's plane of alpha is not tested";
    return text;
}

/// "at least 4, a multiple of 4"
std::string bound(int least, int multiple)
{
    if (least == Minimum::any) return "not tested";
    return "at least " + std::to_string(least) + (multiple > 1 ? ", a multiple of " + std::to_string(multiple) : "");
}

/// "an odd width", "a height that is not a multiple of 4"
std::string offBlock(const std::string& length, int multiple)
{
    if (multiple == 2) return "an odd " + length;
    return "a " + length + " that is not a multiple of " + std::to_string(multiple);
}

std::string statusWords(const catalog::Export& entry)
{
    const Minimum& minimum = entry.traits.minimum;
    std::string text = statusText(pyxOk) + ", " + statusText(pyxErrNullPtr);
    if (minimum.width != Minimum::any || minimum.height != Minimum::any) text += ", " + statusText(pyxErrSize);
    std::vector<std::string> off;
    const auto& [widthMultiple, heightMultiple] = entry.traits.warning;
    if (widthMultiple > 1) off.push_back(offBlock("width", widthMultiple));
    if (heightMultiple > 1) off.push_back(offBlock("height", heightMultiple));
    if (!off.empty()) text += ", " + statusText(pyxWarnOddSize) + " for " + joined(off, " or ");
    if (entry.traits.stepsTested) text += ", " + statusText(pyxErrStep) + " for a step below 1";
    for (const catalog::Parameter& parameter : entry.traits.parameters) {
        if (parameter.status == pyxOk) continue;
        text += ", " + statusText(parameter.status) + " for " + std::string(parameter.name);
    }
    return text;
}

std::string parameterWords(const catalog::Parameter& parameter)
{
    std::ostringstream text;
    text << parameter.name << ": ";
    if (parameter.workspace) {
        text << "memory to work in and its step, 30 rows of width + 6 samples";
        return text.str();
    }
    if (parameter.count > 0) text << parameter.count << " numbers of ";
    text << parameter.low << " to " << parameter.high << "; if not set";
    for (int i = 0; i < std::max(parameter.count, 1); ++i) text << (i == 0 ? " " : ",") << parameter.standard[i];
    if (parameter.optional) text << ", which a null pointer stands for";
    return text.str();
}

} // namespace

std::string conversionOf(const catalog::Export& entry)
{
    if (entry.inPlace) return nameOf(entry.source) + " in place";
    return nameOf(entry.source) + " -> " + nameOf(entry.target);
}

std::string prototypeOf(const catalog::Export& entry)
{
    std::string text = "PyxStatus " + std::string(entry.name) + "(";
    if (entry.mosaic) {
        const std::string source =
            "const " + typeOf(entry.source) + "* src, RoiRect srcRoi, RoiSize srcSize, int srcStep";
        return text + source + ", " + imageArguments(entry.target, "dst", "") +
               parameterArguments(entry, 0, entry.parameterCount) + ");";
    }
    text += entry.inPlace
                ? imageArguments(entry.source, "srcDst", "")
                : imageArguments(entry.source, "src", "const ") + ", " + imageArguments(entry.target, "dst", "");
    return text + parameterArguments(entry, 0, entry.parametersInFront) + ", RoiSize roi" +
           parameterArguments(entry, entry.parametersInFront, entry.parameterCount) + ");";
}

std::string sheetOf(const catalog::Export& entry)
{
    const catalog::FamilyInfo& family = catalog::infoOf(entry.family);
    const Minimum& minimum = entry.traits.minimum;
    std::ostringstream text;
    text << entry.name << "\n"
         << family.title << " (" << family.slug << "). " << family.text << "\n\n"
         << prototypeOf(entry) << "\n\n";
    const auto line = [&text](std::string_view label, const std::string& words) {
        text << "  " << label << std::string(12 - label.size(), ' ') << words << "\n";
    };
    line(entry.inPlace ? "image" : "source",
         nameOf(entry.source) + ": " + shapeWords(entry.source, entry.traits.range));
    if (!entry.inPlace) line("target", nameOf(entry.target) + ": " + shapeWords(entry.target, {}));
    for (int index = 0; index < entry.parameterCount; ++index) {
        line(index == 0 ? "parameters" : "", parameterWords(entry.traits.parameters[index]));
    }
    line("tests", orderWords(entry));
    line("width", bound(minimum.width, minimum.widthMultiple));
    line("height", bound(minimum.height, minimum.heightMultiple));
    line("statuses", statusWords(entry));
    return text.str();
}

} // namespace tool
