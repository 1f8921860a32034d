#include "support/faults.hpp"

#include "support/compare.hpp"
#include "support/expected_status.hpp"

#include <limits>
#include <set>

namespace support
{

using catalog::Arrangement;
using catalog::Export;
using catalog::Invocation;
using catalog::Side;

namespace
{

using Faults = std::vector<Fault>;

/// The members of an Invocation that describe one side of it.
struct Role {
    std::string name;
    std::array<void*, 4> Invocation::*planes;
    std::array<int, 4> Invocation::*steps;
    bool Invocation::*arrayNull;
    bool arrayTested;
    int planesTested;
};

void addPointers(Faults& faults, const Side& side, const Role& role)
{
    if (side.arrangement == Arrangement::planar && role.arrayTested) {
        faults.push_back({role.name + " array null", [=](Invocation& call) { call.*role.arrayNull = true; }});
    }
    for (int i = 0; i < role.planesTested; ++i) {
        faults.push_back({role.name + " plane " + std::to_string(i) + " null",
                          [=](Invocation& call) { (call.*role.planes)[i] = nullptr; }});
    }
}

void addSteps(Faults& faults, const Side& side, const Role& role)
{
    const int count = side.steps == catalog::Steps::each ? side.planes : side.steps == catalog::Steps::one ? 1 : 0;
    for (int i = 0; i < count; ++i) {
        for (const int step : {0, -1}) {
            faults.push_back({role.name + " step " + std::to_string(i) + " is " + std::to_string(step),
                              [=](Invocation& call) { (call.*role.steps)[i] = step; }});
        }
    }
}

void addSizes(Faults& faults, const char* name, s32 RoiSize::*length, int minimum, int multiple)
{
    std::set<int> bad = {0, -1, std::numeric_limits<int>::min()};
    if (minimum > 1) bad.insert({1, minimum - 1});
    for (int rest = 1; rest < multiple; ++rest) bad.insert(2 * multiple * minimum + rest);
    for (const int value : bad) {
        faults.push_back(
            {name + std::string(" is ") + std::to_string(value), [=](Invocation& call) { call.roi.*length = value; }});
    }
}

void addParameters(Faults& faults, const Export& entry)
{
    for (int i = 0; i < entry.parameterCount; ++i) {
        const catalog::Parameter& parameter = entry.traits.parameters[i];
        const std::string name(parameter.name);
        if (entry.parameterTypes[i].pointer && !parameter.optional && !parameter.workspace) {
            faults.push_back({name + " null", [=](Invocation& call) { call.parameters[i].pointer = nullptr; }});
        }
        if (parameter.status == pyxOk) continue;
        if (parameter.aboveFront) {
            faults.push_back({name + " is not above what is in front of it",
                              [=](Invocation& call) { call.parameters[i].number = call.parameters[i - 1].number; }});
            continue;
        }
        const bool isUnsigned = entry.parameterTypes[i].type.starts_with('u');
        for (const double value : {parameter.low - 1, parameter.high + 1}) {
            if (isUnsigned && value < 0) continue;
            if (value > std::numeric_limits<s32>::max()) continue;
            faults.push_back(
                {name + " is " + std::to_string(value), [=](Invocation& call) { call.parameters[i].number = value; }});
        }
    }
}

} // namespace

std::vector<Fault> faultsOf(const Export& entry)
{
    const catalog::Traits& traits = entry.traits;
    const Role source{"source",
                      &Invocation::source,
                      &Invocation::sourceStep,
                      &Invocation::sourceArrayNull,
                      traits.untested != catalog::Untested::sourceArray,
                      entry.source.planes};
    const Role target{"target",
                      &Invocation::target,
                      &Invocation::targetStep,
                      &Invocation::targetArrayNull,
                      traits.untested != catalog::Untested::targetArray,
                      entry.target.planes - (traits.untested == catalog::Untested::targetAlpha ? 1 : 0)};
    Faults faults;
    addPointers(faults, entry.source, source);
    if (traits.stepsTested) addSteps(faults, entry.source, source);
    if (!entry.inPlace) {
        addPointers(faults, entry.target, target);
        if (traits.stepsTested) addSteps(faults, entry.target, target);
    }
    addSizes(faults, "width", &RoiSize::width, traits.minimum.width, traits.minimum.widthMultiple);
    addSizes(faults, "height", &RoiSize::height, traits.minimum.height, traits.minimum.heightMultiple);
    addParameters(faults, entry);
    return faults;
}

std::optional<std::string> checkRefusal(const Export& entry, catalog::Function function, const Scene& scene,
                                        std::span<const Fault> faults)
{
    const Image target = scene.target();
    Invocation call = scene.invocation(target);
    for (const Fault& fault : faults) fault.apply(call);
    const PyxStatus expected = expectedStatus(entry, call);
    const PyxStatus found = entry.call(function, call);
    if (found != expected) return "status " + std::to_string(found) + " instead of " + std::to_string(expected);
    if (const auto difference = firstDifference(scene.target(), target)) return "something was written: " + *difference;
    return scene.sourceDamage();
}

} // namespace support
