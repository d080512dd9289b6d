#include "host/reference/dither_noise.h"

#include <vector>

namespace host_ref {

namespace {

// x <- 16807 x mod (2^31 - 1), with a 64-bit product.
uint32_t Step(uint32_t x) { return uint32_t(uint64_t(x) * 16807 % 2147483647); }

std::vector<uint16_t> Build() {
    std::vector<uint8_t> bytes(16384);
    uint32_t x = 1129900996;
    for (uint8_t &b : bytes) {
        x = Step(x);
        b = uint8_t(x >> 8);
    }
    std::vector<uint16_t> table(8192);
    for (int i = 0; i < 8192; ++i) table[i] = uint16_t(bytes[2 * i] | bytes[2 * i + 1] << 8);
    table[0] = 16384;
    return table;
}

}  // namespace

const uint16_t *DitherTable() {
    static const std::vector<uint16_t> table = Build();
    return table.data();
}

}  // namespace host_ref
