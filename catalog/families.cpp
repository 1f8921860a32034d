#include "catalog.hpp"

#include <algorithm>

namespace catalog
{

namespace
{

constexpr FamilyInfo table[] = {
    {Family::colorTwist, "color-twist", "Colour twists",
     "A 3 by 4 matrix of the caller's over every pixel, in 8-bit, 16-bit and float samples; a 4 by 4 one over four "
     "channels of floats."},
    {Family::gamma, "gamma", "Gamma",
     "The transfer curve of video over three channels, and its inverse: 8-bit and 16-bit samples, and floats between "
     "two bounds."},
    {Family::gray, "gray", "Gray",
     "RGB to gray with fixed weights or the caller's, gray to RGB, and the luma of packed 4:2:2, in integers and "
     "floats."},
    {Family::repack, "repack", "Chroma repacking and resampling",
     "8-bit YCbCr 4:2:0, 4:2:2, 4:1:1 and 1620 from one chroma form and plane layout to another; samples are moved, "
     "doubled or dropped, and averaged in four of them."},
    {Family::hls, "hls", "HLS",
     "RGB and BGR to hue, lightness and saturation and back: 8-bit, 16-bit and float samples, and planes of 8 bits."},
    {Family::hsv, "hsv", "HSV", "RGB to hue, saturation and value and back, in 8-bit and 16-bit samples."},
    {Family::rgbYCbCr, "rgb-ycbcr", "RGB and YCbCr at full resolution",
     "8-bit RGB to BT.601 studio-range YCbCr and back, one chroma sample a pixel."},
    {Family::rgbYuv, "rgb-yuv", "RGB and YUV at full resolution",
     "8-bit RGB to full-range YUV and back, one chroma sample a pixel."},
    {Family::rgbToSubsampled, "rgb-to-subsampled", "RGB to subsampled YCbCr",
     "8-bit RGB to BT.601 studio-range YCbCr 4:2:0, 4:2:2 and 4:1:1: planar, semi-planar or packed."},
    {Family::subsampledToRgb, "subsampled-to-rgb", "Subsampled YCbCr to RGB",
     "8-bit BT.601 studio-range YCbCr 4:2:0, 4:2:2 and 4:1:1, planar, semi-planar or packed, to RGB."},
    {Family::rgbYuvSubsampled, "rgb-yuv-subsampled", "RGB and subsampled YUV",
     "8-bit RGB to full-range YUV 4:2:0 and 4:2:2 and back, planar or packed, with steps and without."},
    {Family::bt709, "bt709", "BT.709",
     "8-bit RGB to YCbCr and back by BT.709, studio range or full range, 4:2:0, packed 4:2:2 or full resolution."},
    {Family::xyzYcc, "xyz-ycc", "XYZ and YCC",
     "RGB to CIE XYZ and to YCC, luma and two chroma samples, and back, in 8-bit, 16-bit and float samples."},
    {Family::filterInterlace, "filter-interlace", "Filtered and interlaced YCbCr",
     "8-bit YCbCr 4:2:0 and 4:2:2: chroma filtered along the columns, in whole images or in bands, and the two fields "
     "of a frame kept apart."},
    {Family::ycocg, "ycocg", "YCoCg",
     "RGB to luma, orange chroma and green chroma and back by additions and shifts, plain or without loss, 8 and 16 "
     "bits."},
    {Family::cbycr422, "cbycr422", "Packed CbYCr 4:2:2",
     "8-bit RGB to the packed 4:2:2 form with chroma first and back by BT.601, with a gamma-corrected one, and other "
     "YCbCr forms to it and back."},
    {Family::toneMap, "tone-map", "Tone mapping",
     "Floats of any range to 8 bits, by a scale that comes from the image's largest sample or from its mean."},
    {Family::packedRgb, "packed-rgb", "Packed RGB",
     "16-bit pixels of three fields, 555 or 565, to 8-bit RGB, YCbCr and YUV with shared chroma; RGB to 565."},
    {Family::ycbcrToPacked, "ycbcr-to-packed", "YCbCr to packed RGB",
     "8-bit YCbCr and YUV, at full resolution or with shared chroma, to 16-bit pixels of three fields, 444, 555 or "
     "565."},
    {Family::ditheredPacked, "dithered-packed", "YCbCr to dithered packed RGB",
     "8-bit YCbCr and YUV to 16-bit pixels of three fields, with ordered dithering."},
    {Family::cfa, "cfa", "Sensor mosaics in one pass",
     "A sensor's mosaic of one colour a place to RGB, in 8 and 16 bits: means of the samples around, green along the "
     "direction in which the picture changes less."},
    {Family::demosaicAhd, "demosaic-ahd", "Sensor mosaics by homogeneity",
     "A sensor's mosaic to RGB, in 8 and 16 bits: along rows or along columns, whichever makes the smoother picture."},
    {Family::lab, "lab", "Lab", "RGB to CIE L*a*b* and back: floats, 8 bits, and 16 bits of Lab with 8 of colour."},
    {Family::luv, "luv", "LUV", "RGB to CIE L*u*v* and back in 8 bits, 16 bits with and without a sign, and floats."},
    {Family::reduceBits, "reduce-bits", "Fewer levels",
     "8-bit, 16-bit and float samples to some levels of 8 or 16 bits: the nearest one, by error diffusion or by an "
     "ordered matrix."},
    {Family::reduceBits1u, "reduce-bits-1u", "One bit",
     "8-bit samples to one bit a pixel, by a threshold or by error diffusion."},
};

} // namespace

std::span<const FamilyInfo> families() { return table; }

const FamilyInfo& infoOf(Family family) { return *std::ranges::find(table, family, &FamilyInfo::family); }

} // namespace catalog
