#include "conformance/suites.hpp"
#include "support/compare.hpp"
#include "support/scene.hpp"

#include <cfenv>
#include <utility>

#if defined(__SSE2__)
#include <immintrin.h>
#endif

namespace conformance
{

using namespace support;

namespace
{

constexpr std::pair<int, const char*> modes[] = {
    {FE_TONEAREST, "to nearest"},
    {FE_DOWNWARD, "downward"},
    {FE_UPWARD, "upward"},
    {FE_TOWARDZERO, "towards zero"},
};

/// What must stay as it is: everything but the flags of what has happened so far.
unsigned vectorControl()
{
#if defined(__SSE2__)
    return _mm_getcsr() & ~0x3fU;
#else
    return 0;
#endif
}

/// Sets a rounding mode, and the one to nearest at the end.
class RoundingMode
{
public:
    explicit RoundingMode(int mode) { std::fesetround(mode); }
    ~RoundingMode() { std::fesetround(FE_TONEAREST); }
    RoundingMode(const RoundingMode&) = delete;
    RoundingMode& operator=(const RoundingMode&) = delete;
};

/// Whether the call under that mode left the mode and the rest of the control word alone.
bool keepsMode(const Subject& subject, const catalog::Invocation& call, int mode)
{
    const RoundingMode inForce(mode);
    const unsigned before = vectorControl();
    subject.entry->call(subject.function, call);
    return std::fegetround() == mode && vectorControl() == before;
}

void callReference(const Subject& subject, const catalog::Invocation& call, int mode)
{
    const RoundingMode inForce(mode);
    subject.entry->call(subject.reference, call);
}

bool isFloat(catalog::Element element) { return element == catalog::Element::f32 || element == catalog::Element::f64; }

} // namespace

Failure checkRounding(const Subject& subject)
{
    const catalog::Export& entry = *subject.entry;
    const bool modeMatters = isFloat(entry.target.element) || entry.traits.followsRounding;
    for (const int width : {1, 7, 16, 37, 64, 101}) {
        const Scene scene(entry, {.seed = seedOf(entry.name, width), .roi = legalSize(entry, {width, 4})});
        for (const auto& [mode, name] : modes) {
            const Image expected = scene.target(), actual = scene.target();
            callReference(subject, scene.invocation(expected), modeMatters ? mode : FE_TONEAREST);
            const bool kept = keepsMode(subject, scene.invocation(actual), mode);
            const std::string where = std::string("\n  rounding ") + name + ", " + scene.text();
            if (!kept) return "the rounding mode was changed" + where;
            const auto difference = firstDifference(expected, actual, entry.traits.tolerance);
            if (difference) return *difference + where;
        }
    }
    return std::nullopt;
}

} // namespace conformance
