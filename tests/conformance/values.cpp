#include "conformance/suites.hpp"
#include "support/scene.hpp"

namespace conformance
{

using namespace support;

namespace
{

constexpr int smallWidths = 70; ///< each of which comes up several times, to meet every block and tail
constexpr int roundsOfSmall = 20;
constexpr int smallCases = smallWidths * roundsOfSmall;
constexpr int wideCases = 200;

/// Sizes beyond which a conversion may take another way: through a table, or past the cache.
constexpr RoiSize largeSizes[] = {{118, 101}, {234, 117}, {843, 633}};
constexpr int cases = smallCases + wideCases + static_cast<int>(std::size(largeSizes));

RoiSize sizeOf(int number, Random& random)
{
    if (number < smallCases) return {number % smallWidths + 1, random.between(1, 11)};
    if (number < smallCases + wideCases) return {random.between(smallWidths + 1, 300), random.between(1, 11)};
    return largeSizes[number - smallCases - wideCases];
}

Recipe recipeOf(const catalog::Export& entry, int number)
{
    const std::uint64_t seed = seedOf(entry.name, number);
    Random random(seed);
    Recipe recipe{.seed = seed, .roi = legalSize(entry, sizeOf(number, random))};
    recipe.pattern = random.oneIn(2) ? Pattern::random : random.pick(allPatterns);
    recipe.aligned = random.oneIn(4);
    if (recipe.aligned && random.oneIn(2)) {
        recipe.sourceStride = recipe.targetStride = Stride::aligned;
    } else {
        recipe.sourceStride = random.pick(sourceStrides(entry));
        recipe.targetStride = random.pick(targetStrides(entry));
    }
    return recipe;
}

} // namespace

Failure checkValues(const Subject& subject)
{
    for (int number = 0; number < cases; ++number) {
        if (auto text = firstDifference(subject, Scene(*subject.entry, recipeOf(*subject.entry, number)))) return text;
    }
    return std::nullopt;
}

} // namespace conformance
