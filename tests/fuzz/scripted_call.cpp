#include "fuzz/scripted_call.hpp"

#include "support/fault_report.hpp"
#include "support/faults.hpp"
#include "support/scene.hpp"

namespace fuzz
{

using namespace support;

namespace
{

const Subject& choose(Random& random)
{
    const auto all = subjects();
    return all[random.between(0, static_cast<int>(all.size()) - 1)];
}

/// Small as a rule, so that many calls can be made; now and then beyond the sizes at which a table pays.
RoiSize sizeOf(Random& random)
{
    const int kind = random.between(0, 255);
    const int width = random.between(1, kind < 192 ? 70 : 300);
    return {width, random.between(1, kind < 252 ? 11 : 100)};
}

Recipe recipeOf(const catalog::Export& entry, Random& random)
{
    Recipe recipe{.seed = 1, .roi = legalSize(entry, sizeOf(random))};
    const bool anySamples = entry.traits.range.low == entry.traits.range.high;
    recipe.pattern = random.oneIn(2) && anySamples ? Pattern::bytes : random.pick(allPatterns);
    recipe.placement = random.pick(allPlacements);
    recipe.sourceStride = random.pick(sourceStrides(entry));
    recipe.targetStride = random.pick(targetStrides(entry));
    recipe.aligned = random.oneIn(4);
    return recipe;
}

/// None as a rule.
std::vector<Fault> faultsOf(const catalog::Export& entry, Random& random)
{
    std::vector<Fault> faults;
    if (!random.oneIn(8)) return faults;
    const std::vector<Fault> all = support::faultsOf(entry);
    for (int count = random.between(1, 3); count > 0; --count) faults.push_back(random.pick(all));
    return faults;
}

} // namespace

std::optional<std::string> checkScript(const Subject& subject, std::span<const u8> script)
{
    const catalog::Export& entry = *subject.entry;
    Random random(0, script);
    const std::vector<Fault> faults = faultsOf(entry, random);
    Recipe recipe = recipeOf(entry, random);
    recipe.script = random.script();
    const Scene scene(entry, recipe);
    std::string text = scene.text();
    for (const Fault& fault : faults) text += "\n  " + fault.text;
    const FaultReport report(text);
    if (faults.empty()) return firstDifference(subject, scene);
    const auto wrong = checkRefusal(entry, subject.function, scene, faults);
    return wrong ? std::optional(*wrong + "\n  " + text) : std::nullopt;
}

std::optional<std::string> checkScript(std::span<const u8> script)
{
    Random random(0, script);
    const Subject& subject = choose(random);
    return checkScript(subject, random.script());
}

const Subject& subjectOf(std::span<const u8> script)
{
    Random random(0, script);
    return choose(random);
}

} // namespace fuzz
