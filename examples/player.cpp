// A player's path: a decoded frame (NV12) becomes pixels for the screen (BGRA), in bands of rows on several threads.
//
//     player [width height [threads]]
//
// No call knows of the others, and rows do not depend on each other beyond the pair that shares chroma. So a frame can
// be cut between pairs of rows, and the bands together are what one call would have made, to the bit.
#include "example.hpp"

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <limits>
#include <thread>

namespace
{

/// Luma, then pairs of Cb and Cr. Decoders pad their rows, so the step is more than the width.
struct Frame {
    explicit Frame(RoiSize of) : size(of), step((of.width + 63) & ~63), samples(std::size_t{3} * step * of.height / 2)
    {
        for (std::size_t i = 0; i < samples.size(); ++i) samples[i] = static_cast<u8>(i * i >> 7);
    }

    const u8* luma(int y) const { return samples.data() + std::size_t{1} * y * step; }
    const u8* chroma(int y) const { return luma(size.height) + std::size_t{1} * y / 2 * step; }

    RoiSize size;
    int step;
    std::vector<u8> samples;
};

PyxStatus convertBand(const Frame& frame, u8* screen, int screenStep, int from, int to)
{
    return pyxiYCbCr420ToBGR_8u_P2C4R(frame.luma(from), frame.step, frame.chroma(from), frame.step,
                                      screen + std::ptrdiff_t{from} * screenStep, screenStep,
                                      {frame.size.width, to - from}, 255);
}

/// A player would keep its threads; starting them takes less time than a frame does.
void convert(const Frame& frame, u8* screen, int screenStep, int threads)
{
    const auto border = [&](int band) {
        return 2 * static_cast<int>(std::int64_t{frame.size.height / 2} * band / threads);
    };
    std::vector<PyxStatus> statuses(threads);
    {
        std::vector<std::jthread> running;
        for (int band = 0; band < threads; ++band) {
            running.emplace_back(
                [&, band] { statuses[band] = convertBand(frame, screen, screenStep, border(band), border(band + 1)); });
        }
    }
    for (const PyxStatus status : statuses) example::check(status, "pyxiYCbCr420ToBGR_8u_P2C4R");
}

/// Milliseconds of the fastest of some frames.
double measure(const Frame& frame, u8* screen, int screenStep, int threads)
{
    double best = std::numeric_limits<double>::max();
    for (int round = 0; round < 10; ++round) {
        const auto start = std::chrono::steady_clock::now();
        convert(frame, screen, screenStep, threads);
        best =
            std::min(best, std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count());
    }
    return best;
}

int run(const std::vector<std::string>& arguments)
{
    const auto number = [&](std::size_t i, int otherwise) {
        return i < arguments.size() ? std::stoi(arguments[i]) : otherwise;
    };
    const RoiSize size = {number(0, 1920), number(1, 1080)};
    const int threads = number(2, static_cast<int>(std::clamp(std::thread::hardware_concurrency(), 2U, 8U)));
    if (size.width < 2 || size.height < 2 || size.width % 2 || size.height % 2 || threads < 1) {
        example::fail("usage: player [width height [threads]], with an even width and height");
    }
    const Frame frame(size);
    const int most = std::min(threads, size.height / 2); // a band is a pair of rows at the least
    const int step = 4 * size.width;
    std::vector<u8> alone(std::size_t{1} * step * size.height), together(alone.size());
    std::printf("1 thread:   %.3f ms a frame\n", measure(frame, alone.data(), step, 1));
    std::printf("%d threads:  %.3f ms a frame\n", most, measure(frame, together.data(), step, most));
    if (alone != together) example::fail("the pictures differ");
    std::printf("the pictures are equal\n");
    return 0;
}

} // namespace

int main(int argc, char** argv) { return example::guarded(run, argc, argv); }
