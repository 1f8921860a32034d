#include "support/scene.hpp"

#include "support/compare.hpp"
#include "support/expected_status.hpp"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <sstream>

namespace support
{

using catalog::Export;
using catalog::Invocation;
using catalog::Side;
using catalog::Steps;

namespace
{

std::string_view nameOf(Stride stride)
{
    constexpr std::string_view names[] = {"tight", "padded", "aligned", "odd", "tight up", "odd up", "zero"};
    return names[static_cast<int>(stride)];
}

int roundUp(int value, int multiple) { return (value + multiple - 1) / multiple * multiple; }

int stepFor(Stride stride, int rowBytes, int sampleBytes, Random& random)
{
    switch (stride) {
    case Stride::tight:
        break;
    case Stride::padded:
        return rowBytes + sampleBytes * random.between(1, 40);
    case Stride::aligned:
        return roundUp(rowBytes, 32) + 32 * random.between(0, 2);
    case Stride::odd:
        return rowBytes + random.between(1, 77);
    case Stride::tightUp:
        return -rowBytes;
    case Stride::oddUp:
        return -rowBytes - random.between(0, 77);
    case Stride::zero:
        return 0;
    }
    return rowBytes;
}

/// Room for rows at each other's steps as well.
void shareExtent(Geometry& a, Geometry& b)
{
    a.low = b.low = std::min(a.low, b.low);
    a.high = b.high = std::max(a.high, b.high);
}

/// Room for rows in front of the first one and behind the last.
void addRows(Geometry& geometry, int inFront, int behind)
{
    const std::ptrdiff_t step = geometry.step;
    geometry.low += std::min({-step * inFront, step * behind, std::ptrdiff_t{0}});
    geometry.high += std::max({-step * inFront, step * behind, std::ptrdiff_t{0}});
}

std::vector<Geometry> geometriesOf(const Side& side, RoiSize roi, Stride stride, const catalog::RowsBeyond& beyond,
                                   Random& random)
{
    const int sampleBytes = catalog::sizeOf(side.element);
    std::vector<Geometry> geometries;
    const int common = stepFor(stride, catalog::shapeOf(side, 0, roi).rowBytes, sampleBytes, random);
    for (int plane = 0; plane < side.planes; ++plane) {
        const catalog::PlaneShape shape = catalog::shapeOf(side, plane, roi);
        const int step = side.steps == Steps::each   ? stepFor(stride, shape.rowBytes, sampleBytes, random)
                         : side.steps == Steps::none ? shape.rowBytes
                                                     : common;
        Geometry& geometry = geometries.emplace_back(geometryOf(shape, side.element, step & -side.stepUnit));
        geometry.low &= -std::ptrdiff_t{side.rowUnit};
        const bool luma = plane == 0;
        addRows(geometry, luma ? beyond.lumaInFront : beyond.chromaInFront, luma ? 0 : beyond.chromaBehind);
    }
    if (roi.width == 1) geometries[0].low -= side.byteInFront;
    // Some conversions walk a chroma plane by the step of the other one.
    if (side.steps == Steps::each && side.planes > 2) shareExtent(geometries[1], geometries[2]);
    return geometries;
}

Image makeImage(const Side& side, const Recipe& recipe, Stride stride, const catalog::RowsBeyond& beyond,
                Random& random)
{
    const int sampleBytes = catalog::sizeOf(side.element);
    Image image;
    for (const Geometry& geometry : geometriesOf(side, recipe.roi, stride, beyond, random)) {
        const int anywhere = random.between(0, 64 / sampleBytes - 1) * sampleBytes;
        image.emplace_back(geometry, recipe.placement, recipe.aligned ? 0 : anywhere);
    }
    return image;
}

/// Low bits that do not count are set where the rows are to lie oddly.
void hand(const Image& image, const Side& side, Stride stride, std::array<void*, 4>& planes, std::array<int, 4>& steps)
{
    const bool odd = stride == Stride::odd || stride == Stride::oddUp;
    for (std::size_t i = 0; i < image.size(); ++i) {
        planes[i] = image[i].base();
        steps[i] = image[i].geometry().step | (odd ? side.stepUnit - 1 : 0);
    }
}

void describe(std::ostream& text, std::string_view role, Stride stride, const Image& image)
{
    text << "\n  " << role << ", rows " << nameOf(stride) << ":";
    for (const Plane& plane : image) {
        const auto address = reinterpret_cast<std::uintptr_t>(plane.base());
        text << " step " << plane.geometry().step << " from " << address % 64 << " mod 64;";
    }
}

void copyRows(const Plane& from, const Plane& to)
{
    for (int y = 0; y < from.geometry().shape.rows; ++y) std::ranges::copy(from.row(y), to.row(y).begin());
}

/// Rows that cover each other are in order only where each row is a conversion of its own.
bool rowsAreIndependent(const Export& entry) { return !entry.source.chromaY && !entry.target.chromaY; }

catalog::Element elementOf(const catalog::ParameterType& type)
{
    int element = 0;
    while (catalog::nameOf(static_cast<catalog::Element>(element)) != type.type) ++element;
    return static_cast<catalog::Element>(element);
}

double numberFor(catalog::Range limits, catalog::Element element, Random& random)
{
    if (random.oneIn(4)) return random.oneIn(2) ? limits.low : limits.high;
    const double number = random.real(limits.low, limits.high);
    return element == catalog::Element::f32 || element == catalog::Element::f64 ? number : std::round(number);
}

} // namespace

std::vector<Stride> sourceStrides(const Export& entry)
{
    std::vector<Stride> strides = {Stride::tight, Stride::padded, Stride::aligned, Stride::odd};
    if (entry.traits.stepsTested) return strides;
    strides.insert(strides.end(), {Stride::tightUp, Stride::oddUp});
    if (!entry.inPlace) strides.push_back(Stride::zero);
    return strides;
}

std::vector<Stride> targetStrides(const Export& entry)
{
    std::vector<Stride> strides = sourceStrides(entry);
    std::erase(strides, Stride::zero);
    if (entry.traits.stepsTested || entry.inPlace || !rowsAreIndependent(entry)) return strides;
    strides.push_back(Stride::zero);
    return strides;
}

RoiSize legalSize(const Export& entry, RoiSize roi)
{
    const catalog::Minimum& minimum = entry.traits.minimum;
    const int least = entry.traits.withinImagesFrom;
    return {roundUp(std::max({roi.width, minimum.width, least}), minimum.widthMultiple),
            roundUp(std::max({roi.height, minimum.height, least}), minimum.heightMultiple)};
}

Scene::Scene(const Export& entry, const Recipe& recipe) : entry_(entry), recipe_(recipe)
{
    Random random(recipe.seed, recipe.script);
    makeParameters(random);
    makeImages(random);
}

void Scene::makeImages(Random& random)
{
    const auto beyondOf = entry_.traits.beyond;
    const catalog::Beyond beyond = beyondOf ? beyondOf(numbers_[0], recipe_.roi) : catalog::Beyond{};
    source_ = makeImage(entry_.source, recipe_, recipe_.sourceStride, beyond.source, random);
    fillSamples(source_, entry_.source, entry_.traits.range, recipe_.pattern, random);
    if (entry_.inPlace) {
        target_ = std::move(source_);
        source_.clear();
    } else {
        target_ = makeImage(entry_.target, recipe_, recipe_.targetStride, beyond.target, random);
        fillBytes(target_, random);
    }
    pristineSource_ = source_;
}

void Scene::makeParameters(Random& random)
{
    for (int i = 0; i < entry_.parameterCount; ++i) {
        const catalog::Parameter& parameter = entry_.traits.parameters[i];
        if (parameter.optional && random.oneIn(5)) continue;
        if (parameter.workspace) {
            if (entry_.parameterTypes[i].pointer) makeWorkspace(i, random);
            continue;
        }
        const catalog::Element element = elementOf(entry_.parameterTypes[i]);
        const catalog::Range limits = limitsOf(element, {parameter.low, parameter.high});
        if (!entry_.parameterTypes[i].pointer) {
            if (!parameter.only.empty()) {
                numbers_[i] = random.pick(parameter.only);
                continue;
            }
            const bool special = !parameter.special.empty() && !random.oneIn(4);
            numbers_[i] = special ? random.pick(parameter.special) : numberFor(limits, element, random);
            continue;
        }
        const int bytes = parameter.count * catalog::sizeOf(element);
        const Plane list(geometryOf({bytes, 1}, element, bytes), recipe_.placement, 0);
        random.fill(list.all());
        for (int k = 0; k < parameter.count; ++k) {
            store(element, list.base() + k * catalog::sizeOf(element), numberFor(limits, element, random));
        }
        lists_[i].push_back(list);
    }
    pristineLists_ = lists_;
}

/// With some bytes between its rows, and its step behind it.
void Scene::makeWorkspace(int parameter, Random& random)
{
    const catalog::Element element = entry_.source.element;
    const int sampleBytes = catalog::sizeOf(element);
    const catalog::PlaneShape shape = catalog::workspaceOf(entry_, recipe_.roi);
    const int step = shape.rowBytes + sampleBytes * random.between(0, 9);
    Plane& plane = lists_[parameter].emplace_back(geometryOf(shape, element, step), recipe_.placement, 0);
    random.fill(plane.all());
    numbers_[parameter + 1] = step + random.between(0, sampleBytes - 1);
}

Invocation Scene::invocation(const Image& target) const
{
    Invocation call;
    call.roi = recipe_.roi;
    hand(entry_.inPlace ? target : source_, entry_.source, recipe_.sourceStride, call.source, call.sourceStep);
    if (!entry_.inPlace) hand(target, entry_.target, recipe_.targetStride, call.target, call.targetStep);
    for (int i = 0; i < entry_.parameterCount; ++i) {
        call.parameters[i].number = numbers_[i];
        call.parameters[i].pointer = lists_[i].empty() ? nullptr : lists_[i][0].base();
    }
    return call;
}

std::optional<std::string> Scene::sourceDamage() const
{
    if (const auto text = support::firstDifference(pristineSource_, source_)) return "the source changed: " + *text;
    for (std::size_t i = 0; i < lists_.size(); ++i) {
        Image list = lists_[i];
        if (entry_.traits.parameters[i].workspace) { // what its rows hold is free
            for (std::size_t k = 0; k < list.size(); ++k) copyRows(pristineLists_[i][k], list[k]);
        }
        if (const auto text = support::firstDifference(pristineLists_[i], list)) {
            std::string what = "parameter ";
            return what.append(std::to_string(i)).append(" changed: ").append(*text);
        }
    }
    return std::nullopt;
}

std::string Scene::text() const
{
    std::ostringstream text;
    text << entry_.name << ", " << recipe_.roi.width << " x " << recipe_.roi.height << ", seed 0x" << std::hex
         << recipe_.seed << std::dec << ", " << support::nameOf(recipe_.pattern) << " samples, images "
         << support::nameOf(recipe_.placement);
    if (!entry_.inPlace) describe(text, "source", recipe_.sourceStride, source_);
    describe(text, entry_.inPlace ? "image" : "target", entry_.inPlace ? recipe_.sourceStride : recipe_.targetStride,
             target_);
    for (int i = 0; i < entry_.parameterCount; ++i) {
        const catalog::Parameter& parameter = entry_.traits.parameters[i];
        text << "\n  " << parameter.name << ":";
        if (lists_[i].empty() && parameter.count > 0) text << " null";
        if (parameter.count == 0 && !entry_.parameterTypes[i].pointer) text << ' ' << numbers_[i];
        if (parameter.workspace && !lists_[i].empty())
            text << ' ' << lists_[i][0].geometry().shape.rowBytes << " bytes a row";
        for (int k = 0; !lists_[i].empty() && k < parameter.count; ++k) {
            const catalog::Element element = elementOf(entry_.parameterTypes[i]);
            text << ' ' << load(element, lists_[i][0].base() + k * catalog::sizeOf(element));
        }
    }
    return text.str();
}

std::optional<std::string> firstDifference(const Subject& subject, const Scene& scene)
{
    const Image expected = scene.target(), actual = scene.target();
    const Invocation call = scene.invocation(actual);
    const PyxStatus wanted = subject.entry->call(subject.reference, scene.invocation(expected));
    const PyxStatus found = subject.entry->call(subject.function, call);
    const PyxStatus told = expectedStatus(*subject.entry, call);
    std::ostringstream text;
    if (found != wanted) {
        text << "status " << found << ", but " << wanted << " from the reference";
    } else if (found != told) {
        text << "status " << found << ", but " << told << " by the catalogue";
    } else if (const auto difference = firstDifference(expected, actual, subject.entry->traits.tolerance)) {
        text << *difference;
    } else if (const auto damage = scene.sourceDamage()) {
        text << *damage;
    } else {
        return std::nullopt;
    }
    text << "\n  " << scene.text();
    return text.str();
}

} // namespace support
