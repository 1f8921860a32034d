// A program that puts its own allocator in front of the core library's.
#include "pyxcc/core.h"
#include "scratch_user.hpp"
#include "support/compare.hpp"
#include "support/each_export.hpp"
#include "support/expected_status.hpp"
#include "support/scene.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <utility>
#include <vector>

using namespace support;

namespace
{

/// What the library asked of the program since the last reset.
struct Requests {
    int failing = -1;       ///< the number of the one that fails
    bool exhausted = false; ///< those behind it fail as well
    std::vector<s32> sizes = {};
    int given = 0, returned = 0;
    std::vector<void*> held = {}; ///< given and not returned yet
};

Requests requests;

/// Begins anew. What conversions have kept is freed.
void reset(Requests next = {})
{
    for (void* const memory : requests.held) std::free(memory);
    requests = std::move(next);
}

} // namespace

void* PYXCC_CALL pyxMalloc(s32 byteCount)
{
    const int number = static_cast<int>(requests.sizes.size());
    const bool failing = number == requests.failing || (requests.exhausted && number > requests.failing);
    requests.sizes.push_back(byteCount);
    if (failing || byteCount < 1) return nullptr;
    ++requests.given;
    requests.held.push_back(std::aligned_alloc(64, (static_cast<std::size_t>(byteCount) + 63) / 64 * 64));
    return requests.held.back();
}

void PYXCC_CALL pyxFree(void* memory)
{
    requests.returned += memory != nullptr;
    std::erase(requests.held, memory);
    std::free(memory);
}

namespace
{

/// Large enough for every conversion that takes scratch memory to do so.
constexpr RoiSize large = {234, 117};

/// Calls of an export for which the parameters decide whether it takes scratch memory are made with several.
int callsOf(const catalog::Export& entry) { return entry.traits.allocates && entry.parameterCount > 0 ? 12 : 1; }

/// How much of what it was given a call keeps when that request fails. Fewer levels with noise have four: two tables
/// and two records, which are not given back when the rows of errors, the last request, cannot be had.
int kept(const catalog::Export& entry, const catalog::Invocation& call, int failing, int requestCount)
{
    if (!entry.name.starts_with("pyxiReduceBits_") || entry.name == "pyxiReduceBits_8u1u_C1R") return 0;
    const double noise = call.parameters[0].number, type = call.parameters[1].number;
    return noise > 0 && type <= 3 && failing == requestCount - 1 ? 4 : 0;
}

/// A call of which a request fails: it tells so, has written nothing and has kept what it keeps.
std::optional<std::string> checkFailure(const catalog::Export& entry, const Scene& scene, int failing, bool exhausted,
                                        int requestCount)
{
    const Image target = scene.target();
    const catalog::Invocation call = scene.invocation(target);
    reset({.failing = failing, .exhausted = exhausted});
    const PyxStatus found = entry.call(call);
    if (found != pyxErrNoMemory) return "status " + std::to_string(found) + " without memory";
    if (requests.given - requests.returned != kept(entry, call, failing, requestCount)) return "memory was kept";
    if (auto text = firstDifference(scene.target(), target)) return "something was written: " + *text;
    return scene.sourceDamage();
}

/// A call with memory at hand, and then each of its requests failing, alone and with all behind it.
std::optional<std::string> checkCall(const Subject& subject, int number)
{
    const catalog::Export& entry = *subject.entry;
    const Scene scene(entry, {.seed = seedOf(entry.name, number), .roi = legalSize(entry, large)});
    const Image target = scene.target();
    const catalog::Invocation call = scene.invocation(target);
    const bool allocates = entry.traits.allocates && entry.traits.allocates(call);
    reset();
    if (entry.call(call) != expectedStatus(entry, call)) return "the call failed with memory at hand";
    if (requests.sizes.empty() == allocates) return "the catalogue is wrong about scratch memory";
    if (requests.given != requests.returned) return "scratch memory was not given back";

    const int count = static_cast<int>(requests.sizes.size());
    for (int failing = 0; failing < count; ++failing) {
        for (const bool exhausted : {false, true}) {
            if (auto text = checkFailure(entry, scene, failing, exhausted, count))
                return "request " + std::to_string(failing) + ": " + *text + "\n  " + scene.text();
        }
    }
    return std::nullopt;
}

std::optional<std::string> checkAllocation(const Subject& subject)
{
    for (int number = 0; number < callsOf(*subject.entry); ++number) {
        if (auto text = checkCall(subject, number)) return text;
    }
    return std::nullopt;
}

// The tables are of 1024 numbers each, the records of generators of 56 words and of 56 floats.
TEST(ReduceBitsScratch, NoiseTablesAndErrorRows)
{
    const std::vector<u8> source(40 * 3, 100);
    std::vector<u8> target(40 * 3, 7);
    const auto call = [&](u32 noise, u32 type, RoiSize roi) {
        return pyxiReduceBits_8u_C1R(source.data(), roi.width, target.data(), roi.width, roi, noise, type, 2);
    };
    const auto sorted = [] {
        std::vector<s32> sizes = requests.sizes;
        std::ranges::sort(sizes);
        return sizes;
    };
    for (const u32 type : {0u, 4u}) {
        reset();
        EXPECT_EQ(call(0, type, {40, 3}), pyxOk);
        EXPECT_TRUE(requests.sizes.empty()) << type;
    }
    reset();
    EXPECT_EQ(call(50, 4, {40, 3}), pyxOk);
    EXPECT_EQ(sorted(), (std::vector<s32>{112, 224, 2048, 4096}));
    reset();
    EXPECT_EQ(call(50, 1, {40, 3}), pyxOk);
    EXPECT_EQ(sorted(), (std::vector<s32>{112, 224, 4 * (2 * 40 + 4), 2048, 4096}));
    reset();
    EXPECT_EQ(call(0, 2, {40, 3}), pyxOk);
    EXPECT_EQ(sorted(), (std::vector<s32>{4 * (3 * 40 + 12)}));
}

// What is there of memory by then is never given back.
TEST(ReduceBitsScratch, ErrorRowsThatFailLeaveTheNoiseTables)
{
    const u8 source = 100;
    u8 target = 7;
    for (const u32 type : {1u, 2u, 3u}) {
        reset({.failing = 4});
        EXPECT_EQ(pyxiReduceBits_8u_C1R(&source, 1, &target, 1, {1, 1}, 50, type, 2), pyxErrNoMemory);
        EXPECT_EQ(requests.given, 4);
        EXPECT_EQ(requests.returned, 0);
        EXPECT_EQ(target, 7);
    }
    reset();
}

// Rows of four more pixels, unless that has the bit of value 4.
TEST(ReduceBitsScratch, ErrorRowsOfBits)
{
    const std::vector<u8> source(16, 100);
    std::vector<u8> target(2);
    for (const auto& [width, length] : {std::pair{1, 1}, {4, 8}, {7, 11}, {8, 8}, {12, 16}}) {
        reset();
        EXPECT_EQ(pyxiReduceBits_8u1u_C1R(source.data(), 16, target.data(), 2, 0, {width, 1}, 0, 0, 3, 128), pyxOk);
        EXPECT_EQ(requests.sizes, std::vector<s32>{4 * (3 * length + 12)});
        reset();
        EXPECT_EQ(pyxiReduceBits_8u1u_C1R(source.data(), 16, target.data(), 2, 0, {width, 1}, 0, 0, 0, 128), pyxOk);
        EXPECT_TRUE(requests.sizes.empty());
    }
}

TEST(Scratch, ComesFromTheProgram)
{
    reset();
    EXPECT_TRUE(takeScratch(300));
    EXPECT_EQ(requests.sizes, std::vector<s32>{1200});
    EXPECT_EQ(requests.given, 1);
    EXPECT_EQ(requests.returned, 1);
}

TEST(Scratch, FailsWhenTheProgramHasNone)
{
    reset({.failing = 0});
    EXPECT_FALSE(takeScratch(300));
    EXPECT_EQ(requests.sizes.size(), 1U);
    EXPECT_EQ(requests.returned, 0);
}

TEST(Scratch, CountsThatCannotBeAreNotAskedFor)
{
    reset();
    for (const s32 count : {0, -1, -0x7fffffff, 0x20000000, 0x7fffffff}) EXPECT_FALSE(takeScratch(count)) << count;
    EXPECT_TRUE(requests.sizes.empty());
}

} // namespace

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    testEachExport("Allocation", checkAllocation);
    return RUN_ALL_TESTS();
}
