#include "support/exported_names.hpp"

#include <dlfcn.h>
#include <elf.h>

#include <algorithm>
#include <cstring>
#include <fstream>
#include <iterator>

namespace support
{

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

std::string fileOf(const void* function)
{
    Dl_info info = {};
    return dladdr(function, &info) != 0 ? info.dli_fname : "";
}

template <class T> T recordAt(const std::string& bytes, std::size_t offset)
{
    T record;
    std::memcpy(&record, bytes.data() + offset, sizeof record);
    return record;
}

void addMissing(std::string& text, const char* what, const std::vector<std::string>& from,
                const std::vector<std::string>& in)
{
    std::vector<std::string> names;
    std::ranges::set_difference(from, in, std::back_inserter(names));
    for (const std::string& name : names) text += what + name + "\n";
}

} // namespace

std::vector<std::string> exportedNames(const void* function)
{
    std::ifstream file(fileOf(function), std::ios::binary);
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
    std::ranges::sort(names);
    return names;
}

std::string difference(const std::vector<std::string>& expected, const std::vector<std::string>& found)
{
    std::string text;
    addMissing(text, "missing: ", expected, found);
    addMissing(text, "too many: ", found, expected);
    return text;
}

} // namespace support
