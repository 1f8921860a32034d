#include "conformance/suites.hpp"
#include "support/scene.hpp"

namespace conformance
{

using namespace support;

namespace
{

constexpr int smallWidths = 70; ///< each of which comes up several times, to meet every block and tail
constexpr int roundsOfSmall = 20;
constexpr int largeCases = 200;
constexpr int cases = smallWidths * roundsOfSmall + largeCases;

int widthOf(int number, Random& random)
{
    return number < smallWidths * roundsOfSmall ? number % smallWidths + 1 : random.between(smallWidths + 1, 300);
}

Recipe recipeOf(const catalog::Export& entry, int number)
{
    const std::uint64_t seed = seedOf(entry.name, number);
    Random random(seed);
    Recipe recipe{.seed = seed, .roi = {widthOf(number, random), random.between(1, 11)}};
    recipe.roi = legalSize(entry, recipe.roi);
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
