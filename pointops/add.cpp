// Add and AddC: sums of two images, or of an image and a constant, under the
// scale-factor rule (8u, 16u, 16s, 16sc, 32sc) or in single precision.
#include "arith.h"
#include "entry.h"

namespace pvx {
namespace {

using namespace simd;

// a + b. Unsigned 8u sums and their rounding stay within 16-bit lanes; at
// scale factor 0 the saturating add is the whole rule. At scale factor 1 the
// unsigned types take the rounding-up average and, where the sum was odd,
// clear its lowest bit: an odd average steps back to its even neighbour and
// an even one is left as it is. 4 operations a register instead of 16.
struct AddX : ExactBase {
    static constexpr bool kSum = true;
    static constexpr bool kFits16 = true;
    static VD D(VD a, VD b) { return AddD(a, b); }
    static Wide Exact(Wide a, Wide b) { return a + b; }
    static float F(float a, float b) { return a + b; }
    static VF V(VF a, VF b) { return AddF(a, b); }
    static VI L16(VI a, VI b) { return AddI16(a, b); }
    static VI L32(VI a, VI b) { return AddI32(a, b); }
    template <class U>
    static VI Sat(VI a, VI b)
    {
        if constexpr (std::is_same_v<U, Pvx8u>) return AddSatU8(a, b);
        else if constexpr (std::is_same_v<U, Pvx16u>) return AddSatU16(a, b);
        else return AddSatS16(a, b);
    }
    template <class U>
        requires(!std::is_same_v<U, Pvx16s>)
    static VI Half(VI a, VI b)
    {
        if constexpr (std::is_same_v<U, Pvx8u>) return AndNot(And(Xor(a, b), SplatU8(1)), AvgU8(a, b));
        else return AndNot(And(Xor(a, b), SplatU16(1)), AvgU16(a, b));
    }
};

struct AddFam {
    template <class T, Sf M> using Op = PartOp<AddX, T, M>;
    template <class T, Sf M> using OpC = PartOp<AddX, T, M>;
    // 8u: 510, so every scale factor above 9 gives 0.
    template <class T> static constexpr Wide MaxAbs() { return 2 * ElemMaxAbs<Element<T>>(); }
    static constexpr int kIdentity = 0;
};

}  // namespace
}  // namespace pvx

#include "add.exports.inc"
