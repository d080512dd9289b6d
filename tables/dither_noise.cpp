#include "tables/dither_noise.h"

#include <array>

namespace halideqk {

namespace {

struct NoiseTable {
    std::array<uint16_t, DitheredNoiseTable::kSize> values{};
    NoiseTable() {
        int32_t x = int32_t(DitheredNoiseTable::kSeed);
        for (int i = 0; i < DitheredNoiseTable::kSize; ++i) {
            x = DitheredNoiseTable::Next(x);
            const unsigned low = (unsigned(x) >> 8) & 0xFF;
            x = DitheredNoiseTable::Next(x);
            const unsigned high = (unsigned(x) >> 8) & 0xFF;
            values[i] = uint16_t(low | high << 8);
        }
        values[0] = 16384;
    }
};

}  // namespace

const uint16_t *DitheredNoiseTable::GetNoiseTable() {
    // A function-local static: the first caller builds it, any concurrent
    // first callers wait for that build, later calls only read.
    static const NoiseTable table;
    return table.values.data();
}

}  // namespace halideqk
