// The examples on the pages about video, as tests: what is between the marks is what the pages show.
#include <pyxcc/pyxcc.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <thread>
#include <vector>

namespace
{

using Bytes = std::vector<u8>;

TEST(Documentation, Start)
{
    //! [start]
    const u8 rgb[] = {255, 0, 0, 255, 255, 255}; // one row: a red pixel and a white one
    u8 ycbcr[sizeof rgb];
    const RoiSize size = {2, 1};

    PyxStatus status = pyxiRGBToYCbCr_8u_C3R(rgb, sizeof rgb, ycbcr, sizeof ycbcr, size);
    // status is pyxOk, and ycbcr holds 82, 90, 240 and 235, 128, 128
    //! [start]
    EXPECT_EQ(status, pyxOk);
    EXPECT_EQ(Bytes(ycbcr, ycbcr + 6), (Bytes{82, 90, 240, 235, 128, 128}));
}

TEST(Documentation, Columns)
{
    //! [columns]
    u8 rgb[17 * 3], ycbcr[17 * 3];
    for (int i = 0; i < 17; ++i) rgb[3 * i] = 255, rgb[3 * i + 1] = 0, rgb[3 * i + 2] = 0;

    pyxiRGBToYCbCr_8u_C3R(rgb, 17 * 3, ycbcr, 17 * 3, {17, 1});
    // columns 0 to 15 hold 81, 90, 239 and column 16 holds 82, 90, 240
    //! [columns]
    for (int i = 0; i < 17; ++i) {
        EXPECT_EQ(Bytes(ycbcr + 3 * i, ycbcr + 3 * i + 3), i < 16 ? (Bytes{81, 90, 239}) : (Bytes{82, 90, 240})) << i;
    }
}

TEST(Documentation, Statuses)
{
    u8 rgb[5 * 5 * 3] = {}, y[25] = {}, cb[4] = {}, cr[4] = {};
    //! [statuses]
    u8* planes[3] = {y, cb, cr};
    const int steps[3] = {5, 2, 2};
    pyxiRGBToYCbCr420_8u_C3P3R(rgb, 15, planes, steps, {5, 5}); // pyxWarnOddSize: 4 by 4 pixels were converted
    pyxiRGBToYCbCr420_8u_C3P3R(rgb, 15, planes, steps, {0, 5}); // pyxErrSize
    planes[1] = nullptr;
    pyxiRGBToYCbCr420_8u_C3P3R(rgb, 15, planes, steps, {0, 5}); // pyxErrSize: this one tests elements after the size
    pyxiRGBToYCbCr420_8u_C3P3R(rgb, 15, planes, steps, {5, 5}); // pyxErrNullPtr
    //! [statuses]
    EXPECT_EQ(pyxiRGBToYCbCr420_8u_C3P3R(rgb, 15, planes, steps, {5, 5}), pyxErrNullPtr);
    EXPECT_EQ(pyxiRGBToYCbCr420_8u_C3P3R(rgb, 15, planes, steps, {0, 5}), pyxErrSize);
    planes[1] = cb;
    EXPECT_EQ(pyxiRGBToYCbCr420_8u_C3P3R(rgb, 15, planes, steps, {0, 5}), pyxErrSize);
    EXPECT_EQ(pyxiRGBToYCbCr420_8u_C3P3R(rgb, 15, planes, steps, {5, 5}), pyxWarnOddSize);
}

TEST(Documentation, Bands)
{
    constexpr int width = 50, height = 37, threads = 3;
    Bytes rgb(width * height * 3), whole(rgb.size()), ycbcr(rgb.size());
    for (std::size_t i = 0; i < rgb.size(); ++i) rgb[i] = static_cast<u8>(i * i / 7 + i);
    //! [bands]
    std::vector<std::thread> workers;
    for (int t = 0; t < threads; ++t) {
        const int first = height * t / threads, end = height * (t + 1) / threads, step = width * 3;
        workers.emplace_back([&, first, end, step] {
            pyxiRGBToYCbCr_8u_C3R(&rgb[first * step], step, &ycbcr[first * step], step, {width, end - first});
        });
    }
    for (std::thread& worker : workers) worker.join();
    //! [bands]
    ASSERT_EQ(pyxiRGBToYCbCr_8u_C3R(rgb.data(), width * 3, whole.data(), width * 3, {width, height}), pyxOk);
    EXPECT_EQ(ycbcr, whole);
}

TEST(Documentation, RgbYCbCr)
{
    u8 y[3] = {16, 235, 16}, cb[3] = {128, 128, 128}, cr[3] = {128, 128, 128};
    //! [rgb-ycbcr]
    const u8* const planes[3] = {y, cb, cr}; // 3 by 1 samples each: black, white, black
    u8 rgba[3 * 4];
    pyxiYCbCrToRGB_8u_P3C4R(planes, 3, rgba, 3 * 4, {3, 1}, 255);
    // rgba holds 0, 0, 0, 255 and 255, 255, 255, 255 and 0, 0, 0, 255
    //! [rgb-ycbcr]
    EXPECT_EQ(Bytes(rgba, rgba + 12), (Bytes{0, 0, 0, 255, 255, 255, 255, 255, 0, 0, 0, 255}));
}

TEST(Documentation, RgbToSubsampled)
{
    constexpr int width = 64, height = 48;
    //! [rgb-to-subsampled]
    Bytes rgb(width * height * 3, 255); // white
    Bytes nv12(width * height * 3 / 2); // a plane of luma, then one of chroma pairs
    u8* const chroma = nv12.data() + width * height;
    pyxiRGBToYCbCr420_8u_C3P2R(rgb.data(), width * 3, nv12.data(), width, chroma, width, {width, height});
    // luma is 235 and chroma 128 throughout
    //! [rgb-to-subsampled]
    EXPECT_EQ(std::count(nv12.begin(), nv12.begin() + width * height, 235), width * height);
    EXPECT_EQ(std::count(nv12.begin() + width * height, nv12.end(), 128), width * height / 2);
}

TEST(Documentation, SubsampledToRgb)
{
    constexpr int width = 64, height = 48;
    //! [subsampled-to-rgb]
    Bytes y(width * height, 16), cbCr(width * height / 2, 128), bgra(width * height * 4);
    // upside down: the first row of the source becomes the last one of the target
    u8* const lastRow = bgra.data() + (height - 1) * width * 4;
    pyxiYCbCr420ToBGR_8u_P2C4R(y.data(), width, cbCr.data(), width, lastRow, -width * 4, {width, height}, 255);
    // every pixel is 0, 0, 0, 255
    //! [subsampled-to-rgb]
    EXPECT_EQ(std::count(bgra.begin(), bgra.end(), 0), width * height * 3);
    EXPECT_EQ(std::count(bgra.begin(), bgra.end(), 255), width * height);
}

TEST(Documentation, Bt709)
{
    //! [bt709]
    const u8 black[4 * 4 * 4] = {}; // B, G, R and a fourth byte
    u8 y[4 * 4], cb[2 * 2], cr[2 * 2];
    u8* const planes[3] = {y, cb, cr};
    const int steps[3] = {4, 2, 2};
    pyxiBGRToYCbCr420_709CSC_8u_AC4P3R(black, 16, planes, steps, {4, 4});  // y is 16: studio range
    pyxiBGRToYCbCr420_709HDTV_8u_AC4P3R(black, 16, planes, steps, {4, 4}); // y is 1: full range, held to 1 to 254
    //! [bt709]
    EXPECT_EQ(std::count(y, y + 16, 1), 16);
    pyxiBGRToYCbCr420_709CSC_8u_AC4P3R(black, 16, planes, steps, {4, 4});
    EXPECT_EQ(std::count(y, y + 16, 16), 16);
}

TEST(Documentation, RgbYuv)
{
    //! [rgb-yuv]
    const u8 white[3] = {255, 255, 255};
    u8 yuv[3], rgb[3];
    pyxiRGBToYUV_8u_C3R(white, 3, yuv, 3, {1, 1}); // 255, 128, 128: luma takes the whole byte
    pyxiYUVToRGB_8u_C3R(yuv, 3, rgb, 3, {1, 1});   // 255, 255, 255
    //! [rgb-yuv]
    EXPECT_EQ(Bytes(yuv, yuv + 3), (Bytes{255, 128, 128}));
    EXPECT_EQ(Bytes(rgb, rgb + 3), (Bytes{255, 255, 255}));
}

TEST(Documentation, RgbYuvSubsampled)
{
    constexpr int width = 32, height = 16;
    //! [rgb-yuv-subsampled]
    Bytes rgb(width * height * 3), y(width * height), u(width * height / 4), v(width * height / 4);
    u8* const planes[3] = {y.data(), u.data(), v.data()};
    pyxiRGBToYUV420_8u_C3P3(rgb.data(), planes, {width, height}); // no steps: rows without gaps
    // of a black image: y is 0, u and v are 128
    //! [rgb-yuv-subsampled]
    EXPECT_EQ(std::count(y.begin(), y.end(), 0), width * height);
    EXPECT_EQ(std::count(u.begin(), u.end(), 128), width * height / 4);
    EXPECT_EQ(std::count(v.begin(), v.end(), 128), width * height / 4);
}

TEST(Documentation, CbYCr422)
{
    //! [cbycr422]
    const u8 packed[] = {128, 16, 128, 235}; // Cb, Y, Cr, Y: a black pixel and a white one
    u8 bgra[2 * 4];
    pyxiCbYCr422ToBGR_8u_C2C4R(packed, 4, bgra, 8, {2, 1}, 7); // 0, 0, 0, 7 and 255, 255, 255, 7
    //! [cbycr422]
    EXPECT_EQ(Bytes(bgra, bgra + 8), (Bytes{0, 0, 0, 7, 255, 255, 255, 7}));
}

TEST(Documentation, Repack)
{
    //! [repack]
    const u8 y[4 * 2] = {1, 2, 3, 4, 5, 6, 7, 8}, cbCr[4] = {100, 200, 101, 201}; // 4 by 2 pixels, 4:2:0
    u8 packed[8 * 2];
    pyxiYCbCr420ToYCbCr422_8u_P2C2R(y, 4, cbCr, 4, packed, 8, {4, 2});
    // 1 100 2 200 3 101 4 201
    // 5 100 6 200 7 101 8 201: the row of chroma serves both rows
    //! [repack]
    EXPECT_EQ(Bytes(packed, packed + 16), (Bytes{1, 100, 2, 200, 3, 101, 4, 201, 5, 100, 6, 200, 7, 101, 8, 201}));
}

TEST(Documentation, FilterInterlace)
{
    constexpr int width = 2, height = 8;
    //! [filter-interlace]
    const Bytes y(width * height), cb = {0, 16, 32, 48}, cr(4, 128); // 4 rows of chroma, a sample each
    Bytes yTo(y.size()), cbTo(8), crTo(8);
    const u8* const from[3] = {y.data(), cb.data(), cr.data()};
    u8* const to[3] = {yTo.data(), cbTo.data(), crTo.data()};
    const int steps[3] = {width, width / 2, width / 2};
    pyxiYCbCr420ToYCbCr422_Filter_8u_P3R(from, steps, to, steps, {width, height});
    // cbTo: 0, 7, 16, 24, 32, 41, 48, 49 - between the rows along a curve, and beyond the last as if it went on
    //! [filter-interlace]
    // (9 (0 + 16) - 0 - 32 + 8) >> 4 = 7; (9 (16 + 32) - 0 - 48 + 8) >> 4 = 24; (9 (32 + 48) - 16 - 48 + 8) >> 4 = 41;
    // (9 (48 + 48) - 32 - 48 + 8) >> 4 = 49
    EXPECT_EQ(cbTo, (Bytes{0, 7, 16, 24, 32, 41, 48, 49}));
}

} // namespace
