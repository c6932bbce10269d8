// Rounding helpers of the arithmetic families whose exact results are not
// integers (division, square root, exponential, logarithm): an exact scalar
// quotient rounding in wide integers, and the vector step that turns float or
// double lanes holding a correctly rounded result into saturated integers.
//
// The vector step is exact only where the kernel has shown that its float
// result lies on the same side of every rounding boundary as the exact value;
// each kernel states why that holds for its inputs.
#pragma once

#include <bit>
#include <cstdint>
#include <limits>
#include <type_traits>

#include "sfs.h"
#include "simd.h"

namespace pvx {

// Rounding rules: the values of the rounding-mode argument.
enum class Rnd { kZero = 0, kEven = 1, kAway = 2 };

__extension__ typedef unsigned __int128 UWide;

// Magnitudes at or above this saturate every destination of 32 bits or less.
inline constexpr Wide kSatWide = static_cast<Wide>(1) << 40;

// num * 2^-sf / den rounded by r, exactly, for |num| < 2^64 and 0 < den < 2^64.
// The result is clamped to +-2^40 (saturation is left to the caller).
inline Wide RoundQuot(Wide num, Wide den, int sf, Rnd r)
{
    if (num == 0) return 0;
    const bool neg = num < 0;
    const UWide m = static_cast<UWide>(neg ? -num : num);
    const UWide d = static_cast<UWide>(den);
    const UWide sat = static_cast<UWide>(kSatWide);
    UWide q;
    bool above, tie;  // the dropped fraction is above one half, or exactly one half
    if (sf <= 0) {
        q = m / d;
        UWide rem = m % d;
        // Shift the scale into the quotient 32 bits at a time; once the
        // quotient reaches the saturation bound, more bits change nothing.
        for (std::int64_t s = -static_cast<std::int64_t>(sf); s > 0 && q < sat;) {  // INT_MIN too
            int k = s < 32 ? static_cast<int>(s) : 32;
            rem <<= k;
            q = (q << k) + rem / d;
            rem %= d;
            s -= k;
        }
        if (q >= sat) return neg ? -kSatWide : kSatWide;
        above = 2 * rem > d;
        tie = 2 * rem == d;
    } else if (sf > 100) {
        q = 0;  // |value| < 2^-36
        above = tie = false;
    } else {
        const UWide qq = m / d, rem = m % d;
        const UWide low = qq & ((static_cast<UWide>(1) << sf) - 1);
        const UWide half = static_cast<UWide>(1) << (sf - 1);
        q = qq >> sf;
        above = low > half || (low == half && rem != 0);
        tie = low == half && rem == 0;
    }
    bool up = r == Rnd::kZero ? false : r == Rnd::kAway ? (above || tie) : (above || (tie && (q & 1) != 0));
    q += up ? 1 : 0;
    if (q > sat) q = sat;
    return neg ? -static_cast<Wide>(q) : static_cast<Wide>(q);
}

// The quotient rule of the integer division members: num * 2^-sf / den rounded
// by r and saturated to U; a zero divisor gives U's maximum for a positive
// dividend, U's minimum (0 when unsigned) for a negative one, and 0 for 0.
template <class U>
inline U QuotSat(Wide num, Wide den, int sf, Rnd r)
{
    using L = std::numeric_limits<U>;
    if (den == 0) return num > 0 ? L::max() : num < 0 ? L::min() : U{};
    if (den < 0) {
        num = -num;
        den = -den;
    }
    return Saturate<U>(RoundQuot(num, den, sf, r));
}

// ---- vector rounding and saturation ------------------------------------------------

template <Rnd R>
inline simd::VF RoundF(simd::VF q)
{
    using namespace simd;
    if constexpr (R == Rnd::kZero) {
        return TruncF(q);
    } else if constexpr (R == Rnd::kEven) {
        return RoundEvenF(q);
    } else {
        // Truncate, then step away from zero when the dropped part is at least
        // one half (the difference is exact).
        const VF sign = SplatF(-0.0f);
        VF t = TruncF(q);
        VF frac = AndNotF(sign, SubF(q, t));
        VF step = AndF(GeF(frac, SplatF(0.5f)), OrF(SplatF(1.0f), AndF(q, sign)));
        return AddF(t, step);
    }
}

template <Rnd R>
inline simd::VD RoundD(simd::VD q)
{
    using namespace simd;
    if constexpr (R == Rnd::kZero) {
        return TruncD(q);
    } else if constexpr (R == Rnd::kEven) {
        return RoundEvenD(q);
    } else {
        const VD sign = SplatD(-0.0);
        VD t = TruncD(q);
        VD frac = AndNotD(sign, SubD(q, t));
        VD step = AndD(GeD(frac, SplatD(0.5)), OrD(SplatD(1.0), AndD(q, sign)));
        return AddD(t, step);
    }
}

// Rounded float lanes to saturated 32-bit integers of U's range: NaN becomes
// 0, infinities saturate.
template <class U, Rnd R>
inline simd::VI SatI32(simd::VF q)
{
    using namespace simd;
    using L = std::numeric_limits<U>;
    q = RoundF<R>(q);
    q = AndF(q, OrderedF(q));
    q = MinF(MaxF(q, SplatF(static_cast<float>(L::min()))), SplatF(static_cast<float>(L::max())));
    return CvtF32(q);
}

template <class U, Rnd R>
inline simd::VI SatI32(simd::VD lo, simd::VD hi)
{
    using namespace simd;
    using L = std::numeric_limits<U>;
    auto one = [](VD q) {
        q = RoundD<R>(q);
        q = AndD(q, OrderedD(q));
        return MinD(MaxD(q, SplatD(static_cast<double>(L::min()))), SplatD(static_cast<double>(L::max())));
    };
    return CvtD32Pair(one(lo), one(hi));
}

// 2^e as a float or double (e within the normal range).
inline float Pow2F(int e)
{
    return std::bit_cast<float>(static_cast<std::uint32_t>(e + 127) << 23);
}
inline double Pow2D(int e)
{
    return std::bit_cast<double>(static_cast<std::uint64_t>(e + 1023) << 52);
}

}  // namespace pvx
