// Manifest-driven checks over every exported function: whatever its family,
// a call whose pointer arguments are all null returns pvxStsNullPtrErr,
// since every family checks its pointers first.
#include <algorithm>
#include <cstring>
#include <string>
#include <vector>

#include "harness.h"

namespace {

struct Entry {
    const char* name;
    void (*fn)();
    const char* ret;
    int pointers;
};

const std::vector<Entry>& Manifest()
{
    static const std::vector<Entry> entries = {
#define PVX_MANIFEST(name, table, group, type, layout, sig, ret, pointers) \
    {#name, reinterpret_cast<void (*)()>(&name), #ret, pointers},
#include "gen/manifest.inc"
#undef PVX_MANIFEST
    };
    return entries;
}

// Calls a function with every integer and pointer argument zero: null
// pointers, zero sizes and steps, zero codes. Floating-point arguments
// travel in other registers and are ignored by the null check that comes
// first. Twelve arguments cover every signature in the library.
using ZeroCall = PvxStatus (*)(long, long, long, long, long, long, long, long, long, long, long, long);

TEST(Manifest, EveryFunctionRejectsNullPointersFirst)
{
    int checked = 0;
    for (const Entry& e : Manifest()) {
        if (std::strcmp(e.ret, "PvxStatus") != 0 || e.pointers == 0) continue;
        PvxStatus st = reinterpret_cast<ZeroCall>(e.fn)(0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0);
        EXPECT_EQ(st, pvxStsNullPtrErr) << e.name;
        ++checked;
    }
    EXPECT_GT(checked, 0);
}

TEST(Manifest, NamesAreUniqueAndFollowTheGrammar)
{
    std::vector<std::string> names;
    for (const Entry& e : Manifest()) {
        std::string n = e.name;
        EXPECT_EQ(n.rfind("pvxi", 0), 0u) << n;
        names.push_back(n);
    }
    std::sort(names.begin(), names.end());
    EXPECT_EQ(std::adjacent_find(names.begin(), names.end()), names.end());
}

}  // namespace
