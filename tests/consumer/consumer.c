/* A program of someone else in C: white and black in YCbCr, in memory of the library's own. */
#include <pyxcc/core.h>
#include <pyxcc/pyxcc.h>

#include <stdio.h>
#include <string.h>

int main(void)
{
    const u8 rgb[] = {255, 255, 255, 0, 0, 0};
    const u8 expected[] = {235, 128, 128, 16, 128, 128};
    const RoiSize size = {2, 1};
    u8* const ycbcr = pyxMalloc(sizeof expected);
    int right;

    if (!ycbcr) return 1;
    right = pyxiRGBToYCbCr_8u_C3R(rgb, sizeof rgb, ycbcr, sizeof expected, size) == pyxOk &&
            memcmp(ycbcr, expected, sizeof expected) == 0;
    pyxFree(ycbcr);
    if (right) printf("C with pyxcc %s\n", pyxccGetLibVersion()->versionText);
    return right ? 0 : 1;
}
