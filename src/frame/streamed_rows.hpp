// Walks the rows of a region with a target that goes past the cache.
#pragma once

#include "frame/row_driver.hpp"
#include "layouts/streamed_images.hpp"

#include <algorithm>

namespace pyxcc::frame
{

/// Takes every row of a region, top to bottom, through a form. What is in front of the first aligned column, less than
/// a block, and what is left at the end of a row go through the cache.
template <class Source, class Image, class Form>
PYXCC_INLINE PyxStatus eachRowStreamed(RoiSize roi, const Source& source, const layouts::StreamedImage<Image>& target,
                                       const Form& form)
{
    for (int y = 0; y < roi.height; ++y) {
        const auto from = source.row(y);
        const auto to = target.row(y);
        const int aligned = std::min(to.firstAligned(), roi.width);
        convertColumns(from, to, 0, aligned, form);
        convertColumns(from, to, aligned, roi.width, form);
    }
    layouts::fenceStreams();
    return pyxOk;
}

} // namespace pyxcc::frame
