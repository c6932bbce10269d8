// Saturation and the scale-factor rule of the Sfs functions: the exact result
// r is multiplied by 2^-scaleFactor, rounded half to even, and saturated to the
// destination type. Scalar forms; kernels use them for tails and as the
// definition that their vector paths must match.
#pragma once

#include <cstdint>
#include <limits>
#include <type_traits>

#include "pvxtypes.h"

namespace pvx {

__extension__ typedef __int128 Wide;

template <class D, class W>
constexpr D Saturate(W v)
{
    using L = std::numeric_limits<D>;
    if constexpr (std::is_floating_point_v<D>) {
        return static_cast<D>(v);
    } else {
        if (v < static_cast<W>(L::min())) return L::min();
        if (v > static_cast<W>(L::max())) return L::max();
        return static_cast<D>(v);
    }
}

// r * 2^-sf, rounded half to even for sf > 0; exact (before saturation) for
// sf <= 0. Valid for |r| < 2^100.
constexpr Wide ScaleRound(Wide r, int sf)
{
    if (sf == 0) return r;
    if (sf > 0) {
        if (sf > 110) return 0;
        Wide half = (static_cast<Wide>(1) << (sf - 1)) - 1;
        return (r + ((r >> sf) & 1) + half) >> sf;
    }
    // Any non-zero r shifted up by 40 saturates every destination of 32 bits
    // or less, so the shift is capped there.
    int up = sf < -40 ? 40 : -sf;  // compared before negating: sf may be INT_MIN
    return r * (static_cast<Wide>(1) << up);
}

// The whole Sfs rule for a destination element type D.
template <class D>
constexpr D ScaleSat(Wide r, int sf)
{
    return Saturate<D>(ScaleRound(r, sf));
}

}  // namespace pvx
