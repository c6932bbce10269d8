// The entry table: every exported name is a stub that calls through its own
// entry of kEntries. The table is constant data holding the addresses of the
// bodies; the loader fills it (it is relocated read-only data) and nothing
// writes it afterwards, so calls need no lock.
#pragma once

#include "pvxi.h"
#include "entry_index.h"

namespace pvx {

using EntryFn = void (*)();

extern const EntryFn kEntries[kEntryCount];

// The body behind entry `index`, as the body's own function type.
template <class F>
inline F Entry(int index)
{
    return reinterpret_cast<F>(kEntries[index]);
}

}  // namespace pvx
