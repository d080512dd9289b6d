// The ordered-dither noise table: 8192 unsigned 16-bit values drawn from the
// minimal-standard generator x <- 16807 x mod (2^31 - 1), seeded 1129900996.
// Byte i of the table is bits 8..15 of the generator after step i + 1; the
// bytes are read as little-endian 16-bit values, and entry 0 is then set to
// 16384.  Built once, on first use from any thread, and never changed.
#pragma once

#include <cstdint>

namespace halideqk {

class DitheredNoiseTable {
public:
    static constexpr int kSize = 8192;
    static constexpr uint32_t kSeed = 1129900996u;

    static const uint16_t *GetNoiseTable();

    // One step of the generator, by Schrage's method (no 64-bit product).
    static constexpr int32_t Next(int32_t x) {
        constexpr int32_t a = 16807, m = 2147483647, q = 127773, r = 2836;
        const int32_t t = a * (x % q) - r * (x / q);
        return t < 0 ? t + m : t;
    }
};

// Where in the table the noise of a call starts: a fixed 64-bit constant,
// reduced modulo the table size and halved.
inline constexpr int64_t kDitherPhaseSource = 0x62A975A4038CFD4;
inline constexpr int kDitherPhase = int((kDitherPhaseSource % DitheredNoiseTable::kSize) >> 1);
static_assert(kDitherPhase == 2026);

}  // namespace halideqk
