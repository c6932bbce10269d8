// generated from the family tables (*.api) by tools/pvxgen; do not edit
#pragma once

namespace pvx {

enum EntryIndex : int {
    kEntry_pvxiMalloc_8u_C1,
    kEntry_pvxiMalloc_8u_C2,
    kEntry_pvxiMalloc_8u_C3,
    kEntry_pvxiMalloc_8u_C4,
    kEntry_pvxiMalloc_8u_AC4,
    kEntry_pvxiMalloc_16u_C1,
    kEntry_pvxiMalloc_16u_C2,
    kEntry_pvxiMalloc_16u_C3,
    kEntry_pvxiMalloc_16u_C4,
    kEntry_pvxiMalloc_16u_AC4,
    kEntry_pvxiMalloc_16s_C1,
    kEntry_pvxiMalloc_16s_C2,
    kEntry_pvxiMalloc_16s_C3,
    kEntry_pvxiMalloc_16s_C4,
    kEntry_pvxiMalloc_16s_AC4,
    kEntry_pvxiMalloc_32s_C1,
    kEntry_pvxiMalloc_32s_C2,
    kEntry_pvxiMalloc_32s_C3,
    kEntry_pvxiMalloc_32s_C4,
    kEntry_pvxiMalloc_32s_AC4,
    kEntry_pvxiMalloc_32f_C1,
    kEntry_pvxiMalloc_32f_C2,
    kEntry_pvxiMalloc_32f_C3,
    kEntry_pvxiMalloc_32f_C4,
    kEntry_pvxiMalloc_32f_AC4,
    kEntry_pvxiMalloc_32sc_C1,
    kEntry_pvxiMalloc_32sc_C2,
    kEntry_pvxiMalloc_32sc_C3,
    kEntry_pvxiMalloc_32sc_C4,
    kEntry_pvxiMalloc_32sc_AC4,
    kEntry_pvxiMalloc_32fc_C1,
    kEntry_pvxiMalloc_32fc_C2,
    kEntry_pvxiMalloc_32fc_C3,
    kEntry_pvxiMalloc_32fc_C4,
    kEntry_pvxiMalloc_32fc_AC4,
    kEntry_pvxiFree,
    kEntry_pvxiGetLibVersion,
    kEntry_pvxiConvert_32f8u_C1R,
    kEntryCount
};

}  // namespace pvx
