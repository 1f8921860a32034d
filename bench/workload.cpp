#include "workload.hpp"

#include <algorithm>
#include <cstring>
#include <limits>
#include <new>
#include <random>
#include <span>

namespace bench
{

namespace
{

/// Random samples, the same ones again after a while. Floats stay away from values that a processor is slow with.
template <class T> void fill(std::span<std::byte> memory, catalog::Range range)
{
    if (range.low == range.high) {
        using Limits = std::numeric_limits<T>;
        range = Limits::is_integer ? catalog::Range{Limits::min() + 0.0, Limits::max() + 0.0} : catalog::Range{0, 1};
    }
    std::minstd_rand random;
    std::uniform_real_distribution<double> value(range.low, range.high);
    std::vector<T> period(1 << 16);
    std::ranges::generate(period, [&] { return static_cast<T>(value(random)); });

    const std::span samples(reinterpret_cast<T*>(memory.data()), memory.size() / sizeof(T));
    for (std::size_t i = 0; i < samples.size(); ++i) samples[i] = period[i % period.size()];
}

void fill(catalog::Element element, std::span<std::byte> memory, catalog::Range range)
{
    using enum catalog::Element;
    switch (element) {
    case u8:
    case bit:
        return fill<::u8>(memory, range);
    case s8:
        return fill<::s8>(memory, range);
    case u16:
        return fill<::u16>(memory, range);
    case s16:
        return fill<::s16>(memory, range);
    case u32:
        return fill<::u32>(memory, range);
    case s32:
        return fill<::s32>(memory, range);
    case f32:
        return fill<::f32>(memory, range);
    case f64:
        return fill<::f64>(memory, range);
    }
}

/// Makes the planes of one side and adds them to `work`.
void addSide(Workload& work, const catalog::Side& side, catalog::Range range, void** planes, int* steps)
{
    for (int plane = 0; plane < side.planes; ++plane) {
        const auto shape = catalog::shapeOf(side, plane, work.call.roi);
        // A signature with a single step for all planes gives them the first one's.
        steps[plane] = side.steps == catalog::Steps::one && plane > 0 ? steps[0] : shape.rowBytes;
        const std::size_t bytes = static_cast<std::size_t>(steps[plane]) * shape.rows;
        Buffer& buffer = work.planes.emplace_back(allocate(bytes));
        fill(side.element, {buffer.get(), bytes}, range);
        planes[plane] = buffer.get();
        work.bytes += static_cast<std::size_t>(shape.rowBytes) * shape.rows;
    }
}

/// The standard values of a list of numbers, in memory as the parameter's pointer has them.
template <class T> Buffer listOf(const catalog::Parameter& parameter)
{
    Buffer list = allocate(parameter.count * sizeof(T));
    for (int i = 0; i < parameter.count; ++i) {
        const T number = static_cast<T>(parameter.standard[i]);
        std::memcpy(list.get() + i * sizeof(T), &number, sizeof(T));
    }
    return list;
}

void addParameters(Workload& work, const catalog::Export& entry, const catalog::Variant* variant)
{
    for (int i = 0; i < entry.parameterCount; ++i) {
        const catalog::Parameter& parameter = entry.traits.parameters[i];
        const catalog::ParameterType& type = entry.parameterTypes[i];
        work.call.parameters[i].number = variant ? (*variant)[i] : parameter.standard[0];
        if (!type.pointer) continue;
        if (parameter.workspace) {
            const catalog::PlaneShape shape = catalog::workspaceOf(entry, work.call.roi);
            work.lists.push_back(allocate(static_cast<std::size_t>(shape.rowBytes) * shape.rows));
            work.call.parameters[i].pointer = work.lists.back().get();
            work.call.parameters[++i].number = shape.rowBytes;
            continue;
        }
        work.lists.push_back(type.type == "f64" ? listOf<f64>(parameter) : listOf<f32>(parameter));
        work.call.parameters[i].pointer = work.lists.back().get();
    }
}

} // namespace

Buffer allocate(std::size_t bytes)
{
    constexpr std::size_t alignment = 64;
    const std::size_t rounded = (bytes + alignment - 1) & ~(alignment - 1);
    Buffer buffer(static_cast<std::byte*>(std::aligned_alloc(alignment, rounded)));
    if (!buffer) throw std::bad_alloc();
    std::memset(buffer.get(), 0x55, rounded);
    return buffer;
}

Workload prepare(const catalog::Export& entry, const catalog::Variant* variant, RoiSize roi)
{
    Workload work;
    work.call.roi = roi;
    addSide(work, entry.source, entry.traits.range, work.call.source.data(), work.call.sourceStep.data());
    if (entry.inPlace) {
        work.bytes *= 2; // every byte is read and written
    } else {
        addSide(work, entry.target, {}, work.call.target.data(), work.call.targetStep.data());
    }
    addParameters(work, entry, variant);
    return work;
}

} // namespace bench
