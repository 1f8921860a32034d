#include "support/memory.hpp"

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <new>
#include <system_error>

namespace support
{

namespace
{

constexpr std::size_t line = 64; ///< alignments count from its multiples
constexpr std::size_t margin = 2 * line;

void require(bool success, const char* what)
{
    if (!success) throw std::system_error(errno, std::generic_category(), what);
}

} // namespace

std::string_view nameOf(Placement placement)
{
    constexpr std::string_view names[] = {"amid margins", "ending at a guard page", "beginning at a guard page"};
    return names[static_cast<int>(placement)];
}

Memory::Memory(Placement placement, std::size_t size, std::size_t alignment)
{
    if (placement == Placement::margins) {
        allocateWithMargins(size, alignment);
    } else {
        allocateGuarded(placement, size);
    }
}

void Memory::Release::operator()(u8* memory) const
{
    if (mapped) {
        munmap(memory, mapped);
    } else {
        ::operator delete (memory, std::align_val_t{line});
    }
}

void Memory::allocateWithMargins(std::size_t size, std::size_t alignment)
{
    const std::size_t total = margin + alignment + size + margin;
    owner_ = {static_cast<u8*>(::operator new (total, std::align_val_t{line})), Release{0}};
    all_ = {owner_.get(), total};
    bytes_ = all_.subspan(margin + alignment, size);
}

void Memory::allocateGuarded(Placement placement, std::size_t size)
{
    static const auto page = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
    const std::size_t usable = std::max<std::size_t>((size + page - 1) / page, 1) * page;
    const std::size_t mapped = page + usable + page;
    void* const address = mmap(nullptr, mapped, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    require(address != MAP_FAILED, "mmap");
    owner_ = {static_cast<u8*>(address), Release{mapped}};
    all_ = {owner_.get() + page, usable};
    require(mprotect(all_.data(), usable, PROT_READ | PROT_WRITE) == 0, "mprotect");
    bytes_ = placement == Placement::endAtGuard ? all_.last(size) : all_.first(size);
}

} // namespace support
