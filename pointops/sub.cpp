// Sub and SubC: differences of two images (second minus first) or of an
// image and a constant (image minus constant), under the scale-factor rule or
// in single precision.
#include "arith.h"
#include "entry.h"

namespace pvx {
namespace {

using namespace simd;

// b - a: the second image minus the first, an order callers rely on (in
// place: the in-place image minus the source). 8u differences and their
// rounding stay within 16-bit lanes; at scale factor 0 the saturating
// subtraction is the whole rule.
struct SubX : ExactBase {
    static constexpr bool kSum = true;
    static constexpr bool kFits16 = true;
    static VD D(VD a, VD b) { return SubD(b, a); }
    static Wide Exact(Wide a, Wide b) { return b - a; }
    static float F(float a, float b) { return b - a; }
    static VF V(VF a, VF b) { return SubF(b, a); }
    static VI L16(VI a, VI b) { return SubI16(b, a); }
    static VI L32(VI a, VI b) { return SubI32(b, a); }
    template <class U>
    static VI Sat(VI a, VI b)
    {
        if constexpr (std::is_same_v<U, Pvx8u>) return SubSatU8(b, a);
        else if constexpr (std::is_same_v<U, Pvx16u>) return SubSatU16(b, a);
        else return SubSatS16(b, a);
    }
};

// a - value.
struct SubCX : ExactBase {
    static constexpr bool kSum = true;
    static constexpr bool kFits16 = true;
    static VD D(VD a, VD b) { return SubD(a, b); }
    static Wide Exact(Wide a, Wide b) { return a - b; }
    static float F(float a, float b) { return a - b; }
    static VF V(VF a, VF b) { return SubF(a, b); }
    static VI L16(VI a, VI b) { return SubI16(a, b); }
    static VI L32(VI a, VI b) { return SubI32(a, b); }
    template <class U>
    static VI Sat(VI a, VI b)
    {
        return SubX::Sat<U>(b, a);
    }
};

struct SubFam {
    template <class T, Sf M> using Op = PartOp<SubX, T, M>;
    template <class T, Sf M> using OpC = PartOp<SubCX, T, M>;
    // 8u: |r| <= 255, so every scale factor above 8 gives 0.
    template <class T>
    static constexpr Wide MaxAbs()
    {
        using L = std::numeric_limits<Element<T>>;
        return static_cast<Wide>(L::max()) - static_cast<Wide>(L::min());
    }
    static constexpr int kIdentity = 0;
};

}  // namespace
}  // namespace pvx

#include "sub.exports.inc"
