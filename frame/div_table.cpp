// The division table: entry (a, b) is a / b on the 0..255 scale, rounded to
// nearest with halves up and clamped to 255; row 0 is all 0, so 0 / 0 = 0.
#include "frame/noise.h"

uint8_t pDivTable[256 * 256] = {};

void halideqk::BuildDivisionTable() {
    for (int b = 0; b < 256; ++b) pDivTable[b] = 0;
    for (int a = 1; a < 256; ++a) {
        uint8_t *row = pDivTable + a * 256;
        for (int b = 0; b <= a; ++b) row[b] = 255;
        for (int b = a + 1; b < 256; ++b) row[b] = static_cast<uint8_t>((255 * a + b / 2) / b);
    }
}

extern "C" int HalideInitAsmLoops() {
    halideqk::BuildDivisionTable();
    return 1;
}
