#include "support/expected_status.hpp"

#include <algorithm>

namespace support
{

using catalog::Arrangement;
using catalog::Export;
using catalog::Invocation;
using catalog::Side;
using catalog::Steps;
using catalog::Untested;

namespace
{

template <class T, std::size_t N> std::span<const T> first(const std::array<T, N>& values, int count)
{
    return std::span<const T>(values).first(count);
}

bool anyNull(std::span<void* const> pointers) { return std::ranges::find(pointers, nullptr) != pointers.end(); }

bool isArray(const Side& side) { return side.arrangement == Arrangement::planar; }

PyxStatus checkPointers(const Export& entry, const Invocation& call)
{
    const auto null = [&](const Side& side, const auto& planes, bool arrayNull, Untested untested) {
        if (!isArray(side)) return anyNull(first(planes, side.planes));
        return arrayNull && entry.traits.untested != untested;
    };
    bool failed = null(entry.source, call.source, call.sourceArrayNull, Untested::sourceArray);
    if (!entry.inPlace) {
        failed = failed || null(entry.target, call.target, call.targetArrayNull, Untested::targetArray);
    }
    for (int i = 0; i < entry.parameterCount; ++i) {
        const catalog::Parameter& parameter = entry.traits.parameters[i];
        const bool needed = entry.parameterTypes[i].pointer && !parameter.optional && !parameter.workspace;
        failed = failed || (needed && !call.parameters[i].pointer);
    }
    return failed ? pyxErrNullPtr : pyxOk;
}

PyxStatus checkElements(const Export& entry, const Invocation& call)
{
    const bool source = isArray(entry.source) && anyNull(first(call.source, entry.source.planes));
    const int tested = entry.target.planes - (entry.traits.untested == Untested::targetAlpha ? 1 : 0);
    const bool target = isArray(entry.target) && !entry.inPlace && anyNull(first(call.target, tested));
    return source || target ? pyxErrNullPtr : pyxOk;
}

PyxStatus checkSize(const Export& entry, const Invocation& call)
{
    const auto fits = [](s32 length, int minimum, int multiple) {
        return minimum == catalog::Minimum::any || (length >= minimum && length % multiple == 0);
    };
    const catalog::Minimum& minimum = entry.traits.minimum;
    const bool good = fits(call.roi.width, minimum.width, minimum.widthMultiple) &&
                      fits(call.roi.height, minimum.height, minimum.heightMultiple);
    return good ? pyxOk : pyxErrSize;
}

PyxStatus checkPositiveSize(const Invocation& call)
{
    return call.roi.width >= 1 && call.roi.height >= 1 ? pyxOk : pyxErrSize;
}

PyxStatus checkSteps(const Export& entry, const Invocation& call)
{
    if (!entry.traits.stepsTested) return pyxOk;
    const auto bad = [](const Side& side, const auto& steps) {
        if (side.steps == Steps::none) return false;
        return std::ranges::any_of(first(steps, side.steps == Steps::one ? 1 : side.planes),
                                   [](int s) { return s < 1; });
    };
    const bool failed = bad(entry.source, call.sourceStep) || (!entry.inPlace && bad(entry.target, call.targetStep));
    return failed ? pyxErrStep : pyxOk;
}

PyxStatus checkParameters(const Export& entry, const Invocation& call)
{
    for (int i = 0; i < entry.parameterCount; ++i) {
        const catalog::Parameter& parameter = entry.traits.parameters[i];
        const double number = call.parameters[i].number;
        const bool listed = parameter.only.empty() || std::ranges::find(parameter.only, number) != parameter.only.end();
        const bool good = parameter.aboveFront ? number > call.parameters[i - 1].number
                                               : number >= parameter.low && number <= parameter.high && listed;
        if (parameter.status != pyxOk && !good) return parameter.status;
    }
    return pyxOk;
}

PyxStatus check(catalog::Check what, const Export& entry, const Invocation& call)
{
    switch (what) {
    case catalog::Check::pointers:
        return checkPointers(entry, call);
    case catalog::Check::elements:
        return checkElements(entry, call);
    case catalog::Check::positiveSize:
        return checkPositiveSize(call);
    case catalog::Check::size:
        return checkSize(entry, call);
    case catalog::Check::steps:
        return checkSteps(entry, call);
    case catalog::Check::parameters:
        return checkParameters(entry, call);
    }
    return pyxOk;
}

bool warns(catalog::Warning warning, RoiSize roi)
{
    return roi.width % warning.widthMultiple != 0 || roi.height % warning.heightMultiple != 0;
}

} // namespace

PyxStatus expectedStatus(const Export& entry, const Invocation& call)
{
    for (const catalog::Check what : checksOf(entry.traits.order)) {
        if (const PyxStatus failure = check(what, entry, call)) return failure;
    }
    return warns(entry.traits.warning, call.roi) ? pyxWarnOddSize : pyxOk;
}

} // namespace support
