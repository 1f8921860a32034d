#include "conformance/suites.hpp"
#include "support/fault_report.hpp"
#include "support/scene.hpp"

namespace conformance
{

using namespace support;

namespace
{

/// All blocks and tails up to here, then some rows that fill whole pages.
constexpr int smallWidths = 70;
constexpr int largeWidths[] = {127, 128, 129, 255, 256, 257, 1365, 4096};

Failure checkWidth(const Subject& subject, int width, Placement placement, Stride stride)
{
    const catalog::Export& entry = *subject.entry;
    const std::uint64_t seed = seedOf(entry.name, width);
    Recipe recipe{.seed = seed, .roi = legalSize(entry, {width, Random(seed).between(1, 5)}), .placement = placement};
    recipe.sourceStride = recipe.targetStride = stride;
    const Scene scene(entry, recipe);
    const std::string text = scene.text();
    const FaultReport report(text);
    return firstDifference(subject, scene);
}

} // namespace

Failure checkGuards(const Subject& subject)
{
    for (const Placement placement : {Placement::endAtGuard, Placement::beginAtGuard}) {
        for (const Stride stride : {Stride::tight, Stride::tightUp}) {
            if (stride == Stride::tightUp && subject.entry->traits.stepsTested) continue;
            for (int width = 1; width <= smallWidths; ++width) {
                if (auto text = checkWidth(subject, width, placement, stride)) return text;
            }
            for (const int width : largeWidths) {
                if (auto text = checkWidth(subject, width, placement, stride)) return text;
            }
        }
    }
    return std::nullopt;
}

} // namespace conformance
