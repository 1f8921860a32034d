#include "support/subject.hpp"

#include "reference/reference.hpp"
#include "support/called.hpp"

#include <algorithm>
#include <stdexcept>
#include <type_traits>
#include <vector>

namespace support
{

namespace
{

#define EXPORT(name, ...)                                                                                              \
    static_assert(std::is_same_v<decltype(&::name), decltype(&Called<&reference::name>::call)>,                        \
                  "the reference of " #name " has another signature");
#include "exports.def"
#undef EXPORT

std::vector<catalog::Function> references()
{
    return {
#define EXPORT(name, ...) called<&reference::name>(),
#include "exports.def"
#undef EXPORT
    };
}

std::vector<Subject> pair()
{
    const auto functions = references();
    const auto entries = catalog::exports();
    std::vector<Subject> all;
    for (std::size_t i = 0; i < entries.size(); ++i) all.push_back({&entries[i], entries[i].function, functions[i]});
    return all;
}

} // namespace

std::span<const Subject> subjects()
{
    static const std::vector<Subject> all = pair();
    return all;
}

Subject substitute(std::string_view name, catalog::Function function)
{
    const auto all = subjects();
    const auto at = std::ranges::find(all, name, [](const Subject& subject) { return subject.entry->name; });
    if (at == all.end()) throw std::invalid_argument("no such export");
    return {at->entry, function, at->reference};
}

} // namespace support
