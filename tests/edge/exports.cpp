// The export surface, read from the library's file: what programs can link to.
#include "catalog.hpp"

#include <dlfcn.h>
#include <elf.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

namespace
{

#if defined(__LP64__)
using FileHeader = Elf64_Ehdr;
using Section = Elf64_Shdr;
using Symbol = Elf64_Sym;
#else
using FileHeader = Elf32_Ehdr;
using Section = Elf32_Shdr;
using Symbol = Elf32_Sym;
#endif

/// The file that the function was loaded from.
std::string fileOf(const void* function)
{
    Dl_info info = {};
    return dladdr(function, &info) != 0 ? info.dli_fname : "";
}

template <typename T> T recordAt(const std::string& bytes, std::size_t offset)
{
    T record;
    std::memcpy(&record, bytes.data() + offset, sizeof record);
    return record;
}

/// The names that a shared library defines for others, sorted.
std::vector<std::string> definedNames(const std::string& path)
{
    std::ifstream file(path, std::ios::binary);
    const std::string bytes{std::istreambuf_iterator<char>(file), {}};
    if (bytes.size() < sizeof(FileHeader)) return {};

    const auto header = recordAt<FileHeader>(bytes, 0);
    const auto section = [&](std::size_t i) { return recordAt<Section>(bytes, header.e_shoff + i * sizeof(Section)); };
    std::vector<std::string> names;
    for (std::size_t i = 0; i < header.e_shnum; ++i) {
        const Section symbols = section(i);
        if (symbols.sh_type != SHT_DYNSYM) continue;
        const Section texts = section(symbols.sh_link);
        for (std::size_t at = 0; at < symbols.sh_size; at += sizeof(Symbol)) {
            const auto symbol = recordAt<Symbol>(bytes, symbols.sh_offset + at);
            if (symbol.st_name != 0 && symbol.st_shndx != SHN_UNDEF)
                names.emplace_back(bytes.data() + texts.sh_offset + symbol.st_name);
        }
    }
    std::sort(names.begin(), names.end());
    return names;
}

} // namespace

TEST(Exports, AreTheVersionQueryAndTheCatalogue)
{
    std::vector<std::string> expected = {"pyxccGetLibVersion"};
    for (const catalog::Export& entry : catalog::exports()) expected.emplace_back(entry.name);
    EXPECT_EQ(definedNames(fileOf(reinterpret_cast<const void*>(&pyxccGetLibVersion))), expected);
}

TEST(Exports, AreListedInStrictAlphabeticalOrder)
{
    const auto exports = catalog::exports();
    ASSERT_FALSE(exports.empty());
    EXPECT_GT(exports.front().name, "pyxccGetLibVersion");
    for (std::size_t i = 1; i < exports.size(); ++i) EXPECT_LT(exports[i - 1].name, exports[i].name);
}
