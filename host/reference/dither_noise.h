// The host's dither noise: its own 8192-entry table, built from the
// generator, and the noise value of a destination position.
#pragma once

#include <cstdint>

namespace host_ref {

const uint16_t *DitherTable();

// Noise at column x, row y of the destination (both from 0): 16384 without
// dithering, else two table entries at row-dependent offsets, xor-ed, low 15 bits.
inline int DitherNoise(int x, int y, bool dither) {
    if (!dither) return 16384;
    constexpr int phase = 2026;
    const uint16_t *t = DitherTable();
    const int64_t a = (int64_t(phase) + x + 193 * int64_t(y)) % 8192;
    const int64_t b = (int64_t(phase) + x + 521 * int64_t(y) + 3647) % 8192;
    return (t[a] ^ t[b]) & 0x7FFF;
}

}  // namespace host_ref
