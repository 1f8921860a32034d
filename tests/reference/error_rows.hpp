// Rows of errors, as they are diffused from pixel to pixel.
#pragma once

#include <array>
#include <cstddef>
#include <vector>

namespace reference
{

/// A row with two zeros at either end.
template <typename T> class ErrorRow
{
public:
    explicit ErrorRow(int width) : errors_(static_cast<std::size_t>(width) + 4) {}

    T& operator[](int column) { return errors_[static_cast<std::size_t>(column + 2)]; }

private:
    std::vector<T> errors_;
};

/// The row at work, the one above it, and the one above that.
template <typename T> using ErrorRows = std::array<ErrorRow<T>, 3>;

template <typename T> ErrorRows<T> errorRows(int width)
{
    return {ErrorRow<T>(width), ErrorRow<T>(width), ErrorRow<T>(width)};
}

} // namespace reference
