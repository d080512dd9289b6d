// The host's rounded arithmetic, written as the rational values it stands
// for: a * b / 255 and friends rounded to nearest.
#pragma once

#include <cstdint>

namespace host_ref {

// a * b / 255 rounded to nearest (never a tie).
inline int Mul255(int a, int b) { return (2 * a * b + 255) / 510; }

inline int Screen255(int a, int b) { return a + b - Mul255(a, b); }

// d + (b - d) * w / 255 rounded to nearest, symmetric about d.
inline int Interp255(int d, int b, int w) {
    return b >= d ? d + Mul255(b - d, w) : d - Mul255(d - b, w);
}

inline uint32_t Mul32768(uint32_t a, uint32_t b) { return (a * b + 16384) >> 15; }

// ((32768 - m) * d + b * m) / 32768, rounded.
inline uint16_t DeepMix(uint32_t d, uint32_t b, uint32_t m) {
    return uint16_t(((32768 - m) * d + b * m + 16384) >> 15);
}

// The host's soft-light tables, indexed by the destination value.
const uint8_t *DodgeDelta();
const uint8_t *BurnDelta();

}  // namespace host_ref
