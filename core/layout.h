// Channel layouts and pixel types as the kernels see them.
#pragma once

#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <type_traits>

#include "pvxtypes.h"

namespace pvx {

enum class Lay {
    C1, C2, C3, C4, AC4,
    C3C1, C4C1, C1C3, C1C4, C3CR, C4CR, C3AC4, AC4C3, C3C4, C4C3,
    C3P3, C4P4, P3C3, P4C4,
};

// Channels in memory per pixel, and channels processed (AC4: three; the
// fourth channel of an AC4 destination is never written).
template <Lay L> struct LayoutTraits;
template <> struct LayoutTraits<Lay::C1>  { static constexpr int kChannels = 1, kProcessed = 1; };
template <> struct LayoutTraits<Lay::C2>  { static constexpr int kChannels = 2, kProcessed = 2; };
template <> struct LayoutTraits<Lay::C3>  { static constexpr int kChannels = 3, kProcessed = 3; };
template <> struct LayoutTraits<Lay::C4>  { static constexpr int kChannels = 4, kProcessed = 4; };
template <> struct LayoutTraits<Lay::AC4> { static constexpr int kChannels = 4, kProcessed = 3; };

template <Lay L> inline constexpr int kChannels = LayoutTraits<L>::kChannels;
template <Lay L> inline constexpr int kProcessed = LayoutTraits<L>::kProcessed;
template <Lay L> inline constexpr bool kKeepsAlpha = L == Lay::AC4;

// Element type of a pixel type (the part type of a complex type).
template <class T> struct ElementOf { using type = T; };
template <> struct ElementOf<Pvx16sc> { using type = Pvx16s; };
template <> struct ElementOf<Pvx32sc> { using type = Pvx32s; };
template <> struct ElementOf<Pvx32fc> { using type = Pvx32f; };
template <> struct ElementOf<Pvx64fc> { using type = Pvx64f; };
template <class T> using Element = typename ElementOf<T>::type;

template <class T> inline constexpr bool kIsComplex = !std::is_same_v<T, Element<T>>;

// Row addressing: steps are signed bytes.
template <class T>
inline T* RowAt(T* base, int step, int y)
{
    using B = std::conditional_t<std::is_const_v<T>, const std::uint8_t, std::uint8_t>;
    return reinterpret_cast<T*>(reinterpret_cast<B*>(base) + static_cast<std::ptrdiff_t>(step) * y);
}

// True when every step equals the row length, so the region is one row of
// width * height pixels (results are identical to row-by-row processing).
inline bool RowsContiguous(std::ptrdiff_t rowBytes, std::initializer_list<int> steps)
{
    for (int s : steps)
        if (s != rowBytes) return false;
    return true;
}

}  // namespace pvx
