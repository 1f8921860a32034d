#include "lookup.hpp"

#include "failure.hpp"
#include "text.hpp"

#include <algorithm>
#include <numeric>

namespace tool
{

namespace
{

/// Up to three names near to `name`, the nearest first.
std::vector<std::string_view> near(const std::string& name)
{
    const std::string wanted = lowered(name);
    std::vector<std::pair<int, std::string_view>> ranked;
    for (const catalog::Export& entry : catalog::exports()) {
        const int distance = editDistance(wanted, lowered(entry.name));
        if (distance <= std::max<int>(3, static_cast<int>(wanted.size()) / 4))
            ranked.emplace_back(distance, entry.name);
    }
    std::ranges::stable_sort(ranked, {}, &std::pair<int, std::string_view>::first);
    std::vector<std::string_view> names;
    for (std::size_t i = 0; i < std::min<std::size_t>(3, ranked.size()); ++i) names.push_back(ranked[i].second);
    return names;
}

} // namespace

std::vector<const catalog::Export*> matching(const std::string& filter)
{
    const std::string wanted = lowered(filter);
    std::vector<const catalog::Export*> found;
    for (const catalog::Export& entry : catalog::exports()) {
        const bool inName = lowered(entry.name).find(wanted) != std::string::npos;
        if (inName || catalog::infoOf(entry.family).slug == wanted) found.push_back(&entry);
    }
    if (found.empty()) fail("no export and no family matches '", filter, "'");
    return found;
}

const catalog::Export& named(const std::string& name)
{
    if (const catalog::Export* entry = catalog::find(name)) return *entry;
    const auto candidates = near(name);
    if (candidates.empty()) fail("no export is called '", name, "'; see pyxcc list");
    fail("no export is called '", name, "'; did you mean ", joined(candidates, ", "), "?");
}

int editDistance(std::string_view a, std::string_view b)
{
    std::vector<int> row(b.size() + 1);
    std::iota(row.begin(), row.end(), 0);
    for (std::size_t i = 0; i < a.size(); ++i) {
        int diagonal = row[0]++;
        for (std::size_t j = 0; j < b.size(); ++j) {
            const int replaced = diagonal + (a[i] == b[j] ? 0 : 1);
            diagonal = row[j + 1];
            row[j + 1] = std::min({replaced, row[j] + 1, row[j + 1] + 1});
        }
    }
    return row.back();
}

} // namespace tool
