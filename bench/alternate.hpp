// Times two calls against each other in turns.
#pragma once

#include <algorithm>
#include <chrono>

namespace bench
{

using Clock = std::chrono::steady_clock;
using Seconds = std::chrono::duration<double>;

/// Seconds that a call took, on an average over `calls` of them. The call in front is not timed: it puts the images
/// into the cache, as far as they fit, in place of those of the batch before.
template <class Call> double timeBatch(int calls, const Call& call)
{
    call();
    const auto start = Clock::now();
    for (int i = 0; i < calls; ++i) call();
    return Seconds(Clock::now() - start).count() / calls;
}

/// So many calls that the clock's own cost and grain do not count.
template <class Call> int batchSize(const Call& call)
{
    constexpr double batchSeconds = 1e-3;
    const double once = std::max(timeBatch(1, call), 1e-7);
    return std::clamp(static_cast<int>(batchSeconds / once), 1, 10000);
}

struct Pair {
    double first;
    double second;
};

/// Seconds a call of each takes in its best batch. The batches alternate, so that a change of the machine's speed comes
/// upon both. The best one is taken and not the median, because whatever else goes on can only lengthen a batch: on a
/// machine that shares its memory bandwidth with others, the best is what comes back from run to run.
template <class First, class Second> Pair alternate(const First& first, const Second& second, double seconds)
{
    constexpr int fewestBatches = 10;
    const int firstCalls = batchSize(first);
    const int secondCalls = batchSize(second);
    const auto end = Clock::now() + Seconds(seconds);
    Pair best = {1e9, 1e9};
    for (int batch = 0; batch < fewestBatches || Clock::now() < end; ++batch) {
        best.first = std::min(best.first, timeBatch(firstCalls, first));
        best.second = std::min(best.second, timeBatch(secondCalls, second));
    }
    return best;
}

} // namespace bench
