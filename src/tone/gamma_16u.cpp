// Gamma of 16-bit samples: computed, or by a table of all 65536 where an image has more samples than that.
#include "pyxcc/gamma.h"

#include "frame/scratch.hpp"
#include "tone/gamma_word_table.hpp"

using namespace pyxcc::tone;

namespace
{

struct ByTable {
    const u16* table;

    template <class Layout>
    void operator()(Layout, RoiSize roi, const u16* src, int srcStep, u16* dst, int dstStep) const
    {
        using namespace pyxcc::layouts;
        for (int y = 0; y < roi.height; ++y)
            Layout::lookUp(table, rowAt(bytes(src), srcStep, y), rowAt(bytes(dst), dstStep, y), roi.width);
    }
};

/// Counted in 32 bits, whatever the layout, so that some images of over 2^31 samples count as small ones.
bool needsTable(RoiSize roi)
{
    return static_cast<s32>(static_cast<u32>(roi.width) * 3u * static_cast<u32>(roi.height)) > wordTableSize;
}

template <class Curve, class Images> PyxStatus gamma(const Images& images)
{
    if (const PyxStatus failure = images.failure()) return failure;
    if (!needsTable(images.roi)) {
        images.through(EachSample<GammaOfWords<Curve>>{});
        return pyxOk;
    }
    const auto table = pyxcc::frame::allocate<u16>(wordTableSize);
    if (!table) return pyxErrNoMemory;
    fillTable<Curve>(table.get());
    images.through(ByTable{table.get()});
    return pyxOk;
}

} // namespace

PyxStatus PYXCC_CALL pyxiGammaFwd_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return gamma<ForwardCurve>(onC3(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi)
{
    return gamma<ForwardCurve>(onC3(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return gamma<ForwardCurve>(onAC4(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi)
{
    return gamma<ForwardCurve>(onAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep,
                                          RoiSize roi)
{
    return gamma<ForwardCurve>(onP3(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaFwd_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi)
{
    return gamma<ForwardCurve>(onP3<u16>(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_16u_C3R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return gamma<InverseCurve>(onC3(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_16u_C3IR(u16* srcDst, int srcDstStep, RoiSize roi)
{
    return gamma<InverseCurve>(onC3(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_16u_AC4R(const u16* src, int srcStep, u16* dst, int dstStep, RoiSize roi)
{
    return gamma<InverseCurve>(onAC4(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_16u_AC4IR(u16* srcDst, int srcDstStep, RoiSize roi)
{
    return gamma<InverseCurve>(onAC4(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_16u_P3R(const u16* const src[3], int srcStep, u16* const dst[3], int dstStep,
                                          RoiSize roi)
{
    return gamma<InverseCurve>(onP3(src, srcStep, dst, dstStep, roi));
}

PyxStatus PYXCC_CALL pyxiGammaInv_16u_IP3R(u16* const srcDst[3], int srcDstStep, RoiSize roi)
{
    return gamma<InverseCurve>(onP3<u16>(srcDst, srcDstStep, srcDst, srcDstStep, roi));
}
