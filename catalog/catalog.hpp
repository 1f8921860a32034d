// The catalogue: what each export of the library is, in enough detail to make a valid call of it, or an invalid one.
//
// Tests, benchmarks and the command-line tool walk it, so that a row in exports.def covers a new export everywhere.
// Nothing of it is part of the library.
#pragma once

#include "pyxcc/pyxcc.h"

#include <array>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace catalog
{

enum class Element { u8, s8, u16, s16, u32, s32, f32, f64, bit };

/// Size of a sample in bytes, the smallest unit of memory; a bit counts as a byte here.
int sizeOf(Element element);
std::string_view nameOf(Element element);

enum class Family {
    colorTwist,
    gamma,
    gray,
    repack,
    hls,
    hsv,
    rgbYCbCr,
    rgbYuv,
    rgbToSubsampled,
    subsampledToRgb,
    rgbYuvSubsampled,
    bt709,
    xyzYcc,
    filterInterlace,
    ycocg,
    cbycr422,
    toneMap,
    reduceBits,
    reduceBits1u,
    packedRgb,
    ycbcrToPacked,
    ditheredPacked,
    cfa,
    demosaicAhd,
    lab,
    luv,
};

struct FamilyInfo {
    Family family;
    std::string_view slug;  ///< as in `pyxcc list`
    std::string_view title; ///< a heading
    std::string_view text;  ///< what it does, in a sentence or two
};

std::span<const FamilyInfo> families();
const FamilyInfo& infoOf(Family family);

/// The order of an export's argument tests. Pointers: image pointers, arrays and pointer parameters; elements: those of
/// the plane arrays. Both yield pyxErrNullPtr.
enum class Order {
    pointersElementsSize,
    pointersSizeElements,
    stepsBeforeSize, ///< else as the first of these
    sizeFirst,       ///< then as the first of these
    parametersFirst, ///< likewise
    sizeTwice,       ///< pointers, a size above nothing, elements, the size
};

/// What an order is made of. Steps and parameters are tested only where the traits say so.
enum class Check { pointers, elements, positiveSize, size, steps, parameters };

std::span<const Check> checksOf(Order order);

/// Pointers that an export does not test, so that a null one must not be passed.
enum class Untested { none, sourceArray, targetArray, targetAlpha }; ///< targetAlpha: the element of the fourth plane

/// The chroma block: when the size is not a multiple of it, the work is done and pyxWarnOddSize comes back.
struct Warning {
    int widthMultiple = 1;
    int heightMultiple = 1;
};

/// The smallest size, and what the size must be a multiple of. A minimum of `any` is not tested at all.
struct Minimum {
    static constexpr int any = -1;
    int width = 1;
    int height = 1;
    int widthMultiple = 1;
    int heightMultiple = 1;
};

/// An argument other than images and region: a number, or a pointer to `count` numbers.
struct Parameter {
    std::string_view name;
    double low = 0, high = 0;             ///< the values that make sense
    int count = 0;                        ///< 0 for a number
    std::array<double, 16> standard = {}; ///< a choice that does for most pictures
    PyxStatus status = pyxOk;             ///< what a number outside of them yields; pyxOk if that is not tested
    bool aboveFront = false;              ///< what is tested is that it is above the parameter in front of it
    bool optional = false;                ///< a null pointer stands for the standard numbers
    std::span<const int> special = {};    ///< numbers with a meaning of their own, for tests to try
    bool workspace = false;               ///< a pointer that is not tested to memory to work in, or its step
    std::span<const int> only = {};       ///< all the numbers that make sense, where not all of low to high do
};

/// The fourth sample, opaque.
inline constexpr Parameter aval{"aval", 0, 255, 0, {255}};
inline constexpr Parameter avalOfWords{"aval", 0, 65535, 0, {65535}};
inline constexpr Parameter avalOfFloats{"aval", 0, 1, 0, {1}};
inline constexpr Parameter alphaOfBytes{"alphaValue", 0, 255, 0, {255}};
inline constexpr Parameter alphaOfWords{"alphaValue", -32768, 32767, 0, {32767}};

/// Matrices of colour twists, as rows. The standard one halves the saturation.
inline constexpr Parameter twist3x4{
    "twist", -2, 2, 12, {0.6495, 0.2935, 0.057, 0, 0.1495, 0.7935, 0.057, 0, 0.1495, 0.2935, 0.557, 0}};
inline constexpr Parameter twist4x4{
    "twist", -2, 2, 16, {0.6495, 0.2935, 0.057, 0, 0.1495, 0.7935, 0.057, 0, 0.1495, 0.2935, 0.557, 0, 0, 0, 0, 1}};

/// Bounds of floats, which the standard samples go up to and some others beyond.
inline constexpr Parameter vMin{"vMin", -1, 0.25, 0, {0}};
inline constexpr Parameter vMax{"vMax", 0.5, 2, 0, {1}, pyxErrRange, true};

/// Weights of colours. Those of three bright channels that add up to more than 1 show what is clamped and what wraps.
inline constexpr Parameter grayWeights{
    .name = "coeffs", .low = 0, .high = 1, .count = 3, .standard = {0.299, 0.587, 0.114}, .optional = true};

/// Those of mosaics. The interpolation of one pass is not looked at; the other one works in memory of the caller's.
inline constexpr Parameter grid{"grid", 0, 3, 0, {0}, pyxErrBadArg};
inline constexpr Parameter interpolation{"interpolation", -1000, 1000, 0, {0}};
inline constexpr Parameter workspace{.name = "tmp", .workspace = true};
inline constexpr Parameter workspaceStep{.name = "tmpStep", .workspace = true};

/// Which band of an image a call is: the whole, some that are none, and the top, the middle and the bottom.
inline constexpr int bandLayouts[] = {21, 21, 31, -1, 53, 0, 5, 17, 20, 1, 4, 16, 1, 4, 16};
inline constexpr Parameter bandLayout{.name = "layout", .low = 0, .high = 31, .standard = {21}, .special = bandLayouts};

/// Fewer levels. A method that there is not does nothing.
inline constexpr int ditherTypes[] = {0, 1, 2, 3, 4, 1, 2, 3, 4, 5};
inline constexpr Parameter noiseAmount{"noise", 0, 100, 0, {0}, pyxErrNoise};
inline constexpr Parameter ditherType{
    .name = "ditherType", .low = 0, .high = 4, .standard = {4}, .special = ditherTypes};
inline constexpr Parameter levelsOfBytes{"levels", 2, 256, 0, {4}, pyxErrLevels};
inline constexpr Parameter levelsOfWords{"levels", 2, 65536, 0, {4}, pyxErrLevels};

/// One bit a pixel.
inline constexpr int ditherTypesOfBits[] = {0, 3};
inline constexpr Parameter dstBitOffset{"dstBitOffset", 0, 0x7fffffff, 0, {0}, pyxErrSize};
inline constexpr Parameter unused0{"unused0", -1000, 1000}, unused1{"unused1", -1000, 1000};
inline constexpr Parameter ditherTypeOfBits{
    .name = "ditherType", .low = 0, .high = 3, .standard = {0}, .status = pyxErrDitherType, .only = ditherTypesOfBits};
inline constexpr Parameter threshold{"threshold", 0, 255, 0, {127}};

/// Rows next to the region that a call touches as well.
struct RowsBeyond {
    int lumaInFront = 0, chromaInFront = 0, chromaBehind = 0;
};

struct Beyond {
    RowsBeyond source, target;
};

/// Those of a call for a band: two rows and what their filter needs.
Beyond beyondBand(double layout, RoiSize roi);

/// Those of a call that makes four rows of chroma at the least, by two rows of the source.
Beyond beyondTwoRows(double, RoiSize roi);

struct Invocation;

/// Calls that take scratch memory from the core library: all of an export's, for large images at least, or those by
/// some methods.
bool always(const Invocation&);
bool byDitherType(const Invocation& call);
bool byDitherTypeOfBits(const Invocation& call);

/// The most parameters that an export has.
inline constexpr int mostParameters = 5;
template <class T> using PerParameter = std::array<T, mostParameters>;

/// Numbers of a call that is measured as well as the one with the standard numbers.
using Variant = PerParameter<double>;

/// Methods of fewer levels: of some noise or none, few levels and many.
inline constexpr Variant methods[] = {{0, 0, 4}, {0, 0, 100}, {0, 1, 4},  {20, 1, 4},  {0, 2, 4},   {20, 2, 4},
                                      {0, 3, 4}, {20, 3, 4},  {20, 4, 4}, {0, 4, 100}, {20, 4, 100}};

/// Those of one bit a pixel: in front of a byte's first bit or not.
inline constexpr Variant methodsOfBits[] = {{3, 0, 0, 0, 127}, {0, 0, 0, 3, 127}, {3, 0, 0, 3, 127}};

/// What the signature tells of a parameter.
struct ParameterType {
    std::string_view type; ///< the C type of a number: "u8", "f32"
    bool pointer = false;
    int columns = 0; ///< of a matrix, whose rows the pointer walks; 0 for a plain list
};

/// The samples that a source is to hold. An empty range means all of an integer type, and 0 to 1 for floats.
struct Range {
    double low = 0, high = 0;
};

/// What the name and the signature do not tell. A row of exports.def sets what departs from the defaults, in this
/// order.
struct Traits {
    Order order = Order::pointersElementsSize;
    Untested untested = Untested::none;
    Minimum minimum = {};
    Warning warning = {};
    PerParameter<Parameter> parameters = {}; ///< a lone number that is not named here is `aval`
    bool stepsTested = false;                ///< a step below 1 yields pyxErrStep
    bool sourceChromaUp = false;             ///< the source has a chroma sample for a part of a block, too
    bool targetChromaUp = false;             ///< and so has the target
    int sourceByteInFront = 0;               ///< so far in front of a row of the source one pixel wide, a byte is read
    int sourceRowUnit = 1;                   ///< where a row of the source begins counts by multiples of this
    int targetBitsInFront = 0;               ///< so many bits may lie in front of a row of the target
    Range range = {};                        ///< of the source's samples
    double tolerance = 0;                    ///< by which a target sample may be off, where its last bit is left open
    bool followsRounding = false;            ///< an integer result depends on the caller's rounding mode
    bool wholeSteps = false;                 ///< of a step, only the whole samples count
    bool (*allocates)(const Invocation&) = nullptr; ///< which calls take scratch memory from the core library
    Beyond (*beyond)(double, RoiSize) = nullptr;    ///< rows outside of the region, by the first parameter
    int withinImagesFrom = 1;                       ///< a call of a lesser width or height goes beyond its images
    std::string_view writes = {};                   ///< the target's model, where it is not the one of the name
    std::span<const Variant> variants = {};         ///< further calls to measure
};

enum class Arrangement {
    interleaved, ///< one plane; `samples` a pixel
    planar,      ///< `planes` planes of one sample each
    semiPlanar,  ///< a plane of luma and one of chroma pairs
};

enum class Steps { none, one, each };

/// One end of a conversion.
struct Side {
    std::string model;  ///< "RGB", "YCbCr420"; empty where any will do
    std::string layout; ///< "C3", "AC4", "P2"
    Element element = Element::u8;
    Arrangement arrangement = Arrangement::interleaved;
    int samples = 1;              ///< interleaved samples a pixel
    int planes = 1;               ///< memory planes
    Steps steps = Steps::one;     ///< how the signature gives the steps
    int chromaX = 0, chromaY = 0; ///< chroma is shared by 1 << chromaX columns and 1 << chromaY rows
    bool chromaUp = false;        ///< a part of such a block has a sample of its own
    int byteInFront = 0;          ///< so far in front of a row, if that is one pixel wide, a byte is read
    bool spareFourth = false;     ///< AC4: the fourth sample is not read, or keeps its value
    int bitsInFront = 0;          ///< so many may lie in front of a row of bits
    int rowUnit = 1;              ///< where a row begins counts by multiples of this
    int stepUnit = 1;             ///< of a step, only whole multiples of this count
};

/// The side that a model, a layout token and an element make, as an export's name would.
Side sideOf(std::string_view model, std::string_view layout, Element element);

/// The part of a plane that a region covers.
struct PlaneShape {
    int rowBytes;
    int rows;
};

PlaneShape shapeOf(const Side& side, int plane, RoiSize roi);

struct Export;

/// The caller's memory that a call of that size works in, at the least.
PlaneShape workspaceOf(const Export& entry, RoiSize roi);

/// The arguments of a call, by role. An in-place export takes its image from `source`.
struct Invocation {
    struct Value {
        double number = 0;
        const void* pointer = nullptr;
    };
    std::array<void*, 4> source = {};
    std::array<void*, 4> target = {};
    std::array<int, 4> sourceStep = {};
    std::array<int, 4> targetStep = {};
    bool sourceArrayNull = false; ///< passes null for the array of planes
    bool targetArrayNull = false;
    RoiSize roi = {0, 0};
    PerParameter<Value> parameters = {};
};

/// A function with an export's signature, which Export::call restores.
using Function = void (*)();

struct Export {
    std::string_view name;
    Family family;
    Traits traits;
    Side source;
    Side target; ///< equals `source` for in-place exports
    std::string variant;
    bool inPlace = false;
    bool stepless = false;
    int parameterCount = 0;
    int parametersInFront = 0; ///< of the region; the others are behind it
    PerParameter<ParameterType> parameterTypes = {};
    bool mosaic = false; ///< takes a region within a mosaic; a call here is for the whole
    Function function = nullptr;

    /// Calls the library's function, or another one of the same signature.
    PyxStatus call(const Invocation& arguments) const { return invoke(function, arguments); }
    PyxStatus call(Function other, const Invocation& arguments) const { return invoke(other, arguments); }

    PyxStatus (*invoke)(Function, const Invocation&) = nullptr;
};

/// All conversions in alphabetical order.
std::span<const Export> exports();

/// The conversion of that name, or null.
const Export* find(std::string_view name);

} // namespace catalog
