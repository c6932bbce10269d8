// Forwardings of other families to Set and Copy: an arithmetic call whose
// every result is 0 is carried out as Set with 0, and one whose operation is
// the identity as Copy, through the exported members (the only calls from one
// family into another's exports).
#pragma once

#include "layout.h"
#include "pvxi.h"

namespace pvx {

template <class T> struct MoveMembers { static constexpr bool kHas = false; };

#define PVX_MOVE_MEMBERS(T, t)                                                              \
    template <> struct MoveMembers<T> {                                                     \
        static constexpr bool kHas = true;                                                  \
        static constexpr auto kSetC1 = &pvxiSet_##t##_C1R;                                 \
        static constexpr auto kSetC3 = &pvxiSet_##t##_C3R;                                 \
        static constexpr auto kSetC4 = &pvxiSet_##t##_C4R;                                 \
        static constexpr auto kSetAC4 = &pvxiSet_##t##_AC4R;                               \
        static constexpr auto kCopyC1 = &pvxiCopy_##t##_C1R;                               \
        static constexpr auto kCopyC3 = &pvxiCopy_##t##_C3R;                               \
        static constexpr auto kCopyC4 = &pvxiCopy_##t##_C4R;                               \
        static constexpr auto kCopyAC4 = &pvxiCopy_##t##_AC4R;                             \
    };
PVX_MOVE_MEMBERS(Pvx8u, 8u)
PVX_MOVE_MEMBERS(Pvx16u, 16u)
PVX_MOVE_MEMBERS(Pvx16s, 16s)
PVX_MOVE_MEMBERS(Pvx32s, 32s)
PVX_MOVE_MEMBERS(Pvx32f, 32f)
#undef PVX_MOVE_MEMBERS

template <class T, Lay L>
inline constexpr bool kHasMoveMembers =
    MoveMembers<T>::kHas && (L == Lay::C1 || L == Lay::C3 || L == Lay::C4 || L == Lay::AC4);

// Set with 0 on the processed channels (AC4 alpha kept); returns what Set returns.
template <class T, Lay L>
PvxStatus SetZeroForward(T* pDst, int dstStep, PvxiSize roi)
{
    using M = MoveMembers<T>;
    const T zero[4] = {};
    if constexpr (L == Lay::C1) return M::kSetC1(T{}, pDst, dstStep, roi);
    else if constexpr (L == Lay::C3) return M::kSetC3(zero, pDst, dstStep, roi);
    else if constexpr (L == Lay::C4) return M::kSetC4(zero, pDst, dstStep, roi);
    else return M::kSetAC4(zero, pDst, dstStep, roi);
}

// Copy of the processed channels (AC4 alpha kept); returns what Copy returns.
template <class T, Lay L>
PvxStatus CopyForward(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    using M = MoveMembers<T>;
    if constexpr (L == Lay::C1) return M::kCopyC1(pSrc, srcStep, pDst, dstStep, roi);
    else if constexpr (L == Lay::C3) return M::kCopyC3(pSrc, srcStep, pDst, dstStep, roi);
    else if constexpr (L == Lay::C4) return M::kCopyC4(pSrc, srcStep, pDst, dstStep, roi);
    else return M::kCopyAC4(pSrc, srcStep, pDst, dstStep, roi);
}

}  // namespace pvx
