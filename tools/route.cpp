#include "route.hpp"

#include "repack.hpp"
#include "text.hpp"

#include <algorithm>
#include <deque>

namespace tool
{

namespace
{

using catalog::Element;

/// Converts a picture to another model or layout, rather than working on it within one. Those without steps have
/// siblings with them.
bool converts(const catalog::Export& entry)
{
    return !entry.stepless && !entry.source.model.empty() && !entry.target.model.empty();
}

bool isSubsampled(const catalog::Side& side) { return side.chromaX + side.chromaY > 0; }

bool resamples(const catalog::Export& entry)
{
    const catalog::Side &a = entry.source, &b = entry.target;
    return isSubsampled(a) && isSubsampled(b) && (a.chromaX != b.chromaX || a.chromaY != b.chromaY);
}

/// Does more to the picture than a plain conversion.
bool changesPicture(const catalog::Export& entry)
{
    if (resamples(entry) || (entry.parameterCount > 0 && entry.parameterTypes[0].pointer)) return true;
    return std::ranges::any_of(std::initializer_list<std::string_view>{"Dither", "Filter", "Gamma", "Interlace"},
                               [&](std::string_view variant) { return entry.variant == variant; });
}

/// A picture that has gone through such a format has lost colours or levels.
bool isCoarse(const Format& format)
{
    return isPacked(format.side) || format.side.element == Element::bit || componentsOf(format.side).size() == 1;
}

bool differInEncodingOnly(const Format& a, const Format& b)
{
    Format plain = b;
    plain.encoding = a.encoding;
    return a == plain && a.encoding != b.encoding;
}

} // namespace

Graph::Graph(std::span<const catalog::Export> exports)
{
    for (Element element : {Element::u8, Element::u16, Element::f32}) {
        for (std::string_view layout : {"C3", "C4", "AC4"}) add(rgb(layout, element));
        add(gray(element));
    }
    for (const catalog::Export& entry : exports) {
        const int from = add(sourceOf(entry)), to = add(targetOf(entry));
        if (converts(entry)) edges_[from].push_back({to, &entry, !changesPicture(entry)});
    }
    addRepacking();
}

int Graph::indexOf(const Format& format) const
{
    const auto at = std::ranges::find(nodes_, format);
    return at == nodes_.end() ? -1 : static_cast<int>(at - nodes_.begin());
}

int Graph::add(const Format& format)
{
    if (const int known = indexOf(format); known >= 0) return known;
    nodes_.push_back(format);
    edges_.emplace_back();
    return static_cast<int>(nodes_.size()) - 1;
}

void Graph::addRepacking()
{
    const int count = static_cast<int>(nodes_.size());
    for (int from = 0; from < count; ++from) {
        for (int to = 0; to < count; ++to) {
            if (from == to) continue;
            if (canRepack(nodes_[from], nodes_[to])) {
                edges_[from].push_back({to, nullptr, true});
            } else if (differInEncodingOnly(nodes_[from], nodes_[to])) {
                edges_[from].push_back({to, nullptr, false});
            }
        }
    }
}

std::optional<Route> Graph::find(const Format& from, const Format& to) const
{
    const int start = indexOf(from), goal = indexOf(to);
    if (start < 0 || goal < 0) return std::nullopt;
    const auto route = search(start, goal, true);
    return route ? route : search(start, goal, false);
}

std::optional<Route> Graph::search(int from, int to, bool faithful) const
{
    struct Arrival {
        int from = -1;
        const Edge* by = nullptr;
    };
    std::vector<Arrival> arrivals(nodes_.size());
    arrivals[from].from = from;
    std::deque<int> queue = {from};
    while (!queue.empty() && arrivals[to].from < 0) {
        const int at = queue.front();
        queue.pop_front();
        if (at != from && isCoarse(nodes_[at])) continue;
        for (const Edge& edge : edges_[at]) {
            if (arrivals[edge.to].from >= 0 || (faithful && !edge.faithful)) continue;
            arrivals[edge.to] = {at, &edge};
            queue.push_back(edge.to);
        }
    }
    if (arrivals[to].from < 0) return std::nullopt;

    Route route;
    for (int at = to; at != from; at = arrivals[at].from) route.push_back({arrivals[at].by->entry, nodes_[at]});
    std::ranges::reverse(route);
    return route;
}

std::string describe(const Route& route)
{
    std::vector<std::string> steps;
    for (const RouteStep& step : route) {
        steps.push_back(step.entry != nullptr ? std::string(step.entry->name) : "repacked as " + nameOf(step.to));
    }
    return joined(steps, ", ");
}

} // namespace tool
