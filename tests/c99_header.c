/* Compiles the public header as C99 with every warning an error; built as a
 * program it is also a small C user of the library that checks statuses. */
#include "pvxi.h"

#ifdef PVX_C_USER_MAIN
#include <stdio.h>
#include <string.h>

int main(void)
{
    const PvxVersionRecord* v = pvxiGetLibVersion();
    int step = 0;
    Pvx8u* img;
    Pvx32f src[4] = {0.5f, 1.5f, -3.0f, 300.0f};
    Pvx8u dst[4];
    PvxiSize roi = {4, 1};
    PvxStatus st;
    if (!v || v->majorVersion != 8 || v->buildNumber != 44077 || strncmp(v->name, "pvxIP SSE4.1/4.2 (p8)", 21) != 0) {
        fprintf(stderr, "bad version record\n");
        return 1;
    }
    img = pvxiMalloc_8u_C3(22, 2, &step);
    if (!img || step != 128) {
        fprintf(stderr, "pvxiMalloc_8u_C3 gave step %d\n", step);
        return 1;
    }
    pvxiFree(img);
    st = pvxiConvert_32f8u_C1R(src, (int)sizeof src, dst, (int)sizeof dst, roi, pvxRndNearestEven);
    if (st != pvxStsNoErr || dst[0] != 0 || dst[1] != 2 || dst[2] != 0 || dst[3] != 255) {
        fprintf(stderr, "convert: %s\n", pvxGetStatusString(st));
        return 1;
    }
    st = pvxiConvert_32f8u_C1R(NULL, 16, dst, 4, roi, 0);
    if (st != pvxStsNullPtrErr) return 1;
    printf("%s %s: C user ok\n", v->name, v->versionText);
    return 0;
}
#endif
