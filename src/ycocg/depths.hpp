// In which lanes a form computes: words as they are, or lanes twice as wide as the samples of one side or of both.
#pragma once

#include "lanes/lanes.hpp"

namespace pyxcc::ycocg
{

/// What becomes of a form's results.
enum class Results { asTheyAre, lowHalves, saturated };

template <class Form, bool Widening, Results results> struct AtDepth {
    Form form;
};

/// Words on both sides, in lanes of words.
template <class Form> constexpr auto inWords(Form form) { return AtDepth<Form, false, Results::asTheyAre>{form}; }

/// Samples on both sides half as wide as the lanes.
template <Results results, class Form> constexpr auto inDoubleWidth(Form form)
{
    return AtDepth<Form, true, results>{form};
}

/// Pixels of samples half as wide as the lanes, and planes of samples as wide as they.
template <class Form> constexpr auto toDoubleWidth(Form form) { return AtDepth<Form, true, Results::asTheyAre>{form}; }

/// The other way round.
template <Results results, class Form> constexpr auto fromDoubleWidth(Form form)
{
    return AtDepth<Form, false, results>{form};
}

namespace detail
{

template <class Form, class Lanes> PYXCC_INLINE auto throughForm(const Form& form, const Three<Lanes>& x)
{
    return form(x.a, x.b, x.c);
}

template <class Form, class Lanes> PYXCC_INLINE auto throughForm(const Form& form, const Three<Two<Lanes>>& x)
{
    const Three<Lanes> low = form(x.a.a, x.b.a, x.c.a), high = form(x.a.b, x.b.b, x.c.b);
    return Three<Two<Lanes>>{{low.a, high.a}, {low.b, high.b}, {low.c, high.c}};
}

} // namespace detail

template <class Form, bool Widening, Results results, class Samples>
PYXCC_INLINE auto apply(const AtDepth<Form, Widening, results>& depth, const Three<Samples>& pixels)
{
    if constexpr (Widening) {
        return apply(AtDepth<Form, false, results>{depth.form},
                     Three{toDoubleWidth(pixels.a), toDoubleWidth(pixels.b), toDoubleWidth(pixels.c)});
    } else {
        const auto result = detail::throughForm(depth.form, pixels);
        if constexpr (results == Results::lowHalves) {
            return Three{lowHalves(result.a), lowHalves(result.b), lowHalves(result.c)};
        } else if constexpr (results == Results::saturated) {
            return Three{saturateHalves(result.a), saturateHalves(result.b), saturateHalves(result.c)};
        } else {
            return result;
        }
    }
}

} // namespace pyxcc::ycocg
