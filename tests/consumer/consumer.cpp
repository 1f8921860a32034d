// A program of someone else in C++: packed 4:2:2 taken apart into planes.
#include <pyxcc/pyxcc.h>

#include <iostream>
#include <vector>

int main()
{
    const std::vector<u8> packed = {1, 2, 3, 4, 5, 6, 7, 8}; // Y Cb Y Cr Y Cb Y Cr
    std::vector<u8> y(4), cb(2), cr(2);
    u8* const planes[] = {y.data(), cb.data(), cr.data()};
    const int steps[] = {4, 2, 2};

    if (pyxiYCbCr422_8u_C2P3R(packed.data(), 8, planes, steps, RoiSize{4, 1}) != pyxOk) return 1;
    if (y != std::vector<u8>{1, 3, 5, 7} || cb != std::vector<u8>{2, 6} || cr != std::vector<u8>{4, 8}) return 1;
    std::cout << "C++ with pyxcc " << pyxccGetLibVersion()->versionText << "\n";
    return 0;
}
