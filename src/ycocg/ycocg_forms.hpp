// Luma Y, orange chroma Co and green chroma Cg: the plain transform, and the reversible one, which lifts and so loses
// nothing as long as no sum leaves its lane. Templates over integer lanes; sums wrap but where they are said to
// saturate.
#pragma once

#include "lanes/lanes.hpp"

namespace pyxcc::ycocg
{

/// R, G, B to Y, Co, Cg.
struct PlainForward {
    template <class Lane> PYXCC_INLINE Three<Lane> operator()(const Lane& R, const Lane& G, const Lane& B) const
    {
        const Lane sum = R + B, twiceG = G + G;
        return {(sum + twiceG + 2) >> 2, (R - B + 1) >> 1, (twiceG - sum + 2) >> 2};
    }
};

/// Y, Co, Cg to R, G, B.
struct PlainInverse {
    template <class Lane> PYXCC_INLINE Three<Lane> operator()(const Lane& Y, const Lane& Co, const Lane& Cg) const
    {
        const Lane between = Y - Cg;
        return {between + Co, Y + Cg, between - Co};
    }
};

/// The same with Co and Cg counted from 128, as bytes have them.
struct OffsetForward {
    template <class Lane> PYXCC_INLINE Three<Lane> operator()(const Lane& R, const Lane& G, const Lane& B) const
    {
        const Three<Lane> plain = PlainForward{}(R, G, B);
        return {plain.a, plain.b + 128, plain.c + 128};
    }
};

struct OffsetInverse {
    template <class Lane> PYXCC_INLINE Three<Lane> operator()(const Lane& Y, const Lane& Co, const Lane& Cg) const
    {
        return PlainInverse{}(Y, Co - 128, Cg - 128);
    }
};

struct Wrapping {
    template <class Lane> static PYXCC_INLINE Lane sum(const Lane& x, const Lane& y) { return x + y; }
    template <class Lane> static PYXCC_INLINE Lane difference(const Lane& x, const Lane& y) { return x - y; }
};

/// In 16 bits.
struct Saturating {
    template <class Lane> static PYXCC_INLINE Lane sum(const Lane& x, const Lane& y) { return addSatS16(x, y); }
    template <class Lane> static PYXCC_INLINE Lane difference(const Lane& x, const Lane& y) { return subSatS16(x, y); }
};

template <class Sums> struct ReversibleForward {
    template <class Lane> PYXCC_INLINE Three<Lane> operator()(const Lane& R, const Lane& G, const Lane& B) const
    {
        const Lane Co = Sums::difference(R, B);
        const Lane t = Sums::sum(B, Co >> 1);
        const Lane Cg = Sums::difference(G, t);
        return {Sums::sum(t, Cg >> 1), Co, Cg};
    }
};

template <class Sums> struct ReversibleInverse {
    template <class Lane> PYXCC_INLINE Three<Lane> operator()(const Lane& Y, const Lane& Co, const Lane& Cg) const
    {
        const Lane t = Sums::difference(Y, Cg >> 1);
        const Lane G = Sums::sum(Cg, t);
        const Lane B = Sums::difference(t, Co >> 1);
        return {Sums::sum(B, Co), G, B};
    }
};

} // namespace pyxcc::ycocg
