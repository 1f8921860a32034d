// What images are filled with.
#pragma once

#include "support/image.hpp"
#include "support/random.hpp"

namespace support
{

enum class Pattern {
    random,
    extremes, ///< the least and the greatest sample only
    ramp,     ///< rising by a constant, and starting again
    flat,     ///< one value a plane
    gray,     ///< all samples of a pixel are equal
    bytes,    ///< any bit patterns, not a number and infinities among them
};

std::string_view nameOf(Pattern pattern);

/// Those that keep to the range of an export's samples.
inline constexpr Pattern allPatterns[] = {Pattern::random, Pattern::extremes, Pattern::ramp, Pattern::flat,
                                          Pattern::gray};

/// Random bytes everywhere, then samples of the pattern in the rows.
void fillSamples(Image& image, const catalog::Side& side, catalog::Range range, Pattern pattern, Random& random);

/// Random bytes everywhere.
void fillBytes(Image& image, Random& random);

/// The least and the greatest number that a range asks for.
catalog::Range limitsOf(catalog::Element element, catalog::Range range);

/// Stores a number, which must be within its type's limits, at any address.
void store(catalog::Element element, u8* at, double number);

/// Reads a sample from any address.
double load(catalog::Element element, const u8* at);

} // namespace support
