/* The public header compiles as C; a call through the shared object works from C. */
#include "zoxcc.h"

#include <stdio.h>
#include <string.h>

int main(void)
{
    const LibraryVersion* v = zoxccGetLibVersion();
    if (!v || v->major != 8 || strncmp(v->name, "zoxCC", 5) != 0) {
        fprintf(stderr, "version record\n");
        return 1;
    }
    uint8_t rgb[3 * 4] = {255, 255, 255, 0, 0, 0, 255, 0, 0, 0, 255, 0};
    uint8_t yuv[3 * 4];
    ImageSize roi = {4, 1};
    if (zoxiRGBToYUV_8u_C3R(rgb, 12, yuv, 12, roi) != zoxStatusOk || yuv[0] != 255 || yuv[3] != 0) {
        fprintf(stderr, "RGBToYUV\n");
        return 1;
    }
    if (zoxiRGBToYUV_8u_C3R(NULL, 12, yuv, 12, roi) != zoxStatusNullPointer)
        return 1;
    printf("1 passed, 0 failed\n");
    return 0;
}
