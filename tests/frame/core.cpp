// The core library by itself.
#include "pyxcc/core.h"
#include "support/exported_names.hpp"

#include <gtest/gtest.h>

#include <cstring>
#include <limits>
#include <thread>
#include <vector>

namespace
{

TEST(Core, ExportsFourFunctions)
{
    const std::vector<std::string> expected = {"pyxFree", "pyxGetEnabledCpuFeatures", "pyxGetMaxCacheSizeB",
                                               "pyxMalloc"};
    const auto found = support::exportedNames(reinterpret_cast<const void*>(&pyxMalloc));
    EXPECT_EQ(support::difference(expected, found), "");
}

TEST(Core, MemoryIsAlignedAndWritable)
{
    for (const s32 size : {1, 2, 63, 64, 65, 1000, 4096, 131072, 10000001}) {
        auto* const memory = static_cast<u8*>(pyxMalloc(size));
        ASSERT_NE(memory, nullptr) << size;
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(memory) % 64, 0U) << size;
        std::memset(memory, 0x5a, static_cast<std::size_t>(size));
        EXPECT_EQ(memory[size - 1], 0x5a);
        pyxFree(memory);
    }
}

TEST(Core, LessThanAByteIsNoMemory)
{
    for (const s32 size : {0, -1, -64, std::numeric_limits<s32>::min()}) EXPECT_EQ(pyxMalloc(size), nullptr) << size;
}

TEST(Core, NothingCanBeFreed) { pyxFree(nullptr); }

/// Blocks that two threads had at once would not keep what each wrote.
void allocateOverAndOver(u8 mark, int& damaged)
{
    for (int i = 0; i < 2000; ++i) {
        const s32 size = 1 + i * 7 % 3000;
        auto* const memory = static_cast<u8*>(pyxMalloc(size));
        std::memset(memory, mark, static_cast<std::size_t>(size));
        std::this_thread::yield();
        for (s32 k = 0; k < size; ++k) damaged += memory[k] != mark;
        pyxFree(memory);
    }
}

TEST(Core, ThreadsAllocateAtOnce)
{
    constexpr int count = 4;
    int damaged[count] = {};
    {
        std::vector<std::jthread> threads;
        for (int i = 0; i < count; ++i) {
            threads.emplace_back(allocateOverAndOver, static_cast<u8>(i), std::ref(damaged[i]));
        }
    }
    for (const int number : damaged) EXPECT_EQ(number, 0);
}

TEST(Core, CacheSizeIsPositiveIfKnown)
{
    s32 size = -77;
    if (pyxGetMaxCacheSizeB(&size) == pyxOk) {
        EXPECT_GT(size, 0);
    } else {
        EXPECT_EQ(size, -77);
    }
}

TEST(Core, CacheSizeNeedsAPlace) { EXPECT_EQ(pyxGetMaxCacheSizeB(nullptr), pyxErrNullPtr); }

TEST(Core, FeaturesBuildOnEachOther)
{
    const u32 mask = pyxGetEnabledCpuFeatures();
    EXPECT_EQ(pyxGetEnabledCpuFeatures(), mask);
    EXPECT_EQ(mask & ~0xffU, 0U);
    const u32 chain[] = {pyxCpuSse2, pyxCpuSse3, pyxCpuSsse3, pyxCpuSse41, pyxCpuSse42, pyxCpuAvx, pyxCpuAvx2};
    for (std::size_t i = 1; i < std::size(chain); ++i) {
        if (mask & chain[i]) {
            EXPECT_TRUE(mask & chain[i - 1]) << "bit " << chain[i] << " without bit " << chain[i - 1];
        }
    }
}

} // namespace
