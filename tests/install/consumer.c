/* A program built against an installed pvx, once through pkg-config and once
 * through find_package(pvx): checks the version record, an allocation's step
 * and one conversion, and exits non-zero on any difference. */
#include <pvxi.h>

#include <stdio.h>
#include <string.h>

int main(void)
{
    const PvxVersionRecord* v = pvxiGetLibVersion();
    int step = -1;
    Pvx8u* img;
    Pvx32f src[3] = {0.5f, 2.5f, 254.6f};
    Pvx8u dst[3] = {0, 0, 0};
    PvxiSize roi = {3, 1};
    PvxStatus st;

    if (!v || v->majorVersion != 8 || v->minorVersion != 2 || v->updateVersion != 1 || v->buildNumber != 44077 ||
        strcmp(v->cpuTag, "p8") != 0 || strncmp(v->name, "pvxIP SSE4.1/4.2 (p8)", 21) != 0 ||
        strcmp(v->versionText, "8.2.1 (r44077)") != 0) {
        fprintf(stderr, "consumer: unexpected version record\n");
        return 1;
    }

    /* 100 pixels of 3 bytes: 300 bytes, rounded up to 64 */
    img = pvxiMalloc_8u_C3(100, 3, &step);
    if (!img || step != 320 || ((size_t)img & 63) != 0) {
        fprintf(stderr, "consumer: pvxiMalloc_8u_C3 gave %p, step %d\n", (void*)img, step);
        pvxiFree(img);
        return 1;
    }
    memset(img, 0, (size_t)step * 3);
    pvxiFree(img);

    st = pvxiConvert_32f8u_C1R(src, (int)sizeof src, dst, (int)sizeof dst, roi, pvxRndNearestEven);
    if (st != pvxStsNoErr || dst[0] != 0 || dst[1] != 2 || dst[2] != 255) {
        fprintf(stderr, "consumer: pvxiConvert_32f8u_C1R: %s\n", pvxGetStatusString(st));
        return 1;
    }
    printf("consumer: %s %s ok\n", v->name, v->versionText);
    return 0;
}
