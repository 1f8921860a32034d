// Takes an export's C signature apart at compile time: how its arguments are drawn from an Invocation.
#pragma once

#include "catalog.hpp"

#include <tuple>
#include <type_traits>

namespace catalog::detail
{

/// What is known of a signature besides the types: which roles its image arguments have had so far.
struct Cursor {
    int side = 0; // 0: source, 1: target
    int planes[2] = {0, 0};
    bool stepTaken = false; // of the latest image pointer: a number behind it is a parameter
    int parameter = 0;
    bool inPlace = false;
    bool mosaic =
        false; // its region stands in front of the target, so that the target's step is the last of the images
    bool afterRoi = false;
};

/// Draws the argument of type A from the invocation and moves the cursor on. An image pointer comes before its step.
template <class A> A take(Cursor& at, const Invocation& call)
{
    const auto image = [&](bool isTarget) {
        at.side = isTarget && !at.inPlace ? 1 : 0;
        at.stepTaken = false;
        return at.side == 1 ? call.target.data() : call.source.data();
    };
    if constexpr (std::is_same_v<A, RoiRect>) {
        at.mosaic = true;
        return {0, 0, call.roi.width, call.roi.height};
    } else if constexpr (std::is_same_v<A, RoiSize>) {
        at.afterRoi = !at.mosaic;
        return call.roi;
    } else if constexpr (std::is_same_v<A, int> || std::is_arithmetic_v<A>) {
        if constexpr (std::is_same_v<A, int>) {
            if (!at.afterRoi && !at.stepTaken) {
                at.stepTaken = true;
                const int plane = at.planes[at.side] - 1;
                at.afterRoi = at.mosaic && at.side == 1;
                return at.side == 1 ? call.targetStep[plane] : call.sourceStep[plane];
            }
        }
        return static_cast<A>(call.parameters[at.parameter++].number);
    } else if constexpr (std::is_same_v<A, const int*>) {
        return at.side == 1 ? call.targetStep.data() : call.sourceStep.data();
    } else {
        static_assert(std::is_pointer_v<A>);
        using Pointee = std::remove_pointer_t<A>;
        if (at.afterRoi) return static_cast<A>(const_cast<void*>(call.parameters[at.parameter++].pointer));
        if constexpr (std::is_pointer_v<Pointee>) { // an array of planes
            using Sample = std::remove_pointer_t<Pointee>;
            void* const* planes = image(!std::is_const_v<Sample>);
            at.planes[at.side] = 1; // one step, or an array of them, follows
            const bool null = at.side == 1 ? call.targetArrayNull : call.sourceArrayNull;
            return null ? nullptr : reinterpret_cast<A>(planes);
        } else {
            void* const* planes = image(!std::is_const_v<Pointee>);
            return static_cast<A>(planes[at.planes[at.side]++]);
        }
    }
}

template <bool InPlace, class... A> PyxStatus invoke(Function function, const Invocation& call)
{
    Cursor at;
    at.inPlace = InPlace;
    const auto typed = reinterpret_cast<PyxStatus(PYXCC_CALL*)(A...)>(function);
    // A braced list is evaluated from left to right, as the cursor needs it.
    const std::tuple<A...> arguments{take<A>(at, call)...};
    return std::apply(typed, arguments);
}

} // namespace catalog::detail
