// Scalar reference of the arithmetic families, in wide integers (__int128) and
// single precision, written from the documented rules: the exact result, then
// the scale factor (round half to even) and saturation.
#pragma once

#include <cstdint>
#include <limits>
#include <type_traits>

#include "harness.h"

namespace pvxref {

__extension__ typedef __int128 Wide;

template <class E>
E Saturated(Wide r)
{
    using L = std::numeric_limits<E>;
    if (r < static_cast<Wide>(L::min())) return L::min();
    if (r > static_cast<Wide>(L::max())) return L::max();
    return static_cast<E>(r);
}

// r * 2^-sf: sf > 0 rounds half to even by
// (r + ((r >> sf) & 1) + 2^(sf-1) - 1) >> sf; sf < 0 enlarges; then saturates.
template <class E>
E Sfs(Wide r, int sf)
{
    if (sf == 0) return Saturated<E>(r);
    if (sf > 0) {
        if (sf >= 120) return 0;  // |r| < 2^100 here: every result rounds to 0
        Wide half = (static_cast<Wide>(1) << (sf - 1)) - 1;
        return Saturated<E>((r + ((r >> sf) & 1) + half) >> sf);
    }
    if (r == 0) return 0;
    long long up = -static_cast<long long>(sf);
    if (up >= 40) return r > 0 ? std::numeric_limits<E>::max() : std::numeric_limits<E>::min();
    return Saturated<E>(r * (static_cast<Wide>(1) << up));
}

// Binary operations: x op y (Sub is x - y; the callers put the operands in the
// family's order).
enum class Bin { kAdd, kSub, kMul };

inline Wide Exact(Bin op, Wide x, Wide y)
{
    switch (op) {
    case Bin::kAdd: return x + y;
    case Bin::kSub: return x - y;
    default: return x * y;
    }
}

inline float ExactF(Bin op, float x, float y)
{
    switch (op) {
    case Bin::kAdd: return x + y;
    case Bin::kSub: return x - y;
    default: return x * y;
    }
}

template <class T>
T RefBin(Bin op, T x, T y, int sf)
{
    if constexpr (std::is_same_v<T, Pvx32f>) {
        return ExactF(op, x, y);
    } else if constexpr (std::is_integral_v<T>) {
        return Sfs<T>(Exact(op, x, y), sf);
    } else if constexpr (std::is_same_v<T, Pvx32fc>) {
        if (op == Bin::kMul) {
            // re = a*c - b*d, im = a*d + b*c, each product rounded to single
            float ac = x.re * y.re, bd = x.im * y.im, ad = x.re * y.im, bc = x.im * y.re;
            return {ac - bd, ad + bc};
        }
        return {ExactF(op, x.re, y.re), ExactF(op, x.im, y.im)};
    } else {
        using E = decltype(x.re);
        if (op == Bin::kMul) {
            Wide a = x.re, b = x.im, c = y.re, d = y.im;
            return {Sfs<E>(a * c - b * d, sf), Sfs<E>(a * d + b * c, sf)};
        }
        return {Sfs<E>(Exact(op, x.re, y.re), sf), Sfs<E>(Exact(op, x.im, y.im), sf)};
    }
}

}  // namespace pvxref
