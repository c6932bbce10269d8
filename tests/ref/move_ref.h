// Scalar references of the pixel-movement families, on packed arrays of
// `ch` elements per pixel, written from the documented behaviour.
#pragma once

#include <cstddef>
#include <vector>

namespace pvxref {

// Transpose: destination pixel (x, y) of the h x w result is source pixel
// (y, x) of the w x h source.
template <class T>
std::vector<T> RefTranspose(const std::vector<T>& src, int w, int h, int ch)
{
    std::vector<T> out(src.size());
    for (int y = 0; y < w; ++y)
        for (int x = 0; x < h; ++x)
            for (int c = 0; c < ch; ++c)
                out[(std::size_t(y) * h + x) * ch + c] = src[(std::size_t(x) * w + y) * ch + c];
    return out;
}

// Mirror, flips 0..2: destination (x, y) takes source (x or w-1-x, y or
// h-1-y); with `alpha` (AC4) the fourth channel keeps the destination's value.
template <class T>
std::vector<T> RefMirror(const std::vector<T>& src, const std::vector<T>& dstBefore, int w, int h, int ch, bool alpha,
                         int flip)
{
    std::vector<T> out = dstBefore;
    for (int y = 0; y < h; ++y)
        for (int x = 0; x < w; ++x) {
            int sx = flip == 0 ? x : w - 1 - x, sy = flip == 1 ? y : h - 1 - y;
            for (int c = 0; c < (alpha ? 3 : ch); ++c)
                out[(std::size_t(y) * w + x) * ch + c] = src[(std::size_t(sy) * w + sx) * ch + c];
        }
    return out;
}

// Mirror, diagonals of a one-channel w x h source: the destination is h x w;
// flip 3 takes source (y, x), flip 4 source (w-1-y, h-1-x).
template <class T>
std::vector<T> RefDiagonal(const std::vector<T>& src, int w, int h, int flip)
{
    std::vector<T> out(src.size());
    for (int y = 0; y < w; ++y)
        for (int x = 0; x < h; ++x) {
            int sx = flip == 3 ? y : w - 1 - y, sy = flip == 3 ? x : h - 1 - x;
            out[std::size_t(y) * h + x] = src[std::size_t(sy) * w + sx];
        }
    return out;
}

}  // namespace pvxref
