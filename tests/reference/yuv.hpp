// The 8-bit YUV forms: full-swing YUV of a colour, and back. Which pixel takes which form is each conversion's own.
#pragma once

#include "reference/pixels.hpp"

namespace reference
{

/// From R, G, B to Y, U, V.
Triple<u8> yuvFwdExactA(Triple<u8> rgb);
Triple<u8> yuvFwdExactB(Triple<u8> rgb);
Triple<u8> yuvFwdExactC(Triple<u8> rgb);
Triple<u8> yuvFwdHigh(Triple<u8> rgb);
Triple<u8> yuvFwdPlanar(Triple<u8> rgb);

/// From Y, U, V to R, G, B.
Triple<u8> yuvInvExactA(Triple<u8> yuv);
Triple<u8> yuvInvExactB(Triple<u8> yuv);
Triple<u8> yuvInvExactC(Triple<u8> yuv);
Triple<u8> yuvInvExactD(Triple<u8> yuv);
Triple<u8> yuvInvHigh3(Triple<u8> yuv);
Triple<u8> yuvInvHigh4(Triple<u8> yuv);
Triple<u8> yuvInvHigh4x(Triple<u8> yuv);
Triple<u8> yuvInvHigh7(Triple<u8> yuv);
Triple<u8> yuvInvHigh8(Triple<u8> yuv);
Triple<u8> yuv422OddInv13(Triple<u8> yuv);

} // namespace reference
