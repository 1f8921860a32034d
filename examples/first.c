#include <pyxcc/pyxcc.h>

#include <stdio.h>

int main(void)
{
    const u8 rgb[] = {255, 0, 0, 255, 255, 255}; /* one row: a red pixel and a white one */
    u8 ycbcr[sizeof rgb];
    const RoiSize size = {2, 1};

    if (pyxiRGBToYCbCr_8u_C3R(rgb, sizeof rgb, ycbcr, sizeof ycbcr, size) != pyxOk) return 1;
    for (int i = 0; i < 6; i += 3) printf("%d %d %d\n", ycbcr[i], ycbcr[i + 1], ycbcr[i + 2]);
    return 0; /* prints 82 90 240 and 235 128 128 */
}
