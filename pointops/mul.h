// The exact product of two integer or float elements under the scale-factor
// rule, shared by Mul and by the integer squares of Sqr (a product of an
// image with itself).
#pragma once

#include <type_traits>

#include "arith.h"
#include "simd.h"

namespace pvx {
namespace mul {

using namespace simd;

// a * b. 8u products fit unsigned 16-bit lanes (with their rounding up to
// scale factor 8); above that, and for 16-bit types, the exact products come
// from 16-bit multiplies straight into 32-bit lanes: 16u products need all 32
// bits unsigned (kU32), 16s products fit signed 32 bits.
struct MulX : ExactBase {
    static constexpr bool kFits16U = true;
    template <class U> static constexpr bool kU32 = std::is_same_v<U, Pvx16u>;
    static VI L16(VI a, VI b) { return MulLoI16(a, b); }
    static Wide Exact(Wide a, Wide b) { return a * b; }
    static float F(float a, float b) { return a * b; }
    static VF V(VF a, VF b) { return MulF(a, b); }
    template <class U>
    static void Exact32(VI a, VI b, VI* r)
    {
        if constexpr (std::is_same_v<U, Pvx8u>) {
            VI lo = MulLoI16(WidenLoU8(a), WidenLoU8(b));
            VI hi = MulLoI16(WidenHiU8(a), WidenHiU8(b));
            r[0] = WidenLoU16(lo);
            r[1] = WidenHiU16(lo);
            r[2] = WidenLoU16(hi);
            r[3] = WidenHiU16(hi);
        } else {
            VI lo = MulLoI16(a, b);
            VI hi = std::is_same_v<U, Pvx16u> ? MulHiU16(a, b) : MulHiI16(a, b);
            r[0] = InterleaveLo16(lo, hi);
            r[1] = InterleaveHi16(lo, hi);
        }
    }
    // 16s, sf 1 to 8: the exact product in 32-bit lanes, to float, times
    // 2^-sf, rounded to the nearest even integer by the conversion back (the
    // caller sets that rounding mode). Products below 2^24 in magnitude are
    // exact in float and so is their scaling; larger ones are at least 2^16
    // once scaled, and the pack saturates them all the same. 11 operations a
    // register, 3 of them shuffles: 1.15 times faster than the multiply-add
    // form below on 1080p frames.
    template <class U> static constexpr bool kFloatDown = std::is_same_v<U, Pvx16s>;
    static constexpr int kFloatDownMax = 8;
    // 16s, sf 9 to 15: one multiply-add per pair gives a * b + 2^(sf-1) - tie
    // in 32 bits, where tie marks a product that lies halfway above an even
    // result (its low sf + 1 bits are 2^(sf-1)); those bits are the low 16-bit
    // product's. Then shift and pack: 13 operations a register instead of 21,
    // and the tie test is a compare where a shift would queue with the
    // interleaves and packs on the shuffle ports.
    template <class U>
        requires std::is_same_v<U, Pvx16s>
    static VI Down(VI a, VI b, const SfsK& k)
    {
        if (k.sf <= kFloatDownMax) {
            VI lo = MulLoI16(a, b), hi = MulHiI16(a, b);
            VF p0 = MulF(CvtI32F(InterleaveLo16(lo, hi)), k.down);
            VF p1 = MulF(CvtI32F(InterleaveHi16(lo, hi)), k.down);
            return PackSsS32(CvtF32(p0), CvtF32(p1));
        }
        VI tie = EqI16(And(MulLoI16(a, b), k.tie16), k.tieAt16);
        VI add = AddI16(tie, k.tieAt16);
        VI ones = k.one16;
        VI lo = MulAddPairsI16(InterleaveLo16(a, ones), InterleaveLo16(b, add));
        VI hi = MulAddPairsI16(InterleaveHi16(a, ones), InterleaveHi16(b, add));
        return PackSsS32(SraI32(lo, k.cnt), SraI32(hi, k.cnt));
    }
};

// The family of real products: the op, the bound of |a * b| that decides the
// all-zero scale factors, and the constant that makes MulC a copy.
struct RealMulFam {
    template <class T, Sf M> using Op = PartOp<MulX, T, M>;
    template <class T, Sf M> using OpC = Op<T, M>;
    template <class T>
    static constexpr Wide MaxAbs()
    {
        Wide m = ElemMaxAbs<Element<T>>();
        return m * m;
    }
    static constexpr int kIdentity = 1;
};

}  // namespace mul
}  // namespace pvx
