#include "pyxcc/version.h"

const LibVersion* PYXCC_CALL pyxccGetLibVersion()
{
    static constexpr LibVersion record = {
        8, 2, 1, 44077, {'q', '7', 0, 0}, "pyxCC AVX2 (q7)", "8.2.1 (r44077)", "Oct  9 2014",
    };
    return &record;
}
