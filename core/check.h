// Argument checks. Each step of the library-wide order is a helper that
// returns a status; a body calls them in its family's order and returns the
// first failure before it reads or writes any pixel.
#pragma once

#include <initializer_list>

#include "pvxtypes.h"

namespace pvx {

// -8 when any pointer is null, in argument order.
inline PvxStatus CheckPtrs(std::initializer_list<const void*> ptrs)
{
    for (const void* p : ptrs)
        if (!p) return pvxStsNullPtrErr;
    return pvxStsNoErr;
}

// -6 when the width or height is below 1.
inline PvxStatus CheckRoi(PvxiSize roi)
{
    return roi.width < 1 || roi.height < 1 ? pvxStsSizeErr : pvxStsNoErr;
}

// -14 when any step is below 1.
inline PvxStatus CheckSteps(std::initializer_list<int> steps)
{
    for (int s : steps)
        if (s < 1) return pvxStsStepErr;
    return pvxStsNoErr;
}

// -14 when any step is 0 (negative steps pass).
inline PvxStatus CheckStepsNonZero(std::initializer_list<int> steps)
{
    for (int s : steps)
        if (s == 0) return pvxStsStepErr;
    return pvxStsNoErr;
}

// The check orders that families follow. A family names its order in its
// table row (as a template argument of its body), never by reordering calls.
enum class Order {
    kPtrSize,      // pointers, sizes; steps are used as given
    kPtrSizeStep,  // the common order
    kPtrStepSize,  // steps before sizes
};

template <Order O>
inline PvxStatus CheckFrame(std::initializer_list<const void*> ptrs, PvxiSize roi,
                            std::initializer_list<int> steps)
{
    if (PvxStatus s = CheckPtrs(ptrs)) return s;
    if constexpr (O == Order::kPtrStepSize) {
        if (PvxStatus s = CheckSteps(steps)) return s;
        return CheckRoi(roi);
    } else {
        if (PvxStatus s = CheckRoi(roi)) return s;
        if constexpr (O == Order::kPtrSizeStep)
            if (PvxStatus s = CheckSteps(steps)) return s;
        return pvxStsNoErr;
    }
}

}  // namespace pvx
