#include "catalog.hpp"

#include "naming.hpp"
#include "signature.hpp"

#include <algorithm>
#include <bit>
#include <tuple>

namespace catalog
{

namespace
{

using detail::Cursor;

/// Empty for what is not a number, such as the planes in front of the region.
template <class T> constexpr std::string_view cName()
{
    if constexpr (std::is_floating_point_v<T>) {
        return sizeof(T) == 4 ? "f32" : "f64";
    } else if constexpr (!std::is_integral_v<T>) {
        return {};
    } else {
        constexpr std::string_view names[2][3] = {{"u8", "u16", "u32"}, {"s8", "s16", "s32"}};
        return names[std::is_signed_v<T>][std::bit_width(sizeof(T)) - 1];
    }
}

template <class T> constexpr ParameterType parameterType()
{
    using Pointee = std::remove_pointer_t<T>;
    constexpr bool matrix = std::is_array_v<Pointee>;
    return {cName<std::remove_cv_t<std::remove_all_extents_t<Pointee>>>(), std::is_pointer_v<T>,
            matrix ? static_cast<int>(std::extent_v<Pointee>) : 0};
}

/// Steps and parameters as the signature has them.
template <class... A> void readSignature(Export& entry)
{
    // A number behind a step is a parameter.
    const auto read = [&entry, side = &entry.source, afterRoi = false](auto type) mutable {
        using T = typename decltype(type)::type;
        if constexpr (std::is_same_v<T, RoiRect>) {
            entry.mosaic = true;
        } else if constexpr (std::is_same_v<T, RoiSize>) {
            afterRoi = !entry.mosaic;
        } else if (afterRoi) {
            entry.parameterTypes[entry.parameterCount++] = parameterType<T>();
        } else if constexpr (std::is_same_v<T, int>) {
            if (side->steps == Steps::one) {
                entry.parameterTypes[entry.parameterCount++] = parameterType<T>();
                ++entry.parametersInFront;
            }
            side->steps = Steps::one;
            afterRoi = entry.mosaic && side == &entry.target;
        } else if constexpr (std::is_same_v<T, const int*>) {
            side->steps = Steps::each;
        } else {
            using Plane = std::remove_pointer_t<T>; // the sample, or the pointer to a plane's samples
            using Sample = std::conditional_t<std::is_pointer_v<Plane>, std::remove_pointer_t<Plane>, Plane>;
            if (!std::is_const_v<Sample> && !entry.inPlace) side = &entry.target;
            side->steps = Steps::none;
        }
    };
    auto reader = read;
    (reader(std::type_identity<A>{}), ...);
    for (Side* side : {&entry.source, &entry.target}) {
        if (side->arrangement == Arrangement::semiPlanar) side->steps = Steps::each;
    }
    if (entry.inPlace) entry.target = entry.source;
    Parameter& first = entry.traits.parameters[0];
    if (entry.parameterCount == 1 && !entry.parameterTypes[0].pointer && first.name.empty()) {
        const std::string_view type = entry.parameterTypes[0].type;
        first = type == "f32" ? avalOfFloats : type == "u16" ? avalOfWords : aval;
    }
}

template <class... A>
Export describe(std::string_view name, PyxStatus(PYXCC_CALL* function)(A...), Family family, const Traits& traits)
{
    detail::Naming naming = detail::readName(name);
    Export entry{};
    entry.name = name;
    entry.family = family;
    entry.traits = traits;
    entry.source = std::move(naming.source);
    entry.target = std::move(naming.target);
    entry.variant = std::move(naming.variant);
    entry.inPlace = naming.inPlace;
    entry.stepless = naming.stepless;
    entry.source.chromaUp = traits.sourceChromaUp;
    entry.target.chromaUp = traits.targetChromaUp;
    entry.source.byteInFront = traits.sourceByteInFront;
    entry.source.rowUnit = traits.sourceRowUnit;
    entry.target.bitsInFront = traits.targetBitsInFront;
    if (!traits.writes.empty()) entry.target.model = traits.writes;
    if (traits.wholeSteps) {
        for (Side* side : {&entry.source, &entry.target}) side->stepUnit = sizeOf(side->element);
    }
    readSignature<A...>(entry);
    entry.function = reinterpret_cast<Function>(function);
    entry.invoke = naming.inPlace ? &detail::invoke<true, A...> : &detail::invoke<false, A...>;
    return entry;
}

const std::vector<Export>& table()
{
    static const std::vector<Export> entries = {
#define EXPORT(name, family, ...) describe(#name, &::name, Family::family, Traits{__VA_ARGS__}),
#include "exports.def"
#undef EXPORT
    };
    return entries;
}

constexpr std::pair<std::string_view, int> elements[] = {{"u8", 1},  {"s8", 1},  {"u16", 2}, {"s16", 2}, {"u32", 4},
                                                         {"s32", 4}, {"f32", 4}, {"f64", 8}, {"bit", 1}};

constexpr int blocks(int length, int shift, bool up) { return (length + (up ? (1 << shift) - 1 : 0)) >> shift; }

} // namespace

std::span<const Check> checksOf(Order order)
{
    using enum Check;
    static constexpr Check usual[] = {pointers, elements, size, steps, parameters};
    static constexpr Check elementsLate[] = {pointers, size, elements, steps, parameters};
    static constexpr Check stepsBeforeSize[] = {pointers, elements, steps, size, parameters};
    static constexpr Check sizeFirst[] = {size, pointers, elements, steps, parameters};
    static constexpr Check parametersFirst[] = {parameters, pointers, elements, size, steps};
    static constexpr Check sizeTwice[] = {pointers, positiveSize, elements, size, steps, parameters};
    switch (order) {
    case Order::pointersSizeElements:
        return elementsLate;
    case Order::stepsBeforeSize:
        return stepsBeforeSize;
    case Order::sizeFirst:
        return sizeFirst;
    case Order::parametersFirst:
        return parametersFirst;
    case Order::sizeTwice:
        return sizeTwice;
    case Order::pointersElementsSize:
        break;
    }
    return usual;
}

Beyond beyondBand(double layout, RoiSize roi)
{
    const int odd = roi.height & 1; // then the last row to be given is the first of two that share chroma
    if (layout == 1) return {{0, 0, odd}, {}};
    if (layout == 4) return {{3, 1, odd}, {2, 1, 0}};
    if (layout == 16) return {{3, 1, 0}, {2, 1, 0}};
    return {};
}

Beyond beyondTwoRows(double, RoiSize roi)
{
    if (roi.height == 2) return {{0, 0, 1}, {0, 0, 2}};
    return {};
}

bool always(const Invocation&) { return true; }

bool byDitherType(const Invocation& call)
{
    const double noise = call.parameters[0].number, type = call.parameters[1].number;
    return (type >= 1 && type <= 3) || (type == 4 && noise > 0);
}

bool byDitherTypeOfBits(const Invocation& call) { return call.parameters[3].number == 3; }

int sizeOf(Element element) { return elements[static_cast<int>(element)].second; }

std::string_view nameOf(Element element) { return elements[static_cast<int>(element)].first; }

PlaneShape shapeOf(const Side& side, int plane, RoiSize roi)
{
    const bool chroma = (plane == 1 || plane == 2) && side.arrangement != Arrangement::interleaved;
    // Interleaved chroma lies beside luma, whose row goes on to the end of a block that is filled up.
    const int wholeBlocks = blocks(roi.width, side.chromaX, side.chromaUp) << side.chromaX;
    const int lumaWidth = side.chromaUp && side.arrangement == Arrangement::interleaved ? wholeBlocks : roi.width;
    const int width = chroma ? blocks(roi.width, side.chromaX, side.chromaUp) : lumaWidth;
    const int height = chroma ? blocks(roi.height, side.chromaY, side.chromaUp) : roi.height;
    const int samples = chroma && side.arrangement == Arrangement::semiPlanar ? 2 : side.samples;
    const int count = std::max(width, 0) * samples;
    const int rowBytes =
        side.element == Element::bit ? (side.bitsInFront + count + 7) / 8 : count * sizeOf(side.element);
    return {rowBytes, std::max(height, 0)};
}

PlaneShape workspaceOf(const Export& entry, RoiSize roi)
{
    return {(std::max(roi.width, 0) + 6) * sizeOf(entry.source.element), 30};
}

std::span<const Export> exports() { return table(); }

const Export* find(std::string_view name)
{
    const auto all = exports();
    const auto at = std::ranges::find(all, name, &Export::name);
    return at == all.end() ? nullptr : &*at;
}

} // namespace catalog
