#include "convert.hpp"

#include "component.hpp"
#include "failure.hpp"
#include "repack.hpp"
#include "status.hpp"

#include <algorithm>
#include <chrono>
#include <limits>

namespace tool
{

namespace
{

Image::Rows rowsOf(const catalog::Export& entry) { return entry.stepless ? Image::Rows::tight : Image::Rows::padded; }

/// Memory for a call to work in, if it takes such, tight.
std::vector<u8> addWorkspace(const catalog::Export& entry, catalog::Invocation& invocation)
{
    std::vector<u8> workspace;
    const catalog::PlaneShape shape = catalog::workspaceOf(entry, invocation.roi);
    for (int index = 0; index < entry.parameterCount; ++index) {
        if (!entry.traits.parameters[index].workspace) continue;
        if (entry.parameterTypes[index].pointer) {
            workspace.resize(static_cast<std::size_t>(shape.rowBytes) * shape.rows);
            invocation.parameters[index].pointer = workspace.data();
        } else {
            invocation.parameters[index].number = shape.rowBytes;
        }
    }
    return workspace;
}

Image convert(const catalog::Export& entry, const Image& image)
{
    Image source = asSource(entry, image), target = makeTarget(entry, image.size());
    const PyxStatus status = call(entry, source, target, Parameters(entry));
    if (status < 0) fail("on the way, ", entry.name, " returns ", statusText(status));
    return target;
}

} // namespace

PyxStatus call(const catalog::Export& entry, Image& source, Image& target, const Parameters& parameters)
{
    catalog::Invocation invocation;
    invocation.roi = source.size();
    const int least = entry.traits.withinImagesFrom;
    if (source.size().width < least || source.size().height < least) {
        fail(entry.name, " takes pictures of ", least, "x", least, " and above here");
    }
    invocation.parameters = parameters.arguments();
    const std::vector<u8> workspace = addWorkspace(entry, invocation);
    for (int plane = 0; plane < source.planes(); ++plane) {
        invocation.source[plane] = source.plane(plane);
        invocation.sourceStep[plane] = source.step(plane);
    }
    for (int plane = 0; plane < target.planes(); ++plane) {
        invocation.target[plane] = target.plane(plane);
        invocation.targetStep[plane] = target.step(plane);
    }
    return entry.call(invocation);
}

Image asSource(const catalog::Export& entry, const Image& image)
{
    Image source(sourceOf(entry), image.size(), rowsOf(entry));
    copyPixels(image, source);
    return source;
}

Image makeTarget(const catalog::Export& entry, RoiSize size)
{
    Image target(targetOf(entry), size, rowsOf(entry));
    makeOpaque(target); // for the conversions that leave the fourth sample as it is
    return target;
}

Image follow(const Route& route, Image image)
{
    for (const RouteStep& step : route) {
        if (step.entry != nullptr) {
            image = convert(*step.entry, image);
        } else if (canRepack(image.format(), step.to)) {
            image = repack(image, step.to);
        } else {
            image.rename(step.to);
        }
    }
    return image;
}

Measured measure(const catalog::Export& entry, const Image& image, const Parameters& parameters, double forSeconds)
{
    using Clock = std::chrono::steady_clock;
    constexpr int fewest = 3;
    Image source = asSource(entry, image), target = makeTarget(entry, image.size());
    Measured result{pyxOk, target, std::numeric_limits<double>::infinity(), 0, 0};
    result.bytes = static_cast<double>(source.tightBytes() + (entry.inPlace ? source : target).tightBytes());

    const Clock::time_point begin = Clock::now();
    const auto since = [](Clock::time_point start) {
        return std::chrono::duration<double>(Clock::now() - start).count();
    };
    do {
        const Clock::time_point start = Clock::now();
        result.status = call(entry, source, target, parameters);
        result.seconds = std::min(result.seconds, since(start));
        // What an in-place conversion does to its own result is not of interest.
        if (result.calls++ == 0) result.target = entry.inPlace ? source : target;
    } while (result.status >= 0 && (result.calls < fewest || since(begin) < forSeconds));
    return result;
}

} // namespace tool
