// Images, folders and exports to test with.
#pragma once

#include "component.hpp"
#include "failure.hpp"
#include "image_file.hpp"

#include <gtest/gtest.h>

#include <initializer_list>
#include <random>
#include <string>

namespace tool::testing
{

/// An image whose first plane begins with these bytes.
inline Image imageOf(Format format, RoiSize size, std::initializer_list<int> bytes)
{
    Image image(std::move(format), size);
    const int rowBytes = catalog::shapeOf(image.side(), 0, size).rowBytes;
    int at = 0;
    for (const int byte : bytes) {
        image.plane(0)[std::ptrdiff_t{at / rowBytes} * image.step(0) + at % rowBytes] = static_cast<u8>(byte);
        ++at;
    }
    return image;
}

/// Any bytes at all in every pixel, the same ones each time.
inline Image noise(Format format, RoiSize size)
{
    Image image(std::move(format), size);
    std::mt19937 random(1);
    for (int plane = 0; plane < image.planes(); ++plane) {
        const catalog::PlaneShape shape = catalog::shapeOf(image.side(), plane, size);
        for (int y = 0; y < shape.rows; ++y) {
            for (int x = 0; x < shape.rowBytes; ++x) {
                image.plane(plane)[std::ptrdiff_t{y} * image.step(plane) + x] = static_cast<u8>(random());
            }
        }
    }
    return image;
}

/// An empty folder, which goes with the test.
class Folder
{
public:
    Folder()
    {
        const auto* test = ::testing::UnitTest::GetInstance()->current_test_info();
        path_ = fs::path(::testing::TempDir()) / (std::string("pyxcc_") + test->test_suite_name() + "_" + test->name());
        fs::remove_all(path_);
        fs::create_directories(path_);
    }
    Folder(const Folder&) = delete;
    Folder& operator=(const Folder&) = delete;
    ~Folder() { fs::remove_all(path_); }
    fs::path operator/(std::string_view name) const { return path_ / name; }
    std::size_t count() const { return static_cast<std::size_t>(std::distance(fs::directory_iterator(path_), {})); }

private:
    fs::path path_;
};

/// The text of the Failure that `work` throws; empty if it throws none.
template <class Work> std::string failureOf(Work work)
{
    try {
        work();
    } catch (const Failure& failure) {
        return failure.what();
    }
    return {};
}

} // namespace tool::testing
