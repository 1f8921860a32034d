// What conversions of 4:2:0 images have in common.
#pragma once

#include "frame/checks.hpp"
#include "frame/row_driver.hpp"
#include "subsampled/wide_spans.hpp"

namespace pyxcc::subsampled
{

/// All whole blocks in one form.
template <class Source, class Target, class Form>
PyxStatus wholeBlocks(RoiSize roi, const Source& source, const Target& target, Form form)
{
    frame::eachRowPair(roi, source, target, frame::spans(upTo<wholePairs>, form));
    return frame::warnIfOff(roi, 2, 2);
}

} // namespace pyxcc::subsampled
