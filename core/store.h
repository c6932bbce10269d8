// The cache-aware store choice of the large-region writers: non-temporal
// stores where the written pixels would be pushed out of the cache before
// anyone reads them, which saves the read of every written line and spares
// the caller's working set. The pixels written are the same either way.
#pragma once

#include <cstddef>
#include <cstdint>

#include "pvxcore.h"

namespace pvx {

// Thresholds in bytes: fills written, and calls read and written.
inline constexpr std::int64_t kNtThresholdSet = 1048576;
inline constexpr std::int64_t kNtThresholdLarge = 786433;

// The choice of fills, which read nothing: streamed above the threshold
// once they write at least the largest cache.
inline bool UseNonTemporal(std::int64_t bytesWritten, std::int64_t threshold)
{
    if (bytesWritten <= threshold) return false;
    int cache = 0;
    if (pvxGetMaxCacheSizeB(&cache) != pvxStsNoErr) return false;
    return bytesWritten >= cache;
}

// The choice of calls that read as much as they write (arithmetic, planes
// and pixels, channel swaps, mirrors, transposes): streamed once the bytes
// read and written reach half the largest cache and exceed the large-region
// threshold.
inline bool StreamWorkingSet(std::int64_t bytesTouched)
{
    if (bytesTouched <= kNtThresholdLarge) return false;
    int cache = 0;
    if (pvxGetMaxCacheSizeB(&cache) != pvxStsNoErr) return false;
    return bytesTouched >= cache / 2;
}

// The choice of fetching the sources of row loops ahead in software, by
// kFetchAhead bytes: worth its load slots once the bytes read and written
// are beyond the core's own caches (above 1 MB) but within half the largest
// cache. There the hardware prefetchers alone kept too few lines in flight
// (Add_8u at 1080p, 6 MB a call: 1.15 to 1.2 times faster, sf 0 and 1; C3
// at 720p 1.2). Within the core's caches the fetches only cost load slots
// (640 x 480: 1.05 times slower), and beyond half the shared cache, where the
// sources come from memory, they got in the way of the hardware's (4K in
// place: 1.2 times slower); streamed calls gain nothing either way.
inline constexpr std::int64_t kFetchSourcesMin = 1048576;
inline constexpr std::ptrdiff_t kFetchAhead = 512;

inline bool FetchSources(std::int64_t bytesTouched)
{
    if (bytesTouched <= kFetchSourcesMin) return false;
    int cache = 0;
    if (pvxGetMaxCacheSizeB(&cache) != pvxStsNoErr) return false;
    return bytesTouched < cache / 2;
}

// The choice of fetching in software the streams that the hardware
// prefetchers do not follow (rows taken in falling order): worth its load
// slots once the working set is unlikely to be in the cache, taken as a
// quarter of the largest cache read and written (other cores share it).
inline bool FetchAhead(std::int64_t bytesTouched)
{
    if (bytesTouched <= kNtThresholdLarge) return false;
    int cache = 0;
    if (pvxGetMaxCacheSizeB(&cache) != pvxStsNoErr) return false;
    return bytesTouched >= cache / 4;
}

}  // namespace pvx
