// Small groups of like things: the channels of a pixel, the halves of a register.
#pragma once

namespace pyxcc
{

template <class T> struct Two {
    T a, b;
};

template <class T> struct Three {
    T a, b, c;
};

template <class T> struct Four {
    T a, b, c, d;
};

template <class T> Two(T, T) -> Two<T>;
template <class T> Three(T, T, T) -> Three<T>;
template <class T> Four(T, T, T, T) -> Four<T>;

/// In place of a channel, where there is none.
inline constexpr int none = -1;

} // namespace pyxcc
