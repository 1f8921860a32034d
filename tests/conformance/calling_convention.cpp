// How arguments reach an export on 32-bit x86, seen from the machine code of a caller: all on the stack, which the
// export clears of them. Elsewhere the platform's own convention holds, and there is nothing to see.
#if defined(__i386__)

#include "pyxcc/pyxcc.h"
#include "support/exported_names.hpp"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <string_view>
#include <vector>

namespace
{

using Words = std::array<u32, 32>;

struct Returned {
    s32 value;
    u32 removed; ///< bytes that the export took off the stack
};

/// Calls with the words on the stack, the first one lowest, and nothing of them in a register.
Returned callWith(const Words& words, const void* function)
{
    Returned returned;
    const u32* from = words.data();
    asm volatile("movl %%esp, %%ebx\n\t"
                 "andl $-16, %%esp\n\t"
                 "subl $128, %%esp\n\t"
                 "movl %%esp, %%edi\n\t"
                 "movl $32, %%ecx\n\t"
                 "cld\n\t"
                 "rep movsl\n\t"
                 "movl %%esp, %%edi\n\t"
                 "movl %%eax, %%esi\n\t"
                 "movl $0x55555555, %%eax\n\t"
                 "movl %%eax, %%ecx\n\t"
                 "movl %%eax, %%edx\n\t"
                 "call *%%esi\n\t"
                 "movl %%esp, %%ecx\n\t"
                 "subl %%edi, %%ecx\n\t"
                 "movl %%ebx, %%esp"
                 : "=a"(returned.value), "=c"(returned.removed), "+S"(from)
                 : "a"(function)
                 : "ebx", "edx", "edi", "memory", "cc", "xmm0", "xmm1", "xmm2", "xmm3", "xmm4", "xmm5", "xmm6", "xmm7");
    return returned;
}

template <class T> u32 wordOf(T* pointer) { return reinterpret_cast<u32>(pointer); }

/// Bytes of the arguments of a signature, each of them in whole words.
template <class... A> u32 sizeOnStack(PyxStatus(PYXCC_CALL*)(A...))
{
    return (((static_cast<u32>(sizeof(A)) + 3) / 4 * 4) + ... + 0);
}

struct Entry {
    std::string_view name;
    const void* function;
    u32 size;
};

const std::vector<Entry>& entries()
{
    static const std::vector<Entry> all = {
#define EXPORT(name, ...) {#name, reinterpret_cast<const void*>(&::name), sizeOnStack(&::name)},
#include "exports.def"
#undef EXPORT
    };
    return all;
}

TEST(CallingConvention, EveryExportRemovesItsArguments)
{
    ASSERT_EQ(entries().size(), 520U);
    for (const Entry& entry : entries()) {
        const Returned returned = callWith(Words{}, entry.function);
        EXPECT_EQ(returned.removed, entry.size) << entry.name;
        EXPECT_LT(returned.value, 0) << entry.name; // null pointers, and no size
    }
}

TEST(CallingConvention, NamesAreUndecorated)
{
    std::vector<std::string> expected = {"pyxccGetLibVersion"};
    for (const Entry& entry : entries()) expected.emplace_back(entry.name);
    const auto found = support::exportedNames(reinterpret_cast<const void*>(&pyxccGetLibVersion));
    EXPECT_EQ(support::difference(expected, found), "");
}

TEST(CallingConvention, TheVersionQueryRemovesNothing)
{
    const Returned returned = callWith(Words{}, reinterpret_cast<const void*>(&pyxccGetLibVersion));
    EXPECT_EQ(returned.removed, 0U);
    EXPECT_EQ(returned.value, reinterpret_cast<s32>(pyxccGetLibVersion()));
}

// Source, its step, target, its step, width, height; white is 235, 128, 128, and black 16, 128, 128.
TEST(CallingConvention, ARegionIsTwoWordsWithTheWidthLower)
{
    const std::array<u8, 6> rgb = {255, 255, 255, 0, 0, 0};
    std::array<u8, 7> ycbcr = {};
    ycbcr.back() = 0x55;
    const Words words = {wordOf(rgb.data()), 6, wordOf(ycbcr.data()), 6, 2, 1};
    const Returned returned = callWith(words, reinterpret_cast<const void*>(&pyxiRGBToYCbCr_8u_C3R));
    EXPECT_EQ(returned.value, pyxOk);
    EXPECT_EQ(returned.removed, 24U);
    EXPECT_EQ(ycbcr, (std::array<u8, 7>{235, 128, 128, 16, 128, 128, 0x55}));
}

} // namespace

#endif
