// MulScale, MulCScale: products scaled by the type's maximum and truncated.
//
// The stored value is the integer part of a * b / M, with M the type's
// maximum (255 for 8u, 65535 for 16u), computed without a division as
// (p + (p >> B) + 1) >> B for the product p and the element width B; this
// equals floor(p / M) for every pair of elements of the type (checked over all
// products for both types). The truncation is deliberate: callers rely on
// 255 * 1 giving 1 and 128 * 1 giving 0.
//
// Checks: pointers (-8), then steps (-14), then sizes (-6): steps before
// sizes, unlike Mul, as callers rely on.
#include <cstdint>
#include <type_traits>

#include "arith.h"
#include "check.h"
#include "entry.h"
#include "layout.h"
#include "simd.h"

namespace pvx {
namespace {

using namespace simd;

template <class U>
struct MulScaleOp {
    using Unit = U;
    static constexpr bool kHasVector = true;
    static constexpr int kBits = 8 * sizeof(U);
    bool Vector() const { return true; }

    // 8u: 16-bit products, and p + (p >> 8) + 1 <= 65280 stays in 16 bits.
    // 16u: 32-bit products from the low and high halves; the sum stays below 2^32.
    VI Vec(VI a, VI b) const
    {
        if constexpr (sizeof(U) == 1) {
            const VI one = SplatU16(1);
            VI lo = MulLoI16(WidenLoU8(a), WidenLoU8(b));
            VI hi = MulLoI16(WidenHiU8(a), WidenHiU8(b));
            lo = SrlI16n(AddI16(AddI16(lo, SrlI16n(lo, 8)), one), 8);
            hi = SrlI16n(AddI16(AddI16(hi, SrlI16n(hi, 8)), one), 8);
            return PackUsS16(lo, hi);
        } else {
            const VI one = SplatU32(1);
            VI pl = MulLoI16(a, b), ph = MulHiU16(a, b);
            VI p0 = InterleaveLo16(pl, ph), p1 = InterleaveHi16(pl, ph);
            p0 = SrlI32n(AddI32(AddI32(p0, SrlI32n(p0, 16)), one), 16);
            p1 = SrlI32n(AddI32(AddI32(p1, SrlI32n(p1, 16)), one), 16);
            return PackUsS32(p0, p1);
        }
    }
    U Scalar(U a, U b) const
    {
        std::uint32_t p = static_cast<std::uint32_t>(a) * b;
        return static_cast<U>((p + (p >> kBits) + 1) >> kBits);
    }
};

constexpr Order kMulScaleOrder = Order::kPtrStepSize;

template <class T, Lay L>
PvxStatus MulScaleBody(const T* pSrc1, int src1Step, const T* pSrc2, int src2Step, T* pDst, int dstStep,
                       PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<kMulScaleOrder>({pSrc1, pSrc2, pDst}, roi, {src1Step, src2Step, dstStep}))
        return s;
    RunRows<T, L, Src2::kImage>(MulScaleOp<T>{}, pSrc1, src1Step, pSrc2, src2Step, pDst, dstStep, roi);
    return pvxStsNoErr;
}
template <class T, Lay L>
PvxStatus MulScaleIBody(const T* pSrc, int srcStep, T* pSrcDst, int srcDstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<kMulScaleOrder>({pSrc, pSrcDst}, roi, {srcStep, srcDstStep})) return s;
    RunRows<T, L, Src2::kImage>(MulScaleOp<T>{}, pSrc, srcStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi);
    return pvxStsNoErr;
}
template <class T, Lay L>
PvxStatus MulCScaleBody(const T* pSrc, int srcStep, const T* value, T* pDst, int dstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<kMulScaleOrder>({pSrc, value, pDst}, roi, {srcStep, dstStep})) return s;
    RunRows<T, L, Src2::kConst>(MulScaleOp<T>{}, pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi, value);
    return pvxStsNoErr;
}
template <class T, Lay L>
PvxStatus MulCScaleBody(const T* pSrc, int srcStep, T value, T* pDst, int dstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<kMulScaleOrder>({pSrc, pDst}, roi, {srcStep, dstStep})) return s;
    RunRows<T, L, Src2::kConst>(MulScaleOp<T>{}, pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi, &value);
    return pvxStsNoErr;
}
template <class T, Lay L>
PvxStatus MulCScaleIBody(const T* value, T* pSrcDst, int srcDstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<kMulScaleOrder>({value, pSrcDst}, roi, {srcDstStep})) return s;
    RunRows<T, L, Src2::kConst>(MulScaleOp<T>{}, pSrcDst, srcDstStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi,
                                value);
    return pvxStsNoErr;
}
template <class T, Lay L>
PvxStatus MulCScaleIBody(T value, T* pSrcDst, int srcDstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<kMulScaleOrder>({pSrcDst}, roi, {srcDstStep})) return s;
    RunRows<T, L, Src2::kConst>(MulScaleOp<T>{}, pSrcDst, srcDstStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi,
                                &value);
    return pvxStsNoErr;
}

}  // namespace
}  // namespace pvx

#include "mulscale.exports.inc"
