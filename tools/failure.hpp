// Errors that the user is told of, in one line each.
#pragma once

#include <sstream>
#include <stdexcept>

namespace tool
{

class Failure : public std::runtime_error
{
    using std::runtime_error::runtime_error;
};

/// Throws a Failure whose text is the parts run together.
template <class... Parts> [[noreturn]] void fail(const Parts&... parts)
{
    std::ostringstream text;
    (text << ... << parts);
    throw Failure(text.str());
}

} // namespace tool
