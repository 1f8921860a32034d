// The graph of conversions: formats are its nodes; the exports, and what the tool itself can repack, its edges.
#pragma once

#include "format.hpp"

#include <optional>
#include <span>
#include <vector>

namespace tool
{

struct RouteStep {
    const catalog::Export* entry; ///< null where the tool repacks, or takes samples for those of another encoding
    Format to;
};

using Route = std::vector<RouteStep>;

class Graph
{
public:
    /// The exports must outlive the graph.
    explicit Graph(std::span<const catalog::Export> exports);

    /// The shortest way that keeps the picture as it is; if there is none, the shortest way of all.
    std::optional<Route> find(const Format& from, const Format& to) const;

private:
    struct Edge {
        int to;
        const catalog::Export* entry;
        bool faithful; // leaves the picture as it is, but for rounding and subsampling
    };

    int indexOf(const Format& format) const;
    int add(const Format& format);
    void addRepacking();
    std::optional<Route> search(int from, int to, bool faithful) const;

    std::vector<Format> nodes_;
    std::vector<std::vector<Edge>> edges_;
};

/// "pyxiRGBToYCbCr_8u_C3R, repacked as YCbCr P3 u8"; empty for a route of no steps.
std::string describe(const Route& route);

} // namespace tool
