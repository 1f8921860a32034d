// Speed of every export, beside memcpy of as many bytes:
//
//     pyxcc_bench [--seconds=S] [--benchmark_filter=pyxiRGBToYCbCr_8u_C3R/1920x1080] [...]
//
// One thread. Where parameters decide the work there are variants as well, named by what departs from the standard, as
// in pyxiReduceBits_8u_C1R/noise=20,ditherType=1/640x64. An export that reads s bytes and writes t is set against a
// copy of (s + t) / 2 bytes, which moves as many; its rate counts s + t. The counters are GBps, memcpyGBps (10^9 bytes
// a second) and share, the one over the other.
#include "alternate.hpp"
#include "workload.hpp"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <span>
#include <string>
#include <string_view>

namespace
{

/// The first one lies in the processor's cache, the last one does not.
constexpr RoiSize sizes[] = {{640, 64}, {1920, 1080}, {3840, 2160}};

void measure(benchmark::State& state, const catalog::Export& entry, const catalog::Variant* variant, RoiSize roi,
             double seconds)
{
    const bench::Workload work = bench::prepare(entry, variant, roi);
    const std::size_t copied = work.bytes / 2;
    const bench::Buffer from = bench::allocate(copied);
    const bench::Buffer to = bench::allocate(copied);

    if (const PyxStatus status = entry.call(work.call); status < 0) {
        state.SkipWithError(("the call failed with status " + std::to_string(status)).c_str());
        return;
    }
    const auto convert = [&] {
        benchmark::DoNotOptimize(entry.call(work.call));
        benchmark::ClobberMemory();
    };
    const auto copy = [&] {
        benchmark::DoNotOptimize(std::memcpy(to.get(), from.get(), copied));
        benchmark::ClobberMemory();
    };
    // The framework sees a single iteration that takes as long as a call does in its best batch.
    for ([[maybe_unused]] auto iteration : state) {
        const auto [conversion, plainCopy] = bench::alternate(convert, copy, seconds);
        const auto bytes = static_cast<double>(work.bytes);
        state.SetIterationTime(conversion);
        state.counters["GBps"] = bytes / conversion * 1e-9;
        state.counters["memcpyGBps"] = bytes / plainCopy * 1e-9;
        state.counters["share"] = plainCopy / conversion;
    }
    state.SetBytesProcessed(static_cast<std::int64_t>(work.bytes));
}

void registerOne(const catalog::Export& entry, const catalog::Variant* variant, RoiSize roi, double seconds)
{
    std::string name(entry.name);
    for (int i = 0; variant && i < entry.parameterCount; ++i) {
        const catalog::Parameter& parameter = entry.traits.parameters[i];
        if ((*variant)[i] == parameter.standard[0]) continue;
        name += name.find('=') == std::string::npos ? '/' : ',';
        name += std::string(parameter.name) + '=' + std::to_string(std::lround((*variant)[i]));
    }
    name += '/' + std::to_string(roi.width) + 'x' + std::to_string(roi.height);
    benchmark::RegisterBenchmark(name.c_str(), measure, entry, variant, roi, seconds)
        ->Iterations(1)
        ->UseManualTime()
        ->Unit(benchmark::kMicrosecond);
}

void registerAll(double seconds)
{
    for (const catalog::Export& entry : catalog::exports()) {
        for (const RoiSize roi : sizes) registerOne(entry, nullptr, roi, seconds);
        for (const catalog::Variant& variant : entry.traits.variants) {
            for (const RoiSize roi : std::span(sizes).first<2>()) registerOne(entry, &variant, roi, seconds);
        }
    }
}

/// Takes --seconds=S, the time for one export at one size, off the arguments.
double takeSeconds(int& argc, char** argv)
{
    constexpr std::string_view flag = "--seconds=";
    double seconds = 0.5;
    const auto end = std::remove_if(argv + 1, argv + argc, [&](const char* argument) {
        if (!std::string_view(argument).starts_with(flag)) return false;
        seconds = std::strtod(argument + flag.size(), nullptr);
        return seconds > 0; // anything else stays and is reported as not known
    });
    *end = nullptr;
    argc = static_cast<int>(end - argv);
    return seconds;
}

} // namespace

int main(int argc, char** argv)
{
    const double seconds = takeSeconds(argc, argv);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return EXIT_FAILURE;
    registerAll(seconds);
    const bool any = benchmark::RunSpecifiedBenchmarks() > 0;
    benchmark::Shutdown();
    return any ? EXIT_SUCCESS : EXIT_FAILURE;
}
