/* A program outside the tree, built against the installed library. */
#include <zoxcc.h>
#include <stdio.h>

int main(void)
{
    uint8_t rgb[3] = {255, 0, 0}, yuv[3];
    ImageSize one = {1, 1};
    if (zoxiRGBToYUV_8u_C3R(rgb, 3, yuv, 3, one) != zoxStatusOk)
        return 1;
    printf("%s: red is Y %d U %d V %d\n", zoxccGetLibVersion()->versionText, yuv[0], yuv[1], yuv[2]);
    return 0;
}
