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
    // 16s and 16u, sf 1 to 8: the exact product in 32-bit lanes, to float,
    // times 2^-sf, rounded to the nearest even integer by the conversion back
    // (the caller sets that rounding mode). Products below 2^24 are exact in
    // float and so is their scaling; larger ones are at least 2^16 once
    // scaled, and the pack saturates them all the same (16u products, which
    // need all 32 bits, are first held to 2^24). 11 operations a register,
    // 3 of them shuffles: 1.15 times faster than the multiply-add form below
    // on 1080p 16s frames, and 16u squares 1.13 times faster than in 32-bit
    // lanes.
    //
    // 16s, sf 9 to 15: one multiply-add per pair gives a * b + 2^(sf-1) - tie
    // in 32 bits, where tie marks a product that lies halfway above an even
    // result (its low sf + 1 bits are 2^(sf-1)); those bits are the low 16-bit
    // product's. Then shift and pack: 13 operations a register instead of 21,
    // and the tie test is a compare where a shift would queue with the
    // interleaves and packs on the shuffle ports.
    static constexpr int kFloatDownMax = 8;
    template <class U> static constexpr bool kFloatDown = sizeof(U) == 2;
    template <class U> static constexpr int kDownMax = std::is_same_v<U, Pvx16s> ? 15 : kFloatDownMax;
    template <class U>
    static VI FloatDown(VI a, VI b, const SfsK& k)
    {
        constexpr bool kS = std::is_same_v<U, Pvx16s>;
        VI lo = MulLoI16(a, b), hi = kS ? MulHiI16(a, b) : MulHiU16(a, b);
        VI p0 = InterleaveLo16(lo, hi), p1 = InterleaveHi16(lo, hi);
        if constexpr (!kS) {
            p0 = MinU32(p0, SplatU32(1u << 24));
            p1 = MinU32(p1, SplatU32(1u << 24));
        }
        VI q0 = CvtF32(MulF(CvtI32F(p0), k.down)), q1 = CvtF32(MulF(CvtI32F(p1), k.down));
        return kS ? PackSsS32(q0, q1) : PackUsS32(q0, q1);
    }
    template <class U>
        requires(sizeof(U) == 2)
    static VI Down(VI a, VI b, const SfsK& k)
    {
        if (!std::is_same_v<U, Pvx16s> || k.sf <= kFloatDownMax) return FloatDown<U>(a, b, k);
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
