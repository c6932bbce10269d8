// Image memory (pvxiMalloc_*, pvxiFree), the version record, and the one
// feature query made at load.
#include "entry.h"

namespace pvx {
namespace {

// Feature bits 0x10 and 0x20 are recorded once at load. Nothing reads the
// record and no function behaves differently because of it.
[[maybe_unused]] const bool kLoadFeatures = (pvxGetEnabledCpuFeatures() & 0x30) == 0x30;

constexpr PvxVersionRecord MakeVersion(const char* name)
{
    return PvxVersionRecord{8, 2, 1, 44077, {'p', '8', 0, 0}, name, "8.2.1 (r44077)", "Oct  9 2014"};
}

constexpr PvxVersionRecord kVersion = MakeVersion("pvxIP SSE4.1/4.2 (p8)");
constexpr PvxVersionRecord kVersionPlus = MakeVersion("pvxIP SSE4.1/4.2 (p8)+");

// One block of height * step bytes. The products are 32-bit without an
// overflow check, as callers of the classic allocator expect: a size large
// enough to overflow yields a short block or null from the allocator.
template <int kPixelBytes, class T>
T* MallocBody(int widthPixels, int heightPixels, int* pStepBytes)
{
    if (!pStepBytes) return nullptr;
    if (widthPixels < 1 || heightPixels < 1) {
        *pStepBytes = 0;
        return nullptr;
    }
    unsigned row = static_cast<unsigned>(widthPixels) * kPixelBytes;
    int step = static_cast<int>((row + 63u) & ~63u);
    *pStepBytes = step;
    unsigned bytes = static_cast<unsigned>(heightPixels) * static_cast<unsigned>(step);
    return static_cast<T*>(pvxMalloc(static_cast<int>(bytes)));
}

void FreeBody(void* ptr)
{
    pvxFree(ptr);
}

const PvxVersionRecord* GetLibVersionBody()
{
    return ownGetFeature(0x80) ? &kVersionPlus : &kVersion;
}

}  // namespace
}  // namespace pvx

using namespace pvx;

#include "image.exports.inc"
