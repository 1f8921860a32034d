// Calls exports on images.
#pragma once

#include "image.hpp"
#include "parameters.hpp"
#include "route.hpp"

namespace tool
{

/// Calls the export. An in-place export works on `source`, and `target` is left alone. `source` has to be laid out as
/// asSource() does it, `target` as makeTarget() does.
PyxStatus call(const catalog::Export& entry, Image& source, Image& target, const Parameters& parameters);

Image asSource(const catalog::Export& entry, const Image& image);
Image makeTarget(const catalog::Export& entry, RoiSize size);

/// Brings an image along a route. An export that returns an error on the way is a Failure.
Image follow(const Route& route, Image image);

struct Measured {
    PyxStatus status;
    Image target;
    double seconds; ///< the quickest of several calls
    double bytes;   ///< read and written by a call
    int calls;
};

/// Calls the export until the time is up, but a few times at least; once if it returns an error.
Measured measure(const catalog::Export& entry, const Image& image, const Parameters& parameters, double forSeconds);

} // namespace tool
